#pragma once

#include <QObject>
#include <QSet>
#include <QString>
#include <QStringList>

namespace Platform {
struct JournalEntry;
}

namespace Host {
class ModuleHost;
}

namespace Simulator {

// What must hold after every step, whatever the module was given: the soak checks these after
// each random step, and a replayed scenario can be checked the same way.
//   - the machine runs;
//   - exactly one view state is on screen (the innermost active view state is the framework's
//     active view);
//   - the popups on top are those that the journal reported shown and not hidden since, and each
//     is open (covered popups stay open);
//   - no "IncomingCall" or "WaitingCall" is open, on top or covered, while the phone reports no
//     incoming call;
//   - no timer of the module runs on past its countdown (the extended mode's minutes as the phone
//     gives them now);
//   - every driver-restricted window the module sets lies inside the contact list;
//   - the controller's isEmptyNumber agrees with the phone's entered number.
class Invariants : public QObject
{
    Q_OBJECT
public:
    explicit Invariants(Host::ModuleHost *host, QObject *parent = nullptr);
    ~Invariants() override;

    // The first invariant that does not hold now, or empty. `controller`: the controller as QML
    // sees it (null once deleted).
    QString check(QObject *controller);

private:
    void onJournalEntry(const Platform::JournalEntry &entry);

    Host::ModuleHost *m_host;
    QSet<QString> m_shownPopups; // as the journal reported them
    int m_pendingMinRow = 0;
    bool m_minRowSet = false;
    QStringList m_windowErrors;
    qint64 m_countdownChanged = 0; // when the phone last changed the extended mode's length
};

} // namespace Simulator
