#pragma once

#include <QDateTime>
#include <QList>
#include <QObject>
#include <QString>
#include <QVariantList>
#include <QVariantMap>

class QTimer;

namespace Platform {
struct JournalEntry;
}

namespace Simulator {

class VirtualEventDispatcher;

// One row of the bridge's call list, as both phones publish it: who, the call's state as the list
// has it ("incoming", "active", ...), and the seconds since it connected (`connectedAt` and `now`
// in ms; a negative `connectedAt`: not connected yet).
QVariantMap callListRow(const QString &name, const QString &number, const QString &state,
                        qint64 connectedAt, qint64 now);

// A plausible paired phone: it answers the module's bridge commands the way a phone does, later
// and through the bridge's values and signals (accepting a call connects it, ending it drops the
// status to 0, dialling goes through 3 to 7 after a second). It keeps a phone book, recent calls
// and text messages, and hands them to the head unit when asked, with the statuses in the order a
// phone reports them:
//   - contacts: 2 (downloading), then the list and its alphabet bar, then 1 (downloaded);
//     resetting the phone book's view keeps the list; deleting the contacts leaves 3 (empty);
//   - recent calls: 1 (a list to download); asked for it, 3 (downloading), then the list of the
//     type asked for and 2 (downloaded); a new call makes it 1 again;
//   - messages: 2 (running), then the inbox and its counts, then 3 (finished).
// Calls and text messages that come and go are added to its lists. The calls it has now (who,
// their state, how long they have been connected, ticking once a second) and its status alerts
// are in the bridge's call and alert lists. Its delays run on the virtual
// clock, and its times are those of a fixed morning moved on by the clock.
class SimulatedPhone : public QObject
{
    Q_OBJECT
public:
    // Who carries the calls and the texts that come in: the simulated phone itself, or a real
    // phone's stack behind the bridge (oFono), for which it keeps only its lists: contacts, recent
    // calls, the inbox, status alerts and the settings a hands-free link does not carry.
    enum CallCarrier { OwnCalls, RealPhoneCalls };

    explicit SimulatedPhone(VirtualEventDispatcher *clock = nullptr, QObject *parent = nullptr,
                            CallCarrier carrier = OwnCalls);
    ~SimulatedPhone() override;

    // A phone that is paired and connected, with its contacts and messages already downloaded
    // and its recent calls ready to download: the values a head unit has a while after the phone
    // connected.
    void connectPhone();

    // For a real phone's calls and texts: the contact with this number ("" when none has it), the
    // number of a row of the recent calls the head unit holds ("" when there is no such row), a
    // call to remember (1 missed, 2 received, 3 dialled) and a text that came in.
    QString contactName(const QString &number) const;
    QString recentCallNumber(int row) const;
    void logCall(const QString &name, const QString &number, int type);
    void receiveMessage(const QString &name, const QString &number, const QString &text);

    static constexpr int DialConnectDelay = 1000;
    static constexpr int ContactsDownloadDelay = 3000;
    static constexpr int RecentCallsDownloadDelay = 1500;
    static constexpr int MessagesDownloadDelay = 2000;
    static constexpr int SendMessageDelay = 1000;
    static constexpr int SearchDelay = 300;
    static constexpr int ContactCount = 48;
    static constexpr int RecentCallCount = 30;
    static constexpr int MessageCount = 24;
    // A phone keeps this many recent calls; the oldest go.
    static constexpr int RecentCallMemory = 50;

private:
    struct Entry
    {
        QString name; // empty: a number not in the contacts
        QString number;
        QDateTime time;
        int type = 0; // recent calls: 1 missed, 2 received, 3 dialled
        QString text; // text messages
        bool read = true;
    };

    void onJournalEntry(const Platform::JournalEntry &entry);
    void answer(const QString &call, const QVariantList &args);
    void dial(const QString &number);
    void callConnected();
    void callEnded();
    void onIncomingCallChanged(bool ringing);
    void onStatusChanged(int status);
    // The calls of now into the bridge's call list, and the second tick while one is connected.
    void publishCalls();
    // A call that connects puts the one in progress on hold.
    void holdActiveCalls();
    void swapCalls();
    void clearAlert(int alertId);
    void onNewTextMessage();
    void addMessage(Entry message);
    void logCall(const Entry &caller, int type);
    void downloadContacts();
    void contactsDownloaded();
    void deleteContacts();
    void downloadRecentCalls(int type);
    void downloadMessages();
    void messagesDownloaded();
    static QVariantList messageRows(const QList<Entry> &messages);
    void showMessage(int index, bool fromAlert);
    void later(int delay, void (SimulatedPhone::*reaction)());
    QDateTime now() const;
    Entry caller(int index) const;
    Entry whoHas(const QString &number) const;

    struct Call
    {
        Entry who;
        QString state; // as the call list has it: "incoming", "dialing", "active", ...
        qint64 connectedAt = -1; // virtual ms
    };

    VirtualEventDispatcher *m_clock;
    CallCarrier m_carrier;
    QTimer *m_dialTimer;
    QTimer *m_callClock;
    QList<Call> m_activeCalls; // in the order they began
    QList<Entry> m_contacts; // by name
    QList<Entry> m_calls; // newest first
    QList<Entry> m_messages; // newest first
    QList<Entry> m_downloadedCalls; // the list the head unit has, of the type it asked for
    QList<Entry> m_downloadedMessages; // the inbox the head unit has
    bool m_ringing = false;
    bool m_answered = false;
    int m_nextCaller = 0;
};

} // namespace Simulator
