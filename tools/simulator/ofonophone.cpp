#include "ofonophone.h"

#include "simulatedphone.h"

#include <journal/journal.h>
#include <mavrosk/bridge.h>
#include <mavrosk/multidplistmodel.h>

#include <QDBusArgument>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusObjectPath>
#include <QDBusPendingCallWatcher>
#include <QDBusServiceWatcher>
#include <QDBusVariant>
#include <QDateTime>
#include <QLoggingCategory>
#include <QTimer>

#include <algorithm>

Q_LOGGING_CATEGORY(ofonoLog, "orvane.mavrosk.ofono")

namespace Simulator {

namespace {

const QString Service = QStringLiteral("org.ofono");
const QString ManagerInterface = QStringLiteral("org.ofono.Manager");
const QString ModemInterface = QStringLiteral("org.ofono.Modem");
const QString CallManagerInterface = QStringLiteral("org.ofono.VoiceCallManager");
const QString CallInterface = QStringLiteral("org.ofono.VoiceCall");
const QString NetworkInterface = QStringLiteral("org.ofono.NetworkRegistration");
const QString MessagesInterface = QStringLiteral("org.ofono.MessageManager");
const QString HandsfreeInterface = QStringLiteral("org.ofono.Handsfree");
// The connection of the bridge's own, apart from any the host has.
const QString ConnectionName = QStringLiteral("orvane.mavrosk.ofono");
// A bus that is not there yet is tried again this often.
constexpr int BusRetryInterval = 5000;

// --- The mapping -------------------------------------------------------------------------------

// What a call in an oFono State is to the bridge.
enum class CallRole { Ringing, Dialling, Connected, Gone };

struct CallStateMapping
{
    const char *ofono; // VoiceCall State
    const char *callList; // the bridge's call list "callState"
    CallRole role;
    const char *bridge;
};

const CallStateMapping CallStates[] = {
        {"incoming", "incoming", CallRole::Ringing,
         "`incomingCall` true; `status` stays as it is (0 with no other call)"},
        {"waiting", "waiting", CallRole::Ringing,
         "`incomingCall` true beside a connected call (the module's waiting call)"},
        {"dialing", "dialing", CallRole::Dialling,
         "`dialingInProgress` true; `status` 3, or 4 beside a connected call"},
        {"alerting", "dialing", CallRole::Dialling, "as \"dialing\": the far end rings"},
        {"active", "active", CallRole::Connected,
         "`callConnected` true; `status` 7 with one connected call, 9 with two "
         "(`multipleCallsConnected` true), 10 when they are one multiparty call"},
        {"held", "held", CallRole::Connected, "counts as connected, as \"active\""},
        {"disconnected", "", CallRole::Gone,
         "no longer counted; with no call left `status` 0 and every call value false"},
};

const CallStateMapping *callStateMapping(const QString &state)
{
    for (const CallStateMapping &mapping : CallStates) {
        if (state == QLatin1String(mapping.ofono))
            return &mapping;
    }
    return nullptr;
}

// The rest of what oFono tells the bridge.
struct ValueMapping
{
    const char *ofono;
    const char *bridge;
};

const ValueMapping Values[] = {
        {"`VoiceCall` `LineIdentification`", "the call list's \"number\""},
        {"`VoiceCall` `Name`",
         "the call list's \"name\"; when empty, the name of the contact with that number"},
        {"`VoiceCall` `Multiparty`", "`status` 10 when every connected call has it"},
        {"a ringing call removed without an answer",
         "`missedCallsPresent()` (unless the head unit rejected it); the recent calls get a missed "
         "call"},
        {"a call removed", "the recent calls get it as missed, received or dialled"},
        {"`NetworkRegistration` `Status` \"roaming\"",
         "`roaming` true and `phoneRoamingModeReceived()` when roaming begins; any other status: "
         "`roaming` false"},
        {"`Modem` `Powered` and `Online` (and, for a hands-free modem of `Type` \"hfp\", its "
         "`org.ofono.Handsfree` interface)",
         "`BluetoothSource` `deviceConnected` (with `phoneDevice`, `selectedDevice` 0 and "
         "`deviceListCount` 1); oFono or the modem gone: false"},
        {"the modem followed gone (oFono left, the modem removed, no longer powered or online)",
         "`nonUserDeviceDisconnectReceived()`, then `deviceConnected` false, then the calls end"},
        {"`Handsfree` `BatteryChargeLevel` (0 to 5)", "`deviceBatteryLevel`, the same number"},
        {"`MessageManager` `IncomingMessage` (text, `Sender`)",
         "`textMessageSenderNumber`, `textMessageSenderName` (the contact's name), "
         "`textMessageBody`, the text added to the inbox, then `newTextMessageAlert()`"},
};

// The situations in which a command of the bridge becomes one oFono method or another.
enum class Situation { Always, CallIncoming, WaitingBesideOne, WaitingBesideTwo, CallRinging };
// The object a command goes to.
enum class Target { RingingCall, CurrentCall, Modem };
// What the method is given.
enum class Argument { None, Number, RecentCallRow, SupportNumber, Tone, Reply };
// How the bridge says a command failed (a D-Bus error or no answer in time).
enum class Failure { Logged, DialingFailed, AcceptingFailed, SendingFailed };

struct CommandMapping
{
    const char *bridge; // the PhoneSource command
    Situation when;
    Target target;
    const char *interface;
    const char *method;
    Argument argument;
    Failure failure;
};

// The first row of a command whose situation holds is the one sent.
const CommandMapping Commands[] = {
        {"acceptIncomingCall", Situation::CallIncoming, Target::RingingCall, "VoiceCall", "Answer",
         Argument::None, Failure::AcceptingFailed},
        {"acceptIncomingCall", Situation::WaitingBesideOne, Target::Modem, "VoiceCallManager",
         "HoldAndAnswer", Argument::None, Failure::AcceptingFailed},
        {"acceptIncomingCall", Situation::WaitingBesideTwo, Target::Modem, "VoiceCallManager",
         "ReleaseAndAnswer", Argument::None, Failure::AcceptingFailed},
        {"rejectIncomingCall", Situation::CallRinging, Target::RingingCall, "VoiceCall", "Hangup",
         Argument::None, Failure::Logged},
        {"stopAcceptingAttempts", Situation::CallRinging, Target::RingingCall, "VoiceCall",
         "Hangup", Argument::None, Failure::Logged},
        {"endCall", Situation::Always, Target::CurrentCall, "VoiceCall", "Hangup", Argument::None,
         Failure::Logged},
        {"cancelRoamingCall", Situation::Always, Target::CurrentCall, "VoiceCall", "Hangup",
         Argument::None, Failure::Logged},
        {"dialNumber", Situation::Always, Target::Modem, "VoiceCallManager", "Dial",
         Argument::Number, Failure::DialingFailed},
        {"dialRecentCall", Situation::Always, Target::Modem, "VoiceCallManager", "Dial",
         Argument::RecentCallRow, Failure::DialingFailed},
        {"callForFixAlert", Situation::Always, Target::Modem, "VoiceCallManager", "Dial",
         Argument::SupportNumber, Failure::DialingFailed},
        {"swapCall", Situation::Always, Target::Modem, "VoiceCallManager", "SwapCalls",
         Argument::None, Failure::Logged},
        {"joinCalls", Situation::Always, Target::Modem, "VoiceCallManager", "CreateMultiparty",
         Argument::None, Failure::Logged},
        {"dialPadKeyTonePressed", Situation::Always, Target::Modem, "VoiceCallManager", "SendTones",
         Argument::Tone, Failure::Logged},
        {"initiateSendTextMessage", Situation::Always, Target::Modem, "MessageManager",
         "SendMessage", Argument::Reply, Failure::SendingFailed},
};

const char *situationText(Situation situation)
{
    switch (situation) {
    case Situation::CallIncoming:
        return "a call is \"incoming\"";
    case Situation::WaitingBesideOne:
        return "a call is \"waiting\" beside one connected call";
    case Situation::WaitingBesideTwo:
        return "a call is \"waiting\" beside two connected calls";
    case Situation::CallRinging:
        return "a call rings";
    case Situation::Always:
        break;
    }
    return "always";
}

const char *targetText(Target target)
{
    switch (target) {
    case Target::RingingCall:
        return "the ringing call's ";
    case Target::CurrentCall:
        return "the active call's (else the one being dialled, else the held one) ";
    case Target::Modem:
        break;
    }
    return "";
}

const char *argumentText(Argument argument)
{
    switch (argument) {
    case Argument::Number:
        return "(the number, \"\")";
    case Argument::RecentCallRow:
        return "(the number of that row of the recent calls, \"\")";
    case Argument::SupportNumber:
        return "(the alert's support number, \"\")";
    case Argument::Tone:
        return "(the key's character)";
    case Argument::Reply:
        return "(`textMessageSenderNumber`, `replyTextSelected`)";
    case Argument::None:
        break;
    }
    return "";
}

const char *failureText(Failure failure)
{
    switch (failure) {
    case Failure::DialingFailed:
        return "`phoneDialingFailed(0)` without a network, else `phoneDialingFailed(1)`";
    case Failure::AcceptingFailed:
        return "`phoneCallAcceptingFailed()`";
    case Failure::SendingFailed:
        return "`sendMessageStatus` 3 without a network, else 1 (it is 4 while the text goes, 2 "
               "once sent)";
    case Failure::Logged:
        break;
    }
    return "a warning";
}

// What the bridge has and oFono does not carry: the simulated phone keeps it.
const ValueMapping Kept[] = {
        {"contacts (`phoneBook`, `AlphabetIndexModel`, `phoneBookStatus`)",
         "oFono has no phone book (a phone gives it over PBAP, not hands-free)"},
        {"recent calls (`recentCallList`, `recentCallListStatus`)",
         "the simulated list, with the real calls added as they end"},
        {"the inbox (`textMessageList`, counts, downloads, message access)",
         "oFono passes texts as they come, it keeps no inbox; texts that come in are added"},
        {"`statusAlertList`, `smsReplyMessages`", "the head unit's own"},
        {"`muted`, `privateMode`, `doNotDisturb`, `siriActive`, `phoneVoiceServiceActive`, "
         "the ringtone and the other settings",
         "the simulated phone answers their commands as before"},
};

// oFono's statuses in which no network carries a call or a text.
bool withoutNetwork(const QString &status)
{
    return status == QLatin1String("unregistered") || status == QLatin1String("searching")
            || status == QLatin1String("denied");
}

Mavrosk::PhoneSource *phone()
{
    return Mavrosk::PhoneSource::instance();
}

void setPhone(const char *name, const QVariant &value)
{
    phone()->setBridgeValue(QLatin1String(name), value);
}

// An a(oa{sv}) reply: each object's path and properties.
using ObjectsWithProperties = QList<QPair<QDBusObjectPath, QVariantMap>>;

ObjectsWithProperties objectsOf(const QDBusMessage &reply)
{
    return qdbus_cast<ObjectsWithProperties>(reply.arguments().value(0));
}

QVariantMap propertiesOf(const QDBusMessage &reply)
{
    return qdbus_cast<QVariantMap>(reply.arguments().value(0));
}

qint64 nowMs()
{
    return QDateTime::currentMSecsSinceEpoch();
}

} // namespace

OfonoPhone::OfonoPhone(const QString &busAddress, SimulatedPhone *lists, QObject *parent)
    : QObject(parent)
    , m_busAddress(busAddress)
    , m_bus(ConnectionName)
    , m_lists(lists)
    , m_retry(new QTimer(this))
    , m_callClock(new QTimer(this))
{
    m_retry->setSingleShot(true);
    m_retry->setInterval(BusRetryInterval);
    connect(m_retry, &QTimer::timeout, this, &OfonoPhone::connectToBus);
    m_callClock->setInterval(1000);
    connect(m_callClock, &QTimer::timeout, this, &OfonoPhone::publishCalls);
    connect(Platform::Journal::instance(), &Platform::Journal::appended, this,
            &OfonoPhone::onJournalEntry);
}

OfonoPhone::~OfonoPhone()
{
    // The calls still waiting for an answer and the service watcher go while their connection
    // is there: torn down after it, they raced the connection's own ending and corrupted the heap
    // now and then.
    qDeleteAll(findChildren<QDBusPendingCallWatcher *>(QString(), Qt::FindDirectChildrenOnly));
    delete m_watcher;
    QDBusConnection::disconnectFromBus(ConnectionName);
}

void OfonoPhone::start()
{
    // No phone until oFono shows one.
    setConnected(false, QStringLiteral("looking for oFono"));
    connectToBus();
}

void OfonoPhone::connectToBus()
{
    QDBusConnection::disconnectFromBus(ConnectionName);
    m_bus = m_busAddress.isEmpty()
            ? QDBusConnection::connectToBus(QDBusConnection::SystemBus, ConnectionName)
            : QDBusConnection::connectToBus(m_busAddress, ConnectionName);
    if (!m_bus.isConnected()) {
        const QString why = QStringLiteral("cannot reach %1 (%2); trying again every %3 s")
                                    .arg(m_busAddress.isEmpty() ? QStringLiteral("the system bus")
                                                                : m_busAddress,
                                         m_bus.lastError().message())
                                    .arg(BusRetryInterval / 1000);
        // Said once, not at every try.
        if (why != m_busProblem)
            qCWarning(ofonoLog).noquote() << why;
        m_busProblem = why;
        setConnected(false, why);
        m_retry->start();
        return;
    }
    m_busProblem.clear();

    delete m_watcher;
    m_watcher = new QDBusServiceWatcher(Service, m_bus,
                                        QDBusServiceWatcher::WatchForRegistration
                                                | QDBusServiceWatcher::WatchForUnregistration,
                                        this);
    connect(m_watcher, &QDBusServiceWatcher::serviceRegistered, this, [this] {
        qCInfo(ofonoLog) << "oFono is on the bus";
        requestModems();
    });
    connect(m_watcher, &QDBusServiceWatcher::serviceUnregistered, this, &OfonoPhone::ofonoLeft);

    // oFono's signals, from whichever of its objects: the handlers keep those of the modem
    // followed. (The slots' signatures stay normalized.)
    const QString any;
    // clang-format off
    m_bus.connect(Service, QStringLiteral("/"), ManagerInterface, QStringLiteral("ModemAdded"),
                  this, SLOT(onModemAdded(QDBusObjectPath,QVariantMap)));
    m_bus.connect(Service, QStringLiteral("/"), ManagerInterface, QStringLiteral("ModemRemoved"),
                  this, SLOT(onModemRemoved(QDBusObjectPath)));
    for (const QString &interface :
         {ModemInterface, CallInterface, NetworkInterface, HandsfreeInterface})
        m_bus.connect(Service, any, interface, QStringLiteral("PropertyChanged"), this,
                      SLOT(onPropertyChanged(QString,QDBusVariant,QDBusMessage)));
    m_bus.connect(Service, any, CallManagerInterface, QStringLiteral("CallAdded"), this,
                  SLOT(onCallAdded(QDBusObjectPath,QVariantMap,QDBusMessage)));
    m_bus.connect(Service, any, CallManagerInterface, QStringLiteral("CallRemoved"), this,
                  SLOT(onCallRemoved(QDBusObjectPath,QDBusMessage)));
    m_bus.connect(Service, any, MessagesInterface, QStringLiteral("IncomingMessage"), this,
                  SLOT(onIncomingMessage(QString,QVariantMap,QDBusMessage)));
    // clang-format on
    requestModems();
}

void OfonoPhone::requestModems()
{
    call(
            QStringLiteral("/"), ManagerInterface, QStringLiteral("GetModems"), {},
            [this](const QDBusMessage &reply) {
                m_modems.clear();
                const auto modems = objectsOf(reply);
                for (const auto &modem : modems)
                    m_modems.append({modem.first.path(), modem.second});
                chooseModem();
            },
            [this](const QString &error) {
                // Not there yet: the watcher says when it comes.
                qCInfo(ofonoLog).noquote() << error;
                setConnected(false, QStringLiteral("oFono is not on the bus"));
            });
}

void OfonoPhone::ofonoLeft()
{
    m_modems.clear();
    dropModem(QStringLiteral("oFono left the bus"));
}

void OfonoPhone::forgetModem(const QString &path)
{
    m_modems.erase(std::remove_if(m_modems.begin(), m_modems.end(),
                                  [&path](const Modem &modem) { return modem.path == path; }),
                   m_modems.end());
}

void OfonoPhone::onModemAdded(const QDBusObjectPath &path, const QVariantMap &properties)
{
    forgetModem(path.path());
    m_modems.append({path.path(), properties});
    chooseModem();
}

void OfonoPhone::onModemRemoved(const QDBusObjectPath &path)
{
    forgetModem(path.path());
    if (path.path() == m_modem)
        dropModem(QStringLiteral("the modem %1 went away").arg(m_modem));
    chooseModem();
}

bool OfonoPhone::usable(const Modem &modem) const
{
    const QVariantMap &properties = modem.properties;
    if (!properties.value(QStringLiteral("Powered")).toBool()
        || !properties.value(QStringLiteral("Online")).toBool())
        return false;
    // A hands-free modem is a phone once its hands-free profile is connected.
    return properties.value(QStringLiteral("Type")).toString() != QLatin1String("hfp")
            || properties.value(QStringLiteral("Interfaces"))
                       .toStringList()
                       .contains(HandsfreeInterface);
}

bool OfonoPhone::isFollowed(const QDBusMessage &message) const
{
    const QString path = message.path();
    return !m_modem.isEmpty() && (path == m_modem || path.startsWith(m_modem + QLatin1Char('/')));
}

void OfonoPhone::chooseModem()
{
    if (!m_modem.isEmpty())
        return;
    const auto chosen
            = std::find_if(m_modems.cbegin(), m_modems.cend(), [this](const Modem &modem) {
                  return (m_wantedModem.isEmpty() || modem.path == m_wantedModem) && usable(modem);
              });
    if (chosen == m_modems.cend()) {
        setConnected(false,
                     m_modems.isEmpty() ? QStringLiteral("oFono has no modem")
                             : m_wantedModem.isEmpty()
                             ? QStringLiteral("no modem is powered and online")
                             : QStringLiteral("the modem %1 is not there, or not powered and "
                                              "online")
                                       .arg(m_wantedModem));
        return;
    }
    m_modem = chosen->path;
    ++m_session;
    auto *bluetooth = Mavrosk::BluetoothSource::instance();
    bluetooth->setBridgeValue(QStringLiteral("deviceListCount"), 1);
    bluetooth->setBridgeValue(QStringLiteral("selectedDevice"), 0);
    bluetooth->setBridgeValue(QStringLiteral("phoneDevice"), 0);
    setConnected(true,
                 QStringLiteral("%1 (%2)").arg(
                         m_modem, chosen->properties.value(QStringLiteral("Model")).toString()));
    readModem();
}

void OfonoPhone::readModem()
{
    // What the modem says from here on is newer than the answers to these reads, which may come
    // after it: an answer does not undo what was heard meanwhile.
    m_heard.clear();
    call(m_modem, CallManagerInterface, QStringLiteral("GetCalls"), {},
         [this](const QDBusMessage &reply) {
             const auto calls = objectsOf(reply);
             for (const auto &call : calls) {
                 if (!m_heard.contains(call.first.path()))
                     addCall(call.first.path(), call.second);
             }
             publishCalls();
         });
    call(m_modem, NetworkInterface, QStringLiteral("GetProperties"), {},
         [this](const QDBusMessage &reply) {
             if (!m_heard.contains(NetworkInterface))
                 setNetworkStatus(propertiesOf(reply).value(QStringLiteral("Status")).toString());
         });
    const auto modem = std::find_if(m_modems.cbegin(), m_modems.cend(),
                                    [this](const Modem &known) { return known.path == m_modem; });
    if (modem != m_modems.cend()
        && modem->properties.value(QStringLiteral("Interfaces"))
                   .toStringList()
                   .contains(HandsfreeInterface))
        call(m_modem, HandsfreeInterface, QStringLiteral("GetProperties"), {},
             [this](const QDBusMessage &reply) {
                 if (!m_heard.contains(HandsfreeInterface))
                     setBattery(propertiesOf(reply).value(QStringLiteral("BatteryChargeLevel")));
             });
}

void OfonoPhone::dropModem(const QString &why)
{
    if (!m_modem.isEmpty()) {
        m_modem.clear();
        ++m_session;
        // The link is lost, not ended by the driver, first: the calls end with it.
        emit phone()->nonUserDeviceDisconnectReceived();
        setConnected(false, why);
        m_calls.clear();
        publishCalls();
        setNetworkStatus(QString());
    }
    setConnected(false, why);
}

void OfonoPhone::setConnected(bool connected, const QString &what)
{
    Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                         connected);
    if (connected == m_connected && what == m_connection)
        return;
    const bool lost = m_connected && !connected;
    m_connected = connected;
    m_connection = what;
    const QString said = (connected ? QStringLiteral("phone connected: ")
                                    : QStringLiteral("no phone connected: "))
            + what;
    if (lost)
        qCWarning(ofonoLog).noquote() << said;
    else
        qCInfo(ofonoLog).noquote() << said;
    emit connectionChanged(connected, said);
}

void OfonoPhone::onPropertyChanged(const QString &name, const QDBusVariant &value,
                                   const QDBusMessage &message)
{
    const QString interface = message.interface();
    if (interface == ModemInterface) {
        for (Modem &modem : m_modems) {
            if (modem.path != message.path())
                continue;
            modem.properties.insert(name, value.variant());
            if (modem.path == m_modem && !usable(modem))
                dropModem(QStringLiteral("the modem %1 is no longer powered and online")
                                  .arg(m_modem));
            else if (modem.path == m_modem && name == QLatin1String("Interfaces"))
                readModem();
        }
        chooseModem();
        return;
    }
    if (!isFollowed(message))
        return;
    m_heard.insert(interface == CallInterface ? message.path() : interface);
    if (interface == CallInterface) {
        for (Call &call : m_calls) {
            if (call.path == message.path())
                updateCall(call, name, value.variant());
        }
        publishCalls();
    } else if (interface == NetworkInterface && name == QLatin1String("Status")) {
        setNetworkStatus(value.variant().toString());
    } else if (interface == HandsfreeInterface && name == QLatin1String("BatteryChargeLevel")) {
        setBattery(value.variant());
    }
}

void OfonoPhone::onCallAdded(const QDBusObjectPath &path, const QVariantMap &properties,
                             const QDBusMessage &message)
{
    if (!isFollowed(message))
        return;
    m_heard.insert(path.path());
    addCall(path.path(), properties);
    publishCalls();
}

void OfonoPhone::onCallRemoved(const QDBusObjectPath &path, const QDBusMessage &message)
{
    if (!isFollowed(message))
        return;
    m_heard.insert(path.path());
    callGone(path.path());
}

void OfonoPhone::addCall(const QString &path, const QVariantMap &properties)
{
    // A call known already (the calls read again) keeps what was seen of it: rang in, answered,
    // rejected.
    auto known = std::find_if(m_calls.begin(), m_calls.end(),
                              [&](const Call &call) { return call.path == path; });
    if (known == m_calls.end()) {
        Call call;
        call.path = path;
        known = m_calls.insert(m_calls.end(), call);
    }
    Call &call = *known;
    for (auto it = properties.cbegin(); it != properties.cend(); ++it)
        updateCall(call, it.key(), it.value());
    call.incoming = call.incoming || call.state == QLatin1String("incoming")
            || call.state == QLatin1String("waiting");
    if (call.name.isEmpty() && m_lists)
        call.name = m_lists->contactName(call.number);
}

void OfonoPhone::updateCall(Call &call, const QString &name, const QVariant &value)
{
    if (name == QLatin1String("State")) {
        call.state = value.toString();
        if (call.state == QLatin1String("active") && !call.wasActive) {
            call.wasActive = true;
            call.connectedAt = nowMs();
        }
    } else if (name == QLatin1String("LineIdentification")) {
        call.number = value.toString();
    } else if (name == QLatin1String("Name") && !value.toString().isEmpty()) {
        call.name = value.toString();
    } else if (name == QLatin1String("Multiparty")) {
        call.multiparty = value.toBool();
    }
}

void OfonoPhone::callGone(const QString &path)
{
    const auto gone = std::find_if(m_calls.begin(), m_calls.end(),
                                   [&](const Call &call) { return call.path == path; });
    if (gone == m_calls.end())
        return;
    const Call call = *gone;
    m_calls.erase(gone);
    publishCalls();
    // Remembered as the phone remembers it: missed, received or dialled.
    const int type = !call.incoming ? 3 : call.wasActive ? 2 : 1;
    if (m_lists)
        m_lists->logCall(call.name, call.number, type);
    if (type == 1 && !call.rejected)
        emit phone()->missedCallsPresent();
}

void OfonoPhone::publishCalls()
{
    QVariantList rows;
    bool ringing = false;
    bool dialling = false;
    int connected = 0;
    int joined = 0;
    for (const Call &call : qAsConst(m_calls)) {
        const CallStateMapping *mapping = callStateMapping(call.state);
        if (!mapping || mapping->role == CallRole::Gone)
            continue;
        ringing = ringing || mapping->role == CallRole::Ringing;
        dialling = dialling || mapping->role == CallRole::Dialling;
        if (mapping->role == CallRole::Connected) {
            ++connected;
            joined += call.multiparty ? 1 : 0;
        }
        rows.append(callListRow(call.name, call.number, QLatin1String(mapping->callList),
                                call.connectedAt, nowMs()));
    }
    // Call status values of the bridge.
    const int status = dialling ? (connected > 0 ? 4 : 3)
            : connected >= 2    ? (joined == connected ? 10 : 9)
            : connected == 1    ? 7
                                : 0;
    phone()->callList()->setRows(rows);
    if (m_calls.isEmpty())
        setPhone("muted", false);
    setPhone("dialingInProgress", dialling);
    setPhone("callConnected", connected > 0);
    setPhone("multipleCallsConnected", connected >= 2);
    setPhone("incomingCall", ringing);
    // Ringing alone changes no status: a call that rings in beside none leaves it at 0.
    if (!ringing || connected > 0 || dialling || phone()->status() > 2)
        setPhone("status", status);
    if (connected == 0)
        m_callClock->stop();
    else if (!m_callClock->isActive())
        m_callClock->start();
}

void OfonoPhone::setNetworkStatus(const QString &status)
{
    m_networkStatus = status;
    const bool roaming = status == QLatin1String("roaming");
    const bool began = roaming && !phone()->roaming();
    setPhone("roaming", roaming);
    if (began)
        emit phone()->phoneRoamingModeReceived();
}

void OfonoPhone::setBattery(const QVariant &level)
{
    bool ok = false;
    const int charge = level.toInt(&ok);
    if (ok)
        setPhone("deviceBatteryLevel", qBound(0, charge, 5));
}

void OfonoPhone::onIncomingMessage(const QString &text, const QVariantMap &info,
                                   const QDBusMessage &message)
{
    if (!isFollowed(message))
        return;
    const QString sender = info.value(QStringLiteral("Sender")).toString();
    const QString name = m_lists ? m_lists->contactName(sender) : QString();
    setPhone("textMessageSenderName", name);
    setPhone("textMessageSenderNumber", sender);
    setPhone("textMessageBody", text);
    if (m_lists)
        m_lists->receiveMessage(name, sender, text);
    emit phone()->newTextMessageAlert();
}

// --- Commands ----------------------------------------------------------------------------------

void OfonoPhone::onJournalEntry(const Platform::JournalEntry &entry)
{
    if (entry.kind != QLatin1String("bridge"))
        return;
    const QString call = entry.fields.value(QStringLiteral("call")).toString();
    if (call.startsWith(QLatin1String("phone.")))
        command(call.section(QLatin1Char('.'), 1),
                entry.fields.value(QStringLiteral("args")).toList());
}

OfonoPhone::Call *OfonoPhone::callIn(const QStringList &states)
{
    for (const QString &state : states) {
        for (Call &call : m_calls) {
            if (call.state == state)
                return &call;
        }
    }
    return nullptr;
}

void OfonoPhone::command(const QString &command, const QVariantList &args)
{
    int connected = 0;
    for (const Call &call : qAsConst(m_calls)) {
        const CallStateMapping *mapping = callStateMapping(call.state);
        connected += mapping && mapping->role == CallRole::Connected ? 1 : 0;
    }
    const bool waiting = callIn({QStringLiteral("waiting")}) != nullptr;
    auto holds = [&](Situation situation) {
        switch (situation) {
        case Situation::CallIncoming:
            return callIn({QStringLiteral("incoming")}) != nullptr;
        case Situation::WaitingBesideOne:
            return waiting && connected < 2;
        case Situation::WaitingBesideTwo:
            return waiting && connected >= 2;
        case Situation::CallRinging:
            return callIn({QStringLiteral("incoming"), QStringLiteral("waiting")}) != nullptr;
        case Situation::Always:
            break;
        }
        return true;
    };
    const CommandMapping *mapping = nullptr;
    bool known = false;
    for (const CommandMapping &row : Commands) {
        if (command != QLatin1String(row.bridge))
            continue;
        known = true;
        if (holds(row.when)) {
            mapping = &row;
            break;
        }
    }
    if (!known)
        return;

    const QString what = QStringLiteral("%1 (%2)").arg(command, m_modem);
    const bool noNetwork = withoutNetwork(m_networkStatus);
    const Failure failure = mapping ? mapping->failure : Failure::Logged;
    auto failed = [what, failure, noNetwork](const QString &error) {
        qCWarning(ofonoLog).noquote() << what << "failed:" << error;
        switch (failure) {
        case Failure::DialingFailed:
            emit phone()->phoneDialingFailed(noNetwork ? 0 : 1);
            break;
        case Failure::AcceptingFailed:
            emit phone()->phoneCallAcceptingFailed();
            break;
        case Failure::SendingFailed:
            setPhone("sendMessageStatus", noNetwork ? 3 : 1);
            break;
        case Failure::Logged:
            break;
        }
    };
    if (m_modem.isEmpty()) {
        failed(QStringLiteral("no phone connected"));
        return;
    }
    if (!mapping) {
        failed(QStringLiteral("no call it could be meant for"));
        return;
    }

    QString path = m_modem;
    if (mapping->target != Target::Modem) {
        Call *call = mapping->target == Target::RingingCall
                ? callIn({QStringLiteral("incoming"), QStringLiteral("waiting")})
                : callIn({QStringLiteral("active"), QStringLiteral("dialing"),
                          QStringLiteral("alerting"), QStringLiteral("held")});
        if (!call) {
            failed(QStringLiteral("no call it could be meant for"));
            return;
        }
        path = call->path;
        // A call the head unit sends away is not missed.
        call->rejected = mapping->target == Target::RingingCall
                && command != QLatin1String("acceptIncomingCall");
    }

    QVariantList arguments;
    QString number;
    switch (mapping->argument) {
    case Argument::Number:
        number = args.value(0).toString();
        break;
    case Argument::RecentCallRow:
        number = m_lists ? m_lists->recentCallNumber(args.value(1).toInt()) : QString();
        break;
    case Argument::SupportNumber:
        number = args.value(1).toString();
        break;
    case Argument::Tone: {
        const QChar tone(args.value(0).toInt());
        if (!QStringLiteral("0123456789*#ABCD").contains(tone)) {
            failed(QStringLiteral("no tone for the key %1").arg(args.value(0).toInt()));
            return;
        }
        arguments = {QString(tone)};
        break;
    }
    case Argument::Reply:
        arguments = {phone()->textMessageSenderNumber(), phone()->replyTextSelected()};
        // A status of its own while the text goes, so that every send reports its outcome as a
        // change.
        setPhone("sendMessageStatus", 4);
        break;
    case Argument::None:
        break;
    }
    if (mapping->argument == Argument::Number || mapping->argument == Argument::RecentCallRow
        || mapping->argument == Argument::SupportNumber) {
        if (number.isEmpty()) {
            failed(QStringLiteral("no number to dial"));
            return;
        }
        arguments = {number, QString()};
    }

    const QString interface = QStringLiteral("org.ofono.") + QLatin1String(mapping->interface);
    const QString method = QLatin1String(mapping->method);
    call(
            path, interface, method, arguments,
            [method](const QDBusMessage &) {
                if (method == QLatin1String("SendMessage"))
                    setPhone("sendMessageStatus", 2);
            },
            failed);
}

void OfonoPhone::call(const QString &path, const QString &interface, const QString &method,
                      const QVariantList &args,
                      const std::function<void(const QDBusMessage &)> &replied,
                      const std::function<void(const QString &)> &failed)
{
    QDBusMessage message = QDBusMessage::createMethodCall(Service, path, interface, method);
    message.setArguments(args);
    auto *watcher = new QDBusPendingCallWatcher(m_bus.asyncCall(message, m_callTimeout), this);
    const int session = m_session;
    connect(watcher, &QDBusPendingCallWatcher::finished, this,
            [this, session, replied, failed, path, interface,
             method](QDBusPendingCallWatcher *finished) {
                finished->deleteLater();
                // An answer about a modem no longer followed is of no use.
                if (session != m_session)
                    return;
                if (!finished->isError()) {
                    if (replied)
                        replied(finished->reply());
                    return;
                }
                const QDBusError error = finished->error();
                const QString text
                        = QStringLiteral("%1.%2 on %3: %4 (%5)")
                                  .arg(interface, method, path, error.name(), error.message());
                if (failed)
                    failed(text);
                else
                    qCWarning(ofonoLog).noquote() << text;
            });
}

// --- The mapping, for the README ---------------------------------------------------------------

QString OfonoPhone::mappingMarkdown()
{
    QString text;
    auto row = [&text](const QStringList &cells) {
        text += QStringLiteral("| ") + cells.join(QStringLiteral(" | ")) + QStringLiteral(" |\n");
    };
    text += QStringLiteral("From oFono to the bridge (`PhoneSource` unless named):\n\n");
    row({QStringLiteral("oFono"), QStringLiteral("Bridge")});
    row({QStringLiteral("---"), QStringLiteral("---")});
    for (const CallStateMapping &state : CallStates)
        row({QStringLiteral("`VoiceCall` `State` \"%1\"").arg(QLatin1String(state.ofono)),
             QLatin1String(state.bridge)
                     + (*state.callList ? QStringLiteral("; the call list's \"%1\"")
                                                  .arg(QLatin1String(state.callList))
                                        : QString())});
    for (const ValueMapping &value : Values)
        row({QLatin1String(value.ofono), QLatin1String(value.bridge)});

    text += QStringLiteral("\nFrom the module's commands to oFono (the first row that "
                           "applies):\n\n");
    row({QStringLiteral("Command"), QStringLiteral("When"), QStringLiteral("oFono"),
         QStringLiteral("When it fails or times out")});
    row({QStringLiteral("---"), QStringLiteral("---"), QStringLiteral("---"),
         QStringLiteral("---")});
    for (const CommandMapping &command : Commands)
        row({QStringLiteral("`%1`").arg(QLatin1String(command.bridge)),
             QLatin1String(situationText(command.when)),
             QStringLiteral("%1`%2.%3`%4")
                     .arg(QLatin1String(targetText(command.target)),
                          QLatin1String(command.interface), QLatin1String(command.method),
                          *argumentText(command.argument)
                                  ? QLatin1Char(' ') + QLatin1String(argumentText(command.argument))
                                  : QString()),
             QLatin1String(failureText(command.failure))});

    text += QStringLiteral("\nWhat oFono does not carry stays with the simulated phone:\n\n");
    row({QStringLiteral("Bridge"), QStringLiteral("Why")});
    row({QStringLiteral("---"), QStringLiteral("---")});
    for (const ValueMapping &kept : Kept)
        row({QLatin1String(kept.ofono), QLatin1String(kept.bridge)});
    return text;
}

} // namespace Simulator
