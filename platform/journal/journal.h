#pragma once

#include <QList>
#include <QObject>
#include <QString>
#include <QVariantMap>

namespace Platform {

// One output of a module, as the host's frameworks and the data bridge saw it.
struct JournalEntry
{
    qint64 sequence = 0;
    QString kind; // "view", "popup-request", "bridge", ...
    QVariantMap fields; // the kind's own fields, e.g. {"id": "PHONE.IncomingCall"}
};

// The single, ordered record of everything a module asked of the platform: views shown and
// requested, popups requested, dismissed, shown and hidden, transients, back steps, intents,
// hard-key fall-backs, posted events and data-bridge commands. Tests and the simulator read it.
//
// Kinds and their fields:
//   view {id}                 a view state was entered and its view is on screen
//   view-request {id}         a view was requested directly from the view controller
//   popup-request {id}        popup-dismiss {id}      what a module asked
//   popup-shown {id}          popup-hidden {id}       what the framework did: the popup on top
//                                                     of its region changed
//   popup-closed {id}         a popup closed while covered by another
//   popup-dropped {id, reason} a popup request the framework could not honour
//   transient {name, value}   transient-hide {name}
//   back {steps}
//   intent {action, args}     hardkey {call}
//   event {name, value}       an event posted to the state machine, by whoever posted it
//   bridge {call, args}       a command or module-side setter of the data bridge,
//                             call as "<source>.<member>", e.g. "phone.acceptIncomingCall"
class Journal : public QObject
{
    Q_OBJECT
public:
    static Journal *instance();

    void append(const QString &kind, const QVariantMap &fields = {});

    const QList<JournalEntry> &entries() const { return m_entries; }
    // Entries appended after the one with the given sequence number.
    QList<JournalEntry> entriesSince(qint64 sequence) const;
    qint64 lastSequence() const { return m_sequence; }
    void clear();

signals:
    void appended(const Platform::JournalEntry &entry);

private:
    explicit Journal(QObject *parent = nullptr);

    QList<JournalEntry> m_entries;
    qint64 m_sequence = 0;
};

} // namespace Platform

Q_DECLARE_METATYPE(Platform::JournalEntry)
