#pragma once

#include <QObject>
#include <QString>
#include <QVariantList>

class QTimer;

namespace Platform {
struct JournalEntry;
}

namespace Simulator {

// A plausible paired phone: it answers the module's bridge commands the way a phone does, later
// and through the bridge's values and signals (accepting a call connects it, ending it drops the
// status to 0, dialling goes through 3 to 7 after a second, contacts, recent calls and messages
// download after a delay). Its delays run on the virtual clock.
class SimulatedPhone : public QObject
{
    Q_OBJECT
public:
    explicit SimulatedPhone(QObject *parent = nullptr);
    ~SimulatedPhone() override;

    // A phone that is paired and connected, with its contacts, recent calls and messages already
    // downloaded: the values a head unit has a while after the phone connected.
    void connectPhone();

    static constexpr int DialConnectDelay = 1000;
    static constexpr int ContactsDownloadDelay = 3000;
    static constexpr int RecentCallsDownloadDelay = 1500;
    static constexpr int MessagesDownloadDelay = 2000;
    static constexpr int SendMessageDelay = 1000;
    static constexpr int ContactCount = 120;

private:
    void onJournalEntry(const Platform::JournalEntry &entry);
    void answer(const QString &call, const QVariantList &args);
    void dial(const QString &number);
    void callConnected();
    void callEnded();
    void downloadContacts();
    void contactsDownloaded();
    void downloadMessages();
    void later(int delay, void (SimulatedPhone::*reaction)());

    QTimer *m_dialTimer;
};

} // namespace Simulator
