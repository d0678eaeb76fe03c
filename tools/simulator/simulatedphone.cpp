#include "simulatedphone.h"

#include "virtualeventdispatcher.h"

#include <journal/journal.h>
#include <mavrosk/bridge.h>
#include <mavrosk/infinitelistmodel.h>
#include <mavrosk/multidplistmodel.h>

#include <QTimer>

#include <algorithm>
#include <iterator>

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
// States of a call in the bridge's call list.
const QString Incoming = QStringLiteral("incoming");
const QString Waiting = QStringLiteral("waiting");
const QString Dialing = QStringLiteral("dialing");
const QString Active = QStringLiteral("active");
const QString Held = QStringLiteral("held");
// Send status while a text message is on its way (2 sent, 0 and 1 failed, 3 network failure).
constexpr int SendingMessage = 4;
// Phone book status.
constexpr int ContactsDownloaded = 1;
constexpr int ContactsDownloading = 2;
constexpr int ContactsEmpty = 3;
// Recent-call list status.
constexpr int RecentCallsAvailable = 1;
constexpr int RecentCallsDownloaded = 2;
constexpr int RecentCallsDownloading = 3;
// Recent-call types; list type 0 is all of them.
constexpr int Missed = 1;
constexpr int Received = 2;
constexpr int Dialled = 3;
// Messages downloading status.
constexpr int MessagesRunning = 2;
constexpr int MessagesFinished = 3;

// The morning the phone's clock shows when the simulation starts.
QDateTime morning()
{
    return QDateTime(QDate(2024, 5, 14), QTime(9, 30), Qt::UTC);
}

const char *const FirstNames[]
        = {"Anna", "Ben",   "Clara", "David", "Emma", "Felix",  "Greta", "Hugo",
           "Ida",  "Jonas", "Karla", "Leon",  "Mila", "Noah",   "Olga",  "Paul",
           "Rosa", "Simon", "Tessa", "Uwe",   "Vera", "Walter", "Yara",  "Zoe"};
const char *const Surnames[] = {"Becker", "Fischer", "Hartmann", "Keller", "Lorenz",
                                "Meyer",  "Novak",   "Richter",  "Schulz", "Wagner"};
const char *const Texts[] = {"See you at eight?",
                             "Running ten minutes late, sorry.",
                             "Can you pick up bread on the way home?",
                             "Meeting moved to 3 pm.",
                             "Call me when you land.",
                             "Happy birthday!",
                             "The parcel arrived.",
                             "Where did you park?",
                             "Thanks for today.",
                             "Are we still on for Friday?",
                             "Dinner is ready.",
                             "Your table is booked for two."};
// The order in which calls of the history alternate.
constexpr int CallTypes[]
        = {Missed, Received, Dialled, Dialled, Received, Received, Missed, Dialled};
constexpr int ReplyCount = 3;
const char *const Replies[ReplyCount]
        = {"On my way.", "Can't talk now, I'm driving.", "I'll call you later."};

// The phone's status alerts when it connects: one that offers the support line (a number in the
// range kept for fiction) and one without.
constexpr int SupportAlert = 1003;
constexpr int PlainAlert = 1009;
const char *const SupportNumber = "+44 20 7946 0321";

// A number in the range kept for fiction, one per index.
QString fictionalNumber(int index)
{
    return QStringLiteral("+44 7700 900%1").arg((index * 19) % 1000, 3, 10, QLatin1Char('0'));
}

QString timeText(const QDateTime &time)
{
    return time.toString(QStringLiteral("yyyy-MM-dd hh:mm"));
}

} // namespace

QVariantMap callListRow(const QString &name, const QString &number, const QString &state,
                        qint64 connectedAt, qint64 now)
{
    return {{QStringLiteral("name"), name},
            {QStringLiteral("number"), number},
            {QStringLiteral("callState"), state},
            {QStringLiteral("duration"), connectedAt < 0 ? 0 : int((now - connectedAt) / 1000)}};
}

SimulatedPhone::SimulatedPhone(VirtualEventDispatcher *clock, QObject *parent, CallCarrier carrier)
    : QObject(parent)
    , m_clock(clock)
    , m_carrier(carrier)
    , m_dialTimer(new QTimer(this))
    , m_callClock(new QTimer(this))
{
    m_dialTimer->setSingleShot(true);
    m_dialTimer->setInterval(DialConnectDelay);
    connect(m_dialTimer, &QTimer::timeout, this, &SimulatedPhone::callConnected);
    m_callClock->setInterval(1000);
    connect(m_callClock, &QTimer::timeout, this, &SimulatedPhone::publishCalls);
    connect(Platform::Journal::instance(), &Platform::Journal::appended, this,
            &SimulatedPhone::onJournalEntry);
    if (carrier == OwnCalls) {
        connect(phone(), &Mavrosk::PhoneSource::statusChanged, this,
                &SimulatedPhone::onStatusChanged);
        // Calls and messages that come from the phone's side are remembered once they settled.
        connect(phone(), &Mavrosk::PhoneSource::incomingCallChanged, this, [this](bool ringing) {
            QTimer::singleShot(0, this, [this, ringing] { onIncomingCallChanged(ringing); });
        });
        connect(phone(), &Mavrosk::PhoneSource::newTextMessageAlert, this,
                [this] { QTimer::singleShot(0, this, &SimulatedPhone::onNewTextMessage); });
    }

    const int firstNames = int(std::size(FirstNames));
    for (int i = 0; i < ContactCount; ++i) {
        Entry contact;
        contact.name = QStringLiteral("%1 %2").arg(
                QLatin1String(FirstNames[i % firstNames]),
                QLatin1String(Surnames[(i / firstNames + i * 3) % int(std::size(Surnames))]));
        contact.number = fictionalNumber(i);
        m_contacts.append(contact);
    }
    std::sort(m_contacts.begin(), m_contacts.end(),
              [](const Entry &a, const Entry &b) { return a.name < b.name; });
    for (int i = 0; i < RecentCallCount; ++i) {
        // Every seventh call is from a number not in the contacts.
        Entry call = i % 7 == 6
                ? Entry{QString(), fictionalNumber(ContactCount + i), {}, 0, {}, true}
                : m_contacts.at((i * 5) % ContactCount);
        call.type = CallTypes[i % int(std::size(CallTypes))];
        call.time = morning().addSecs(-60LL * (i * 97 + 13));
        m_calls.append(call);
    }
    for (int i = 0; i < MessageCount; ++i) {
        Entry message = m_contacts.at((i * 7 + 3) % ContactCount);
        message.text = QLatin1String(Texts[i % int(std::size(Texts))]);
        message.time = morning().addSecs(-60LL * (i * 131 + 5));
        message.read = i >= 3;
        m_messages.append(message);
    }
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
    QVariantList replies;
    for (const char *reply : Replies)
        replies.append(QVariantMap{{QStringLiteral("text"), QLatin1String(reply)}});
    setPhone("smsReplyMessages", replies);
    setPhone("recentCallListStatus", RecentCallsAvailable);
    phone()->statusAlertList()->setRows(
            {QVariantMap{{QStringLiteral("alertId"), SupportAlert},
                         {QStringLiteral("supportPhoneNumber"), QLatin1String(SupportNumber)}},
             QVariantMap{{QStringLiteral("alertId"), PlainAlert},
                         {QStringLiteral("supportPhoneNumber"), QString()}}});
    contactsDownloaded();
    messagesDownloaded();
}

QDateTime SimulatedPhone::now() const
{
    return morning().addMSecs(m_clock ? m_clock->now() : 0);
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
    // A real phone's calls are its own: what they are and how they go is its to say.
    static const QStringList callCommands = {QStringLiteral("acceptIncomingCall"),
                                             QStringLiteral("rejectIncomingCall"),
                                             QStringLiteral("stopAcceptingAttempts"),
                                             QStringLiteral("endCall"),
                                             QStringLiteral("cancelRoamingCall"),
                                             QStringLiteral("dialNumber"),
                                             QStringLiteral("dialRecentCall"),
                                             QStringLiteral("joinCalls"),
                                             QStringLiteral("swapCall"),
                                             QStringLiteral("callForFixAlert"),
                                             QStringLiteral("initiateSendTextMessage")};
    if (m_carrier == RealPhoneCalls && callCommands.contains(command))
        return;

    if (command == QLatin1String("acceptIncomingCall")) {
        const bool second = p->callConnected();
        m_answered = true;
        holdActiveCalls();
        for (Call &ringing : m_activeCalls) {
            if (ringing.state == Incoming || ringing.state == Waiting) {
                ringing.state = Active;
                ringing.connectedAt = m_clock ? m_clock->now() : 0;
            }
        }
        publishCalls();
        logCall(caller(m_nextCaller), Received);
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
        // The row of the list the head unit shows, of the type it was downloaded with.
        dial(recentCallNumber(args.value(1).toInt()));
    } else if (command == QLatin1String("joinCalls")) {
        if (p->status() == TwoCalls)
            setPhone("status", TwoCallsJoined);
        for (Call &held : m_activeCalls) {
            if (held.state == Held)
                held.state = Active;
        }
        publishCalls();
    } else if (command == QLatin1String("swapCall")) {
        swapCalls();
    } else if (command == QLatin1String("toggleMuted")) {
        setPhone("muted", !p->muted());
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
    } else if (command == QLatin1String("deleteAllContacts")) {
        deleteContacts();
    } else if (command == QLatin1String("searchPhoneBook")) {
        QTimer::singleShot(SearchDelay, this, [] { emit phone()->phonebookSearchReady(); });
    } else if (command == QLatin1String("selectPhoneBookEntry")) {
        const int index = args.value(0).toInt();
        if (index >= 0 && index < p->phoneBook()->listLength())
            emit p->phonebookContactDetailsReady();
    } else if (command == QLatin1String("downloadRecentCallsList")) {
        // Without a type, the list of the type the head unit shows.
        downloadRecentCalls(args.isEmpty() ? p->currentRecentCallListType()
                                           : args.value(0).toInt());
    } else if (command == QLatin1String("requestTextMessagesInbox")
               || command == QLatin1String("retrySmsDownload")
               || command == QLatin1String("retryMessageProfileAccess")) {
        downloadMessages();
    } else if (command == QLatin1String("requestSelectedTextMessageDetails")) {
        showMessage(args.value(0).toInt(), false);
    } else if (command == QLatin1String("requestNewTextMessageDetails")) {
        showMessage(0, true);
    } else if (command == QLatin1String("clearAlertPermanently")
               || command == QLatin1String("clearAlertForThisCycle")) {
        clearAlert(args.value(0).toInt());
    } else if (command == QLatin1String("callForFixAlert")) {
        dial(args.value(1).toString());
    } else if (command == QLatin1String("initiateSendTextMessage")) {
        // A status of its own while the message goes, so that every send reports its outcome
        // as a change.
        setPhone("sendMessageStatus", SendingMessage);
        QTimer::singleShot(SendMessageDelay, this, [] { setPhone("sendMessageStatus", 2); });
    }
    // resetPhoneBook() puts the phone's view of its phone book back to the start of the list,
    // and exitingPhoneBook() closes it: the list itself stays as it is.
}

void SimulatedPhone::dial(const QString &number)
{
    if (number.isEmpty()) {
        // Nothing to dial: the phone refuses at once.
        emit phone()->phoneDialingFailed(1);
        return;
    }
    const Entry called = whoHas(number);
    logCall(called, Dialled);
    holdActiveCalls();
    m_activeCalls.append({called, Dialing});
    publishCalls();
    setPhone("dialingInProgress", true);
    setPhone("status", Dialling);
    m_dialTimer->start();
}

void SimulatedPhone::callConnected()
{
    for (Call &dialled : m_activeCalls) {
        if (dialled.state == Dialing) {
            dialled.state = Active;
            dialled.connectedAt = m_clock ? m_clock->now() : 0;
        }
    }
    publishCalls();
    setPhone("dialingInProgress", false);
    setPhone("callConnected", true);
    setPhone("status", OneCall);
}

void SimulatedPhone::callEnded()
{
    m_dialTimer->stop();
    m_activeCalls.clear();
    publishCalls();
    setPhone("muted", false);
    setPhone("dialingInProgress", false);
    setPhone("incomingCall", false);
    setPhone("multipleCallsConnected", false);
    setPhone("callConnected", false);
    setPhone("status", NoCall);
}

void SimulatedPhone::onIncomingCallChanged(bool ringing)
{
    if (ringing == m_ringing || ringing != phone()->incomingCall())
        return;
    m_ringing = ringing;
    if (ringing) {
        m_answered = false;
        m_activeCalls.append({caller(m_nextCaller), phone()->callConnected() ? Waiting : Incoming});
        publishCalls();
        return;
    }
    // Answered or not, the call rings no longer.
    m_activeCalls.erase(std::remove_if(m_activeCalls.begin(), m_activeCalls.end(),
                                       [](const Call &call) {
                                           return call.state == Incoming || call.state == Waiting;
                                       }),
                        m_activeCalls.end());
    publishCalls();
    // The ringing stopped without an answer: a missed call, from the one who rang.
    if (!m_answered)
        logCall(caller(m_nextCaller), Missed);
    ++m_nextCaller;
}

SimulatedPhone::Entry SimulatedPhone::caller(int index) const
{
    return m_contacts.at((index * 11 + 2) % m_contacts.size());
}

QString SimulatedPhone::contactName(const QString &number) const
{
    return whoHas(number).name;
}

QString SimulatedPhone::recentCallNumber(int row) const
{
    return row >= 0 && row < m_downloadedCalls.size() ? m_downloadedCalls.at(row).number
                                                      : QString();
}

void SimulatedPhone::logCall(const QString &name, const QString &number, int type)
{
    logCall(Entry{name, number, {}, 0, {}, true}, type);
}

SimulatedPhone::Entry SimulatedPhone::whoHas(const QString &number) const
{
    for (const Entry &contact : m_contacts) {
        if (contact.number == number)
            return contact;
    }
    return Entry{QString(), number, {}, 0, {}, true};
}

void SimulatedPhone::onStatusChanged(int status)
{
    // No call in progress any more (the phone's side may say so directly): only a call that
    // rings is left.
    if (status > 2 || m_activeCalls.isEmpty())
        return;
    m_activeCalls.erase(std::remove_if(m_activeCalls.begin(), m_activeCalls.end(),
                                       [](const Call &call) {
                                           return call.state != Incoming && call.state != Waiting;
                                       }),
                        m_activeCalls.end());
    publishCalls();
    setPhone("muted", false);
}

void SimulatedPhone::publishCalls()
{
    const qint64 now = m_clock ? m_clock->now() : 0;
    QVariantList rows;
    bool connected = false;
    for (const Call &call : qAsConst(m_activeCalls)) {
        connected = connected || call.connectedAt >= 0;
        rows.append(callListRow(call.who.name, call.who.number, call.state, call.connectedAt, now));
    }
    phone()->callList()->setRows(rows);
    if (!connected)
        m_callClock->stop();
    else if (!m_callClock->isActive())
        m_callClock->start();
}

void SimulatedPhone::holdActiveCalls()
{
    for (Call &call : m_activeCalls) {
        if (call.state == Active)
            call.state = Held;
    }
}

void SimulatedPhone::swapCalls()
{
    for (Call &call : m_activeCalls) {
        if (call.state == Active)
            call.state = Held;
        else if (call.state == Held)
            call.state = Active;
    }
    publishCalls();
}

void SimulatedPhone::clearAlert(int alertId)
{
    QVariantList rows;
    Mavrosk::MultiDPListModel *alerts = phone()->statusAlertList();
    for (int row = 0; row < alerts->count(); ++row) {
        if (alerts->get(row, QStringLiteral("alertId")).toInt() != alertId)
            rows.append(QVariantMap{
                    {QStringLiteral("alertId"), alerts->get(row, QStringLiteral("alertId"))},
                    {QStringLiteral("supportPhoneNumber"),
                     alerts->get(row, QStringLiteral("supportPhoneNumber"))}});
    }
    if (rows.size() != alerts->count())
        alerts->setRows(rows);
}

void SimulatedPhone::logCall(const Entry &caller, int type)
{
    Entry call = caller;
    call.type = type;
    call.time = now();
    m_calls.prepend(call);
    while (m_calls.size() > RecentCallMemory)
        m_calls.removeLast();
    // The list changed: the head unit may download it again.
    if (phone()->recentCallListStatus() == RecentCallsDownloaded)
        setPhone("recentCallListStatus", RecentCallsAvailable);
}

void SimulatedPhone::onNewTextMessage()
{
    // The text the phone's side gave the message, unless it is the last one the phone showed.
    const QString body = phone()->textMessageBody();
    Entry message = m_contacts.at((m_messages.size() * 7 + 3) % m_contacts.size());
    message.text = !body.isEmpty() && (m_messages.isEmpty() || body != m_messages.first().text)
            ? body
            : QLatin1String(Texts[m_messages.size() % int(std::size(Texts))]);
    addMessage(message);
}

void SimulatedPhone::receiveMessage(const QString &name, const QString &number, const QString &text)
{
    addMessage(Entry{name, number, {}, 0, text, false});
}

void SimulatedPhone::addMessage(Entry message)
{
    message.time = now();
    message.read = false;
    m_messages.prepend(message);
    setPhone("textMessageSenderName", message.name);
    setPhone("textMessageSenderNumber", message.number);
    setPhone("messagesInboxEmptyStatus", false);
    setPhone("smsTotalCount", m_messages.size());
    setPhone("totalUnreadSmsCount", phone()->totalUnreadSmsCount() + 1);
}

void SimulatedPhone::showMessage(int index, bool fromAlert)
{
    // A selection is a row of the inbox the head unit holds; an alert is the newest message.
    if (fromAlert) {
        const Entry newest = m_messages.value(0);
        setPhone("textMessageSenderName", newest.name);
        setPhone("textMessageSenderNumber", newest.number);
        setPhone("textMessageBody", newest.text);
        emit phone()->newTextMessageDetailsReady();
        return;
    }
    if (index < 0 || index >= m_downloadedMessages.size())
        return;
    Entry &shown = m_downloadedMessages[index];
    if (!shown.read) {
        // Opened on the head unit, the message is read on the phone too.
        for (Entry &message : m_messages) {
            if (message.time == shown.time && message.number == shown.number)
                message.read = true;
        }
        shown.read = true;
        phone()->textMessageList()->setRows(messageRows(m_downloadedMessages));
        setPhone("totalUnreadSmsCount", qMax(0, phone()->totalUnreadSmsCount() - 1));
    }
    setPhone("textMessageSenderName", shown.name);
    setPhone("textMessageSenderNumber", shown.number);
    setPhone("textMessageBody", shown.text);
    emit phone()->textMessageDetailsReady();
}

void SimulatedPhone::downloadContacts()
{
    setPhone("phoneBookStatus", ContactsDownloading);
    later(ContactsDownloadDelay, &SimulatedPhone::contactsDownloaded);
}

void SimulatedPhone::contactsDownloaded()
{
    QVariantList rows;
    for (const Entry &contact : qAsConst(m_contacts))
        rows.append(QVariantMap{{QStringLiteral("name"), contact.name},
                                {QStringLiteral("number"), contact.number}});
    // One entry per letter; a letter without contacts starts at no row.
    QVariantList letters;
    for (char letter = 'A'; letter <= 'Z'; ++letter) {
        int start = -1;
        for (int row = 0; row < m_contacts.size() && start < 0; ++row) {
            if (m_contacts.at(row).name.startsWith(QLatin1Char(letter)))
                start = row;
        }
        letters.append(QVariantMap{{QStringLiteral("alphabet"), QString(QLatin1Char(letter))},
                                   {QStringLiteral("letterIndex"), start}});
    }
    phone()->AlphabetIndexModel()->setRows(letters);
    phone()->phoneBook()->setRows(rows);
    phone()->phoneBook()->setListLength(rows.size());
    setPhone("phoneBookStatus", ContactsDownloaded);
}

void SimulatedPhone::deleteContacts()
{
    // The head unit's copy goes; the phone keeps its own until it is downloaded again.
    phone()->phoneBook()->setRows({});
    phone()->phoneBook()->setListLength(0);
    phone()->AlphabetIndexModel()->setRows({});
    setPhone("phoneBookStatus", ContactsEmpty);
}

void SimulatedPhone::downloadRecentCalls(int type)
{
    setPhone("recentCallListStatus", RecentCallsDownloading);
    QTimer::singleShot(RecentCallsDownloadDelay, this, [this, type] {
        m_downloadedCalls.clear();
        QVariantList rows;
        for (const Entry &call : qAsConst(m_calls)) {
            if (type != 0 && call.type != type)
                continue;
            m_downloadedCalls.append(call);
            rows.append(QVariantMap{{QStringLiteral("name"), call.name},
                                    {QStringLiteral("number"), call.number},
                                    {QStringLiteral("type"), call.type},
                                    {QStringLiteral("time"), timeText(call.time)}});
        }
        phone()->recentCallList()->setRows(rows);
        setPhone("recentCallListStatus", RecentCallsDownloaded);
    });
}

void SimulatedPhone::downloadMessages()
{
    setPhone("messagesDownloadingStatus", MessagesRunning);
    later(MessagesDownloadDelay, &SimulatedPhone::messagesDownloaded);
}

QVariantList SimulatedPhone::messageRows(const QList<Entry> &messages)
{
    QVariantList rows;
    for (const Entry &message : messages)
        rows.append(QVariantMap{{QStringLiteral("name"), message.name},
                                {QStringLiteral("number"), message.number},
                                {QStringLiteral("time"), timeText(message.time)},
                                {QStringLiteral("text"), message.text},
                                {QStringLiteral("read"), message.read}});
    return rows;
}

void SimulatedPhone::messagesDownloaded()
{
    m_downloadedMessages = m_messages;
    const int unread = int(std::count_if(m_messages.begin(), m_messages.end(),
                                         [](const Entry &message) { return !message.read; }));
    phone()->textMessageList()->setRows(messageRows(m_messages));
    setPhone("messagesInboxEmptyStatus", m_messages.isEmpty());
    setPhone("smsTotalCount", m_messages.size());
    setPhone("totalUnreadSmsCount", unread);
    setPhone("messagesDownloadingStatus", MessagesFinished);
}

} // namespace Simulator
