#include "simulatedphone.h"

#include <journal/journal.h>
#include <mavrosk/bridge.h>
#include <mavrosk/infinitelistmodel.h>
#include <mavrosk/multidplistmodel.h>

#include <QTimer>

namespace Simulator {

namespace {

Mavrosk::PhoneSource *phone()
{
    return Mavrosk::PhoneSource::instance();
}

void setPhone(const char *name, const QVariant &value)
{
    phone()->setBridgeValue(QLatin1String(name), value);
}

// Status values of the phone's call.
constexpr int NoCall = 0;
constexpr int Dialling = 3;
constexpr int OneCall = 7;
constexpr int TwoCalls = 9;
constexpr int TwoCallsJoined = 10;
// Send status while a text message is on its way (2 sent, 0 and 1 failed, 3 network failure).
constexpr int SendingMessage = 4;

} // namespace

SimulatedPhone::SimulatedPhone(QObject *parent)
    : QObject(parent)
    , m_dialTimer(new QTimer(this))
{
    m_dialTimer->setSingleShot(true);
    m_dialTimer->setInterval(DialConnectDelay);
    connect(m_dialTimer, &QTimer::timeout, this, &SimulatedPhone::callConnected);
    connect(Platform::Journal::instance(), &Platform::Journal::appended, this,
            &SimulatedPhone::onJournalEntry);
}

SimulatedPhone::~SimulatedPhone() = default;

void SimulatedPhone::connectPhone()
{
    auto *bluetooth = Mavrosk::BluetoothSource::instance();
    bluetooth->setBridgeValue(QStringLiteral("deviceListCount"), 1);
    bluetooth->setBridgeValue(QStringLiteral("selectedDevice"), 0);
    bluetooth->setBridgeValue(QStringLiteral("phoneDevice"), 0);
    bluetooth->setBridgeValue(QStringLiteral("deviceConnected"), true);
    setPhone("deviceBatteryLevel", 4);
    setPhone("messageAccessProfileStatus", true);
    setPhone("smsMessageAccessProfileAvailable", true);
    setPhone("messageNotificationEnabled", true);
    // The phone has answered the request for message access, and its messages are in memory.
    setPhone("smsPhoneDeclinedAccessStatus", true);
    setPhone("messagesInMemoryStatus", true);
    setPhone("recentCallListStatus", 1);
    contactsDownloaded();
    setPhone("messagesInboxEmptyStatus", false);
    setPhone("smsTotalCount", 3);
    setPhone("messagesDownloadingStatus", 3);
}

void SimulatedPhone::onJournalEntry(const Platform::JournalEntry &entry)
{
    if (entry.kind != QLatin1String("bridge"))
        return;
    const QString call = entry.fields.value(QStringLiteral("call")).toString();
    const QVariantList args = entry.fields.value(QStringLiteral("args")).toList();
    // The phone answers after the command returns, as the real bridge does.
    QTimer::singleShot(0, this, [this, call, args] { answer(call, args); });
}

void SimulatedPhone::later(int delay, void (SimulatedPhone::*reaction)())
{
    QTimer::singleShot(delay, this, reaction);
}

void SimulatedPhone::answer(const QString &call, const QVariantList &args)
{
    auto *p = phone();
    const QString command = call.section(QLatin1Char('.'), 1);
    if (call.startsWith(QLatin1String("speech."))) {
        if (command == QLatin1String("cancelVRSession"))
            Mavrosk::SpeechSource::instance()->setBridgeValue(QStringLiteral("sessionState"), 0);
        return;
    }
    if (!call.startsWith(QLatin1String("phone.")))
        return;

    if (command == QLatin1String("acceptIncomingCall")) {
        const bool second = p->callConnected();
        setPhone("incomingCall", false);
        setPhone("callConnected", true);
        setPhone("multipleCallsConnected", second);
        setPhone("status", second ? TwoCalls : OneCall);
    } else if (command == QLatin1String("rejectIncomingCall")
               || command == QLatin1String("stopAcceptingAttempts")) {
        setPhone("incomingCall", false);
        if (!p->callConnected())
            setPhone("status", NoCall);
    } else if (command == QLatin1String("endCall")
               || command == QLatin1String("cancelRoamingCall")) {
        callEnded();
    } else if (command == QLatin1String("dialNumber")) {
        dial(args.value(0).toString());
    } else if (command == QLatin1String("dialRecentCall")) {
        dial(QStringLiteral("recent"));
    } else if (command == QLatin1String("joinCalls")) {
        if (p->status() == TwoCalls)
            setPhone("status", TwoCallsJoined);
    } else if (command == QLatin1String("togglePrivacyMode")) {
        setPhone("privateMode", !p->privateMode());
    } else if (command == QLatin1String("enableDoNotDisturb")
               || command == QLatin1String("disableDoNotDisturb")) {
        setPhone("doNotDisturb", command == QLatin1String("enableDoNotDisturb"));
    } else if (command == QLatin1String("toggleSiriActivation")) {
        setPhone("siriActive", args.value(0).toBool());
    } else if (command == QLatin1String("togglePhoneVoiceServiceActivation")) {
        setPhone("phoneVoiceServiceActive", args.value(0).toBool());
    } else if (command == QLatin1String("retryPhoneBookDownload")
               || command == QLatin1String("retryPhnBookDownloadAccess")
               || command == QLatin1String("reDownloadContacts")) {
        downloadContacts();
    } else if (command == QLatin1String("resetPhoneBook")
               || command == QLatin1String("deleteAllContacts")) {
        p->phoneBook()->setListLength(0);
        p->AlphabetIndexModel()->setRows({});
        setPhone("phoneBookStatus", 3);
    } else if (command == QLatin1String("downloadRecentCallsList")) {
        setPhone("recentCallListStatus", 3);
        QTimer::singleShot(RecentCallsDownloadDelay, this,
                           [] { setPhone("recentCallListStatus", 1); });
    } else if (command == QLatin1String("requestTextMessagesInbox")
               || command == QLatin1String("retrySmsDownload")
               || command == QLatin1String("retryMessageProfileAccess")) {
        downloadMessages();
    } else if (command == QLatin1String("initiateSendTextMessage")) {
        // A status of its own while the message goes, so that every send reports its outcome
        // as a change.
        setPhone("sendMessageStatus", SendingMessage);
        QTimer::singleShot(SendMessageDelay, this, [] { setPhone("sendMessageStatus", 2); });
    }
}

void SimulatedPhone::dial(const QString &number)
{
    if (number.isEmpty()) {
        // Nothing to dial: the phone refuses at once.
        emit phone()->phoneDialingFailed(1);
        return;
    }
    setPhone("dialingInProgress", true);
    setPhone("status", Dialling);
    m_dialTimer->start();
}

void SimulatedPhone::callConnected()
{
    setPhone("dialingInProgress", false);
    setPhone("callConnected", true);
    setPhone("status", OneCall);
}

void SimulatedPhone::callEnded()
{
    m_dialTimer->stop();
    setPhone("dialingInProgress", false);
    setPhone("incomingCall", false);
    setPhone("multipleCallsConnected", false);
    setPhone("callConnected", false);
    setPhone("status", NoCall);
}

void SimulatedPhone::downloadContacts()
{
    setPhone("phoneBookStatus", 2);
    later(ContactsDownloadDelay, &SimulatedPhone::contactsDownloaded);
}

void SimulatedPhone::contactsDownloaded()
{
    QVariantList letters;
    const int perLetter = ContactCount / 20;
    for (int i = 0; i < 20; ++i)
        letters.append(QVariantMap{{QStringLiteral("alphabet"), QString(QLatin1Char('A' + i))},
                                   {QStringLiteral("letterIndex"), i * perLetter}});
    phone()->AlphabetIndexModel()->setRows(letters);
    phone()->phoneBook()->setListLength(ContactCount);
    setPhone("phoneBookStatus", 1);
}

void SimulatedPhone::downloadMessages()
{
    setPhone("messagesDownloadingStatus", 2);
    QTimer::singleShot(MessagesDownloadDelay, this, [] {
        setPhone("messagesInboxEmptyStatus", false);
        setPhone("smsTotalCount", 3);
        setPhone("messagesDownloadingStatus", 3);
    });
}

} // namespace Simulator
