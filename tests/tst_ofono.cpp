// A real phone behind the data bridge, as oFono shows it: the bridge's oFono backend and the
// module against python3-dbusmock's oFono template on a D-Bus of the suite's own. The template
// is extended through dbusmock's mock interface where it lacks something: a call that rings in,
// answering it, the far end's moves, texts.

#include "globalhmi.h"
#include "ofonophone.h"
#include "simulatedphone.h"

#include <mavrosk/keysource.h>

#include <QDBusConnection>
#include <QDBusConnectionInterface>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

namespace {

const QString Ofono = QStringLiteral("org.ofono");
const QString Modem = QStringLiteral("/ril_0");
const QString MockInterface = QStringLiteral("org.freedesktop.DBus.Mock");
const QString CallManager = QStringLiteral("org.ofono.VoiceCallManager");
// Debian's own Python, which has the dbusmock module, whatever else is on the path.
const QString Python = QStringLiteral(HMIPHONE_PYTHON3);
// The bus of the suite's own: a session bus that needs no configuration of the system's.
const char *const BusConfiguration = "<busconfig>\n"
                                     "  <type>session</type>\n"
                                     "  <listen>unix:tmpdir=%1</listen>\n"
                                     "  <policy context=\"default\">\n"
                                     "    <allow send_destination=\"*\" eavesdrop=\"true\"/>\n"
                                     "    <allow eavesdrop=\"true\"/>\n"
                                     "    <allow own=\"*\"/>\n"
                                     "  </policy>\n"
                                     "</busconfig>\n";
constexpr int Patience = 5000;

// What the template lacks, as dbusmock code run in the mock (self: the object, args: the
// arguments). A call of the mock's is found by its number.
const char *const FindCall = "found = []\n"
                             "for path in self.calls:\n"
                             "    call = objects[path]\n"
                             "    if call.Get('org.ofono.VoiceCall', 'LineIdentification') == "
                             "args[0]:\n"
                             "        found.append(path)\n";
const char *const SetState = "def set_state(call, state):\n"
                             "    value = dbus.String(state, variant_level=1)\n"
                             "    call.Set('org.ofono.VoiceCall', 'State', value)\n"
                             "    call.EmitSignal('org.ofono.VoiceCall', 'PropertyChanged', 'sv', "
                             "['State', value])\n";

// A call hung up goes as oFono has it go: removed, and said so by the modem (the template's
// dialled calls say it from the call they no longer have).
const char *const Hangup
        = "self.parent.calls.remove(self._object_path)\n"
          "self.parent.RemoveObject(self._object_path)\n"
          "self.parent.EmitSignal(\"org.ofono.VoiceCallManager\", \"CallRemoved\", "
          "\"o\", [dbus.ObjectPath(self._object_path)])";

struct MockMethod
{
    const char *interface;
    const char *name;
    const char *in;
    const char *out;
    QString code;
};

QList<MockMethod> modemExtensions()
{
    const QString findCall = QLatin1String(FindCall);
    const QString setState = QLatin1String(SetState);
    // A call that rings in: answered, it is active (after the delay the test may have set); hung
    // up, it goes as a dialled one does.
    const QString answer = QStringLiteral(
            R"(import time\n)"
            R"(time.sleep(getattr(self.parent, "answer_delay", 0))\n)"
            R"(value = dbus.String("active", variant_level=1)\n)"
            R"(self.Set("org.ofono.VoiceCall", "State", value)\n)"
            R"(self.EmitSignal("org.ofono.VoiceCall", "PropertyChanged", "sv", ["State", value]))");
    const QString hangup
            = QString::fromLatin1(Hangup).replace(QLatin1Char('\n'), QLatin1String("\\n"));
    const QString ring
            = QStringLiteral(
                      "self.rung = getattr(self, 'rung', 0) + 1\n"
                      "path = self._object_path + '/incoming' + str(self.rung)\n"
                      "self.AddObject(path, 'org.ofono.VoiceCall', {\n"
                      "    'State': dbus.String(args[2], variant_level=1),\n"
                      "    'LineIdentification': dbus.String(args[0], variant_level=1),\n"
                      "    'Name': dbus.String(args[1], variant_level=1),\n"
                      "    'Multiparty': dbus.Boolean(False, variant_level=1)}, [\n"
                      "    ('GetProperties', '', 'a{sv}', 'ret = "
                      "self.GetAll(\"org.ofono.VoiceCall\")'),\n"
                      "    ('Answer', '', '', '%1'),\n"
                      "    ('Hangup', '', '', '%2')])\n"
                      "objects[path].parent = self\n"
                      "self.calls.append(path)\n"
                      "self.EmitSignal('org.ofono.VoiceCallManager', 'CallAdded', 'oa{sv}', "
                      "[dbus.ObjectPath(path), objects[path].GetAll('org.ofono.VoiceCall')])\n"
                      "ret = dbus.ObjectPath(path)\n")
                      .arg(answer, hangup);
    // Every call in state `from` goes to state `to`.
    auto move = [&setState](const char *moves) {
        return setState
                + QStringLiteral("moves = %1\n"
                                 "calls = [objects[path] for path in self.calls]\n"
                                 "states = [call.Get('org.ofono.VoiceCall', 'State') for call in "
                                 "calls]\n"
                                 "for call, state in zip(calls, states):\n"
                                 "    if state in moves:\n"
                                 "        set_state(call, moves[state])\n")
                          .arg(QLatin1String(moves));
    };
    return {
            {"org.freedesktop.DBus.Mock", "RingIn", "sss", "o", ring},
            {"org.freedesktop.DBus.Mock", "SetCallState", "ss", "",
             findCall + setState + QStringLiteral("set_state(objects[found[0]], args[1])\n")},
            {"org.freedesktop.DBus.Mock", "FarEndHangsUp", "s", "",
             findCall + setState
                     + QStringLiteral("set_state(objects[found[0]], 'disconnected')\n"
                                      "self.calls.remove(found[0])\n"
                                      "self.RemoveObject(found[0])\n"
                                      "self.EmitSignal('org.ofono.VoiceCallManager', "
                                      "'CallRemoved', 'o', [dbus.ObjectPath(found[0])])\n")},
            {"org.freedesktop.DBus.Mock", "SetBattery", "y", "",
             QStringLiteral("self.EmitSignal('org.ofono.Handsfree', 'PropertyChanged', 'sv', "
                            "['BatteryChargeLevel', dbus.Byte(args[0], variant_level=1)])\n")},
            {"org.freedesktop.DBus.Mock", "SetAnswerDelay", "d", "",
             QStringLiteral("self.answer_delay = args[0]\n")},
            {"org.ofono.VoiceCallManager", "SwapCalls", "", "",
             move("{'active': 'held', 'held': 'active'}")},
            {"org.ofono.VoiceCallManager", "HoldAndAnswer", "", "",
             move("{'active': 'held', 'waiting': 'active'}")},
            {"org.ofono.MessageManager", "SendMessage", "ss", "o",
             QStringLiteral("ret = dbus.ObjectPath(self._object_path + '/message01')\n")},
    };
}

} // namespace

class tst_Ofono : public TestSupport::Suite
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanupTestCase();

    void realPhone_data();
    void realPhone();
    void simulatorWaitsForOfono();
    void readmeHasTheMapping();

protected:
    void setUp() override;
    void tearDown() override;

private:
    void startOfono();
    void stopOfono();
    QDBusMessage mock(const QString &path, const QString &interface, const QString &method,
                      const QVariantList &args = {});
    QString callPath(const QString &number);
    bool mockSaw(const QString &method, const QString &number = QString());
    void play(const QString &step);
    bool holds(const QString &expectation);

    QTemporaryDir m_busDirectory;
    QProcess m_bus;
    QString m_address;
    QDBusConnection m_connection{QString()};
    QProcess m_ofono;
    std::unique_ptr<GlobalHmi> m_hmi;
    Simulator::SimulatedPhone *m_lists = nullptr;
    Simulator::OfonoPhone *m_phone = nullptr;
};

void tst_Ofono::initTestCase()
{
    QVERIFY(m_busDirectory.isValid());
    QFile configuration(m_busDirectory.filePath(QStringLiteral("bus.conf")));
    QVERIFY(configuration.open(QIODevice::WriteOnly));
    configuration.write(QString::fromLatin1(BusConfiguration).arg(m_busDirectory.path()).toUtf8());
    configuration.close();
    m_bus.start(QStringLiteral(HMIPHONE_DBUS_DAEMON),
                {QStringLiteral("--config-file=") + configuration.fileName(),
                 QStringLiteral("--nofork"), QStringLiteral("--print-address=1")});
    QVERIFY(m_bus.waitForStarted());
    QTRY_VERIFY(m_bus.canReadLine());
    m_address = QString::fromUtf8(m_bus.readLine()).trimmed();
    m_connection = QDBusConnection::connectToBus(m_address, QStringLiteral("tst_ofono"));
    QVERIFY2(m_connection.isConnected(), qPrintable(m_connection.lastError().message()));
}

void tst_Ofono::cleanupTestCase()
{
    QDBusConnection::disconnectFromBus(QStringLiteral("tst_ofono"));
    m_bus.kill();
    m_bus.waitForFinished();
}

void tst_Ofono::startOfono()
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("DBUS_SYSTEM_BUS_ADDRESS"), m_address);
    m_ofono.setProcessEnvironment(environment);
    m_ofono.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    m_ofono.start(Python,
                  {QStringLiteral("-m"), QStringLiteral("dbusmock"), QStringLiteral("--template"),
                   QStringLiteral("ofono")});
    QVERIFY(m_ofono.waitForStarted());
    QTRY_VERIFY_WITH_TIMEOUT(m_connection.interface()->isServiceRegistered(Ofono), Patience);
    const QList<MockMethod> extensions = modemExtensions();
    for (const MockMethod &method : extensions) {
        const QDBusMessage reply
                = mock(Modem, MockInterface, QStringLiteral("AddMethod"),
                       {QLatin1String(method.interface), QLatin1String(method.name),
                        QLatin1String(method.in), QLatin1String(method.out), method.code});
        QVERIFY2(reply.type() == QDBusMessage::ReplyMessage, qPrintable(reply.errorMessage()));
    }
}

void tst_Ofono::stopOfono()
{
    m_ofono.terminate();
    m_ofono.waitForFinished();
}

void tst_Ofono::setUp()
{
    // The simulator brings its own bridge, and the README needs none.
    if (QTest::currentDataTag() == nullptr)
        return;
    startOfono();
    m_hmi = std::make_unique<GlobalHmi>();
    QVERIFY(m_hmi->run());
    m_lists = new Simulator::SimulatedPhone(nullptr, nullptr,
                                            Simulator::SimulatedPhone::RealPhoneCalls);
    m_lists->connectPhone();
    m_phone = new Simulator::OfonoPhone(m_address, m_lists);
    m_phone->setCallTimeout(1000);
    m_phone->start();
    QTRY_COMPARE_WITH_TIMEOUT(m_phone->modem(), Modem, Patience);
}

void tst_Ofono::tearDown()
{
    delete std::exchange(m_phone, nullptr);
    delete std::exchange(m_lists, nullptr);
    stopOfono();
    m_hmi.reset();
}

QDBusMessage tst_Ofono::mock(const QString &path, const QString &interface, const QString &method,
                             const QVariantList &args)
{
    QDBusMessage message = QDBusMessage::createMethodCall(Ofono, path, interface, method);
    message.setArguments(args);
    return m_connection.call(message, QDBus::Block, Patience);
}

QString tst_Ofono::callPath(const QString &number)
{
    const QDBusMessage reply = mock(Modem, CallManager, QStringLiteral("GetCalls"));
    const auto calls
            = qdbus_cast<QList<QPair<QDBusObjectPath, QVariantMap>>>(reply.arguments().value(0));
    for (const auto &call : calls) {
        if (call.second.value(QStringLiteral("LineIdentification")).toString() == number)
            return call.first.path();
    }
    return QString();
}

// Whether the mock's modem, or its call with that number, was called with the method.
bool tst_Ofono::mockSaw(const QString &method, const QString &number)
{
    const QString path = number.isEmpty() ? Modem : callPath(number);
    if (path.isEmpty())
        return false;
    const QDBusMessage reply
            = mock(path, MockInterface, QStringLiteral("GetMethodCalls"), {method});
    return reply.type() == QDBusMessage::ReplyMessage
            && !qdbus_cast<QVariantList>(reply.arguments().value(0)).isEmpty();
}

// One step of the phone's side, oFono's or the driver's:
//   ring NUMBER [NAME] | wait NUMBER     a call rings in (beside a connected call: waiting)
//   far STATE NUMBER | hangup NUMBER      the far end moves the call, or hangs up
//   roam | battery LEVEL | text NUMBER WORDS... | slow-answer | ofono-leaves | ofono-returns
//   key K (a tap) | send WORDS... (the reply to the last sender) | dial NUMBER
//   set SOURCE.PROPERTY=VALUE (what the driver set)
void tst_Ofono::play(const QString &step)
{
    const QStringList words = step.split(QLatin1Char(' '));
    const QString verb = words.value(0);
    const QString rest = words.mid(2).join(QLatin1Char(' '));
    QDBusMessage reply = QDBusMessage::createError(QStringLiteral("test.Unknown"), step);
    if (verb == QLatin1String("ring") || verb == QLatin1String("wait")) {
        reply = mock(Modem, MockInterface, QStringLiteral("RingIn"),
                     {words.value(1), rest,
                      verb == QLatin1String("ring") ? QStringLiteral("incoming")
                                                    : QStringLiteral("waiting")});
    } else if (verb == QLatin1String("far")) {
        reply = mock(Modem, MockInterface, QStringLiteral("SetCallState"),
                     {words.value(2), words.value(1)});
    } else if (verb == QLatin1String("hangup")) {
        reply = mock(Modem, MockInterface, QStringLiteral("FarEndHangsUp"), {words.value(1)});
    } else if (verb == QLatin1String("roam")) {
        reply = mock(Modem, QStringLiteral("org.ofono.NetworkRegistration"),
                     QStringLiteral("SetProperty"),
                     {QStringLiteral("Status"),
                      QVariant::fromValue(QDBusVariant(QStringLiteral("roaming")))});
    } else if (verb == QLatin1String("text")) {
        const QVariantMap info{{QStringLiteral("Sender"), words.value(1)}};
        reply = mock(Modem, MockInterface, QStringLiteral("EmitSignal"),
                     {QStringLiteral("org.ofono.MessageManager"), QStringLiteral("IncomingMessage"),
                      QStringLiteral("sa{sv}"),
                      QVariantList{QVariant::fromValue(QDBusVariant(rest)),
                                   QVariant::fromValue(QDBusVariant(info))}});
    } else if (verb == QLatin1String("battery")) {
        reply = mock(Modem, MockInterface, QStringLiteral("SetBattery"),
                     {QVariant::fromValue(uchar(words.value(1).toUInt()))});
    } else if (verb == QLatin1String("dial")) {
        GlobalHmi::phone()->dialNumber(words.value(1));
        QTRY_VERIFY_WITH_TIMEOUT(!callPath(words.value(1)).isEmpty(), Patience);
        reply = mock(callPath(words.value(1)), MockInterface, QStringLiteral("AddMethod"),
                     {QStringLiteral("org.ofono.VoiceCall"), QStringLiteral("Hangup"), QString(),
                      QString(), QLatin1String(Hangup)});
    } else if (verb == QLatin1String("slow-answer")) {
        reply = mock(Modem, MockInterface, QStringLiteral("SetAnswerDelay"), {3.0});
    } else if (verb == QLatin1String("ofono-leaves")) {
        stopOfono();
        return;
    } else if (verb == QLatin1String("ofono-returns")) {
        startOfono();
        return;
    } else if (verb == QLatin1String("key")) {
        // A tap: press, then short press.
        for (int kind : {1, 2})
            Mavrosk::KeySource::instance()->sendKeyEvent(words.value(1).toInt(), kind);
        TestSupport::processUntilIdle();
        return;
    } else if (verb == QLatin1String("set")) {
        QVERIFY2(TestSupport::setBridgeValue(words.value(1)), qPrintable(step));
        return;
    } else if (verb == QLatin1String("send")) {
        GlobalHmi::phone()->setReplyTextSelected(words.mid(1).join(QLatin1Char(' ')));
        GlobalHmi::phone()->initiateSendTextMessage();
        return;
    }
    QVERIFY2(reply.type() == QDBusMessage::ReplyMessage,
             qPrintable(step + QStringLiteral(": ") + reply.errorMessage()));
}

// What the HMI shows or the mock saw:
//   popup X | nopopup X | state X | nostate X       the module's popups and active states
//   phone.P=V | bluetooth.P=V                       a bridge value, as text
//   call NUMBER STATE                               the bridge's call list has the call
//   saw METHOD [NUMBER]                             the mock's modem (or that call) was called
bool tst_Ofono::holds(const QString &expectation)
{
    const QStringList words = expectation.split(QLatin1Char(' '));
    const QString what = words.value(0);
    if (what == QLatin1String("popup") || what == QLatin1String("nopopup"))
        return GlobalHmi::isOpen(words.value(1)) == (what == QLatin1String("popup"));
    if (what == QLatin1String("state") || what == QLatin1String("nostate"))
        return GlobalHmi::isActive(words.value(1)) == (what == QLatin1String("state"));
    if (what == QLatin1String("saw"))
        return mockSaw(words.value(1), words.value(2));
    if (what == QLatin1String("call")) {
        Mavrosk::MultiDPListModel *calls = GlobalHmi::phone()->callList();
        for (int row = 0; row < calls->count(); ++row) {
            if (calls->get(row, QStringLiteral("number")).toString() == words.value(1)
                && calls->get(row, QStringLiteral("callState")).toString() == words.value(2))
                return true;
        }
        return false;
    }
    const QString property = what.section(QLatin1Char('='), 0, 0);
    const QList<Mavrosk::DataSource *> sources = Mavrosk::DataSource::sources();
    for (Mavrosk::DataSource *source : sources) {
        if (source->shortName() == property.section(QLatin1Char('.'), 0, 0))
            return source->property(property.section(QLatin1Char('.'), 1).toLatin1().constData())
                           .toString()
                    == expectation.section(QLatin1Char('='), 1);
    }
    return false;
}

void tst_Ofono::realPhone_data()
{
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QStringList>("warnings");

    const QString anna = QStringLiteral("+447700900111");
    const QString ben = QStringLiteral("+447700900222");
    QTest::newRow("rings in, answered with the phone key, the far end hangs up")
            << QStringList{QStringLiteral("ring %1 Anna Becker").arg(anna),
                           QStringLiteral("? popup IncomingCall"),
                           QStringLiteral("? call %1 incoming").arg(anna),
                           QStringLiteral("? phone.incomingCall=true"),
                           QStringLiteral("key 12"),
                           QStringLiteral("? saw Answer %1").arg(anna),
                           QStringLiteral("? phone.status=7"),
                           QStringLiteral("? state PhoneCallCmp"),
                           QStringLiteral("? nopopup IncomingCall"),
                           QStringLiteral("hangup %1").arg(anna),
                           QStringLiteral("? phone.status=0"),
                           QStringLiteral("? phone.callConnected=false"),
                           QStringLiteral("? nostate PhoneCallCmp")}
            << QStringList();
    QTest::newRow("a waiting call held-and-answered, then swapped")
            << QStringList{QStringLiteral("ring %1").arg(anna),
                           QStringLiteral("? popup IncomingCall"),
                           QStringLiteral("key 12"),
                           QStringLiteral("? phone.status=7"),
                           QStringLiteral("wait %1 Ben").arg(ben),
                           QStringLiteral("? popup WaitingCall"),
                           QStringLiteral("key 12"),
                           QStringLiteral("? saw HoldAndAnswer"),
                           QStringLiteral("? phone.status=9"),
                           QStringLiteral("? phone.multipleCallsConnected=true"),
                           QStringLiteral("? call %1 active").arg(ben),
                           QStringLiteral("? call %1 held").arg(anna),
                           QStringLiteral("key 12"),
                           QStringLiteral("? saw SwapCalls"),
                           QStringLiteral("? call %1 active").arg(anna),
                           QStringLiteral("? call %1 held").arg(ben)}
            << QStringList();
    QTest::newRow("a call that rings out unanswered is missed")
            << QStringList{QStringLiteral("ring %1").arg(ben),
                           QStringLiteral("? popup IncomingCall"),
                           QStringLiteral("hangup %1").arg(ben),
                           QStringLiteral("? phone.incomingCall=false"),
                           QStringLiteral("? nopopup IncomingCall"),
                           QStringLiteral("? popup MissedCallPopup")}
            << QStringList();
    QTest::newRow("dialled: the far end rings, answers, and the end key hangs up")
            << QStringList{QStringLiteral("dial %1").arg(ben),
                           QStringLiteral("? call %1 dialing").arg(ben),
                           QStringLiteral("? phone.status=3"),
                           QStringLiteral("? phone.dialingInProgress=true"),
                           QStringLiteral("far alerting %1").arg(ben),
                           QStringLiteral("? call %1 dialing").arg(ben),
                           QStringLiteral("far active %1").arg(ben),
                           QStringLiteral("? phone.status=7"),
                           QStringLiteral("? state PhoneCallCmp"),
                           QStringLiteral("key 80"),
                           QStringLiteral("? phone.status=0"),
                           QStringLiteral("? nostate PhoneCallCmp")}
            << QStringList();
    QTest::newRow("roaming shows its warning, the battery its level")
            << QStringList{QStringLiteral("roam"),
                           QStringLiteral("? phone.roaming=true"),
                           QStringLiteral("? popup RoamingWarning"),
                           QStringLiteral("set phone.lowBatteryNotification=true"),
                           QStringLiteral("battery 1"),
                           QStringLiteral("? phone.deviceBatteryLevel=1"),
                           QStringLiteral("? popup BatteryLow")}
            << QStringList();
    QTest::newRow("a text arrives and is answered")
            << QStringList{QStringLiteral("text %1 See you at eight?").arg(ben),
                           QStringLiteral("? phone.textMessageSenderNumber=%1").arg(ben),
                           QStringLiteral("? phone.textMessageBody=See you at eight?"),
                           QStringLiteral("? popup NewTextMessageAlert2"),
                           QStringLiteral("send On my way."),
                           QStringLiteral("? saw SendMessage"),
                           QStringLiteral("? phone.sendMessageStatus=2")}
            << QStringList();
    QTest::newRow("oFono goes in a call and comes back")
            << QStringList{QStringLiteral("ring %1").arg(anna),
                           QStringLiteral("? popup IncomingCall"),
                           QStringLiteral("key 12"),
                           QStringLiteral("? state PhoneCallCmp"),
                           QStringLiteral("ofono-leaves"),
                           QStringLiteral("? bluetooth.deviceConnected=false"),
                           QStringLiteral("? phone.status=0"),
                           QStringLiteral("? phone.callConnected=false"),
                           QStringLiteral("? popup PhoneConnectionLost"),
                           QStringLiteral("ofono-returns"),
                           QStringLiteral("? bluetooth.deviceConnected=true"),
                           QStringLiteral("? nopopup PhoneConnectionLost")}
            << QStringList{QStringLiteral("^no phone connected: oFono left the bus$")};
    QTest::newRow("an answer that times out: the phone does not respond")
            << QStringList{QStringLiteral("slow-answer"), QStringLiteral("ring %1").arg(anna),
                           QStringLiteral("? popup IncomingCall"), QStringLiteral("key 12"),
                           QStringLiteral("? popup CallAnswerNotResponding")}
            << QStringList{QStringLiteral("^acceptIncomingCall .* failed: .*NoReply")};
}

void tst_Ofono::realPhone()
{
    QFETCH(QStringList, steps);
    QFETCH(QStringList, warnings);
    for (const QString &warning : warnings)
        expectMessage(QtWarningMsg, QRegularExpression(warning));
    for (const QString &step : steps) {
        if (!step.startsWith(QLatin1String("? "))) {
            play(step);
            continue;
        }
        const QString expectation = step.mid(2);
        QTRY_VERIFY2_WITH_TIMEOUT(holds(expectation), qPrintable(expectation), Patience);
    }
}

// The simulator starts without oFono, says that no phone is connected, and plays a real phone's
// call once oFono comes: the call rings in while it waits for typed steps.
void tst_Ofono::simulatorWaitsForOfono()
{
    QProcess simulator;
    simulator.start(QStringLiteral(HMIPHONE_SIM_FILE),
                    {QStringLiteral("--phone"), QStringLiteral("ofono"),
                     QStringLiteral("--dbus-address"), m_address, QStringLiteral("--interactive"),
                     QStringLiteral("--json"), QStringLiteral("--log"), QStringLiteral("none")});
    QVERIFY(simulator.waitForStarted());
    QByteArray seen;
    auto saw = [&](const char *text) {
        seen += simulator.readAllStandardOutput();
        return seen.contains(text);
    };
    QTRY_VERIFY_WITH_TIMEOUT(saw(R"("what":"no phone connected: oFono is not on the bus")"),
                             Patience);

    startOfono();
    QTRY_VERIFY_WITH_TIMEOUT(saw(R"("what":"phone connected: /ril_0)"), Patience);
    play(QStringLiteral("ring +447700900111"));
    QTRY_VERIFY_WITH_TIMEOUT(saw(R"("out":"popup-request","id":"PHONE.IncomingCall")"), Patience);
    simulator.write("{\"key\": 12, \"kind\": 2}\n");
    QTRY_VERIFY_WITH_TIMEOUT(mockSaw(QStringLiteral("Answer"), QStringLiteral("+447700900111")),
                             Patience);
    simulator.closeWriteChannel();
    QVERIFY(simulator.waitForFinished(Patience));
    QCOMPARE(simulator.exitCode(), 0);
}

// The README's mapping is the code's.
void tst_Ofono::readmeHasTheMapping()
{
    QFile readme(QStringLiteral(HMIPHONE_README_FILE));
    QVERIFY(readme.open(QIODevice::ReadOnly));
    const QString text = QString::fromUtf8(readme.readAll());
    const QString begin = QStringLiteral("<!-- ofono-mapping: begin -->\n");
    const QString end = QStringLiteral("<!-- ofono-mapping: end -->");
    const int from = text.indexOf(begin);
    const int to = text.indexOf(end);
    QVERIFY2(from >= 0 && to > from, "the README marks its oFono mapping");
    QVERIFY2(
            text.mid(from + begin.size(), to - from - begin.size()).trimmed()
                    == Simulator::OfonoPhone::mappingMarkdown().trimmed(),
            "the README's oFono mapping is not the code's: hmiphone-sim --ofono-mapping writes it");
}

QTEST_GUILESS_MAIN(tst_Ofono)
#include "tst_ofono.moc"
