// The phone's notices about its link, its errors, the voice service, the extended mode and the
// contacts download, whatever screen is shown, as the HMI sees them: popups, transients, intents
// and commands to the phone. Minutes pass on the simulator's virtual clock.

#include "globalhmi.h"
#include "virtualeventdispatcher.h"

#include <brisken/statusbarcontroller.h>
#include <brisken/viewmanager.h>
#include <quorvel/hmiviewstate.h>

// A row a line: name | the phone before ("nobar": a host without a status bar) | what happens |
// what the HMI does ("@N": from minute N on). Steps: "phone.status=12" a bridge value,
// "phone!signal" or "phone!signal(2)" a signal of a source or of the controller, "bar=0" and
// "context=2" the host's status bar and display context, "view ID" a view on screen, "+N" N
// minutes passing, anything else an event posted. Outputs: "popup" and "dismiss" a popup asked for
// and dismissed, "transient" and "hide", intents and bridge commands. "$x" stands for a name below.
const char *const reactionTable = R"(
link lost, call          | $call               | $lost   | popup PhoneConnectionLost
link lost, home          |                     | $lost   |
link lost, settings      | view PHONE.PhoneSettings | $lost | intent 61()
link lost, app settings  | view SETTINGS.ZentroSingleAppSettings | $lost | intent 61()
link lost, other         | view SETTINGS.ZentroAllAppsSettingsMore | $lost |
door open, call          | $call               | $door   | popup PhoneConnectionLost; dismiss PhoneSmsSendTextMessage
door open, no call       |                     | $door   | popup UnableToConnect; dismiss PhoneSmsSendTextMessage
reconnected              | bluetooth.deviceConnected=false | bluetooth.deviceConnected=true | dismiss PhoneConnectionLost; dismiss UnableToConnect; intent 53()
DTMF error, call         | $call               | phone!dtmfKeyPressNoResponseErrorReceived | popup DTMFKeyPressNoResponseErrorPopup
DTMF error               |                     | phone!dtmfKeyPressNoResponseErrorReceived |
audio transfer, call     | $call               | phone!phoneAudioTransferErrorReceived | popup PhoneAudioTransferErrorPopup
audio transfer           |                     | phone!phoneAudioTransferErrorReceived |
hands-free, call         | $call               | phone!phoneAudioHandsfreeErrorReceived | popup HandsFreeError
hands-free               |                     | phone!phoneAudioHandsfreeErrorReceived |
audio internal, call     | $call               | phone!phoneAudioInternalErrorReceived | popup SiriConnectionNotRespondingPopup
audio internal           |                     | phone!phoneAudioInternalErrorReceived |
Siri not enabled         |                     | HmiPhone_ShowSiriNotEnabledRequest | popup siriFeatureNotEnabledPopup
unstable connection      |                     | phone!unstableDeviceConnectionWithKovaReceived | popup UnstableDeviceConnectionWithKovaPopup
reconnection failed      |                     | phone!deviceReconnectFailReceived | popup UnableToConnect
Siri not responding      |                     | phone!phoneSiriNoResponseErrorReceived | popup SiriConnectionNotRespondingPopup
Siri without audio       |                     | phone!phoneSiriSCOchannelNotActiveReceived | popup siriFeatureNotEnabledPopup
contacts too large       |                     | phone!phoneContactsTooLargeErrorReceived | popup ContactsListTooLargePopup
pairing by voice         |                     | speech!displayPairingPopup | intent 14(PHONE) voice
add phone, phone screens | HmiPhone_RootStateRequest | HmiPhone_AddPhoneRequest | intent 14(PHONE)
add phone, elsewhere     |                     | HmiPhone_AddPhoneRequest |
battery low              | $battery=true       | phone.deviceBatteryLevel=1 | popup BatteryLow
battery low, no phone    | $battery=true; bluetooth.deviceConnected=false | phone.deviceBatteryLevel=1 |
battery low, not wanted  | $battery=false      | phone.deviceBatteryLevel=1 |
to the handset           | $call               | phone.status=12 | phone.checkPhoneStatus(); popup $standby
back from the handset    | phone.status=12     | phone.status=7  | dismiss $standby
retry contacts download  | bluetooth.phoneDevice=4; bluetooth.selectedDevice=2 | HmiPhone_RetryAutomaticContactDownloadRequest | phone.retryPhoneBookDownload(4)

extended 10, call        | $extended=10; $call | $mode(2); +15 | @7; popup $standby; @10; $private; $shutdown
extended 3, private      | $extended=3; phone.privateMode=true | $mode(3); +15 | @3; $shutdown
extended 3, call         | $extended=3; $call  | $mode(2); +15 | @3; $private; $shutdown
extended, changed again  | $extended=5         | $mode(2); +2; $mode(3); +1; $mode(2); +10 | @5; $private; $shutdown
extended, mode 1 afresh  | $extended=5         | $mode(2); +4; $mode(1); +15 | @4; dismiss $standby; $cleared; @9; $private; $shutdown
extended, mode 0 ends    | $extended=5         | $mode(2); +4; $mode(0); +15 | @4; dismiss $standby; $cleared
extended, privacy        | $extended=5         | $mode(2); +4; HmiPhone_PrivacyRequestOn; +15 | @4; $private; $cleared
extended, cleared        | $extended=5         | $mode(2); +4; HmiPhone_ClearExtendedModeTimer; +15 | @4; $cleared
extended, shortened      | $extended=10        | $mode(2); +5; phone.extendedModeTimerValue=4; +15 | @6; $private; $shutdown
extended, none           | $extended=0         | $mode(2); +15 | @1; $private; $shutdown
extended, smallest int   | $extended=-2147483648 | $mode(2); +15 | @1; $private; $shutdown
extended, popup covered   | $extended=5; phone.lowBatteryNotification=true; phone.deviceBatteryLevel=1 | $mode(2); +15 | @5; $private; $shutdown
extended, not in stand-by | phone.extendedModeTimerValue=5 | $mode(2); +15 |

Siri on                  |                     | phone.siriActive=true | transient $voiceMsg
Siri on, bar hidden      | bar=0               | phone.siriActive=true | popup $voice
Siri on, no bar          | nobar               | phone.siriActive=true |
Siri off                 | phone.siriActive=true | phone.siriActive=false | hide $voiceMsg; dismiss $voice
Siri off, no bar         | nobar; phone.siriActive=true | phone.siriActive=false | dismiss $voice
assistant on, bar hidden | bar=0               | phone.phoneVoiceServiceActive=true | popup $voice
assistant off            | phone.phoneVoiceServiceActive=true | phone.phoneVoiceServiceActive=false | hide $voiceMsg; dismiss $voice
menu left                | phone.siriActive=true | controller!phoneMenuExited | transient $voiceMsg
menu left, both, bar hidden | bar=0; phone.siriActive=true; phone.phoneVoiceServiceActive=true | controller!phoneMenuExited | popup $voice; popup $voice
menu left, inactive      |                     | controller!phoneMenuExited |
menu left, no bar        | nobar; phone.siriActive=true | controller!phoneMenuExited |
menu entered             | phone.phoneVoiceServiceActive=true | controller!phoneMenuEntered | hide $voiceMsg; dismiss $voice
menu entered, no bar     | nobar; phone.siriActive=true | controller!phoneMenuEntered | dismiss $voice
bar hides                | phone.siriActive=true | bar=0 | popup $voice

contacts started again   | $contacts=1         | $contacts=2 | transient $pbInitiated
contacts complete        | $contacts=2         | $contacts=1 | hide $pbInitiated; transient PhonebookDownloadComplete
contacts complete, 2     | $contacts=2; context=2 | $contacts=1 | hide $pbInitiated; popup PhoneBookDownloadComplete
contacts complete, 6     | $contacts=2; context=6 | $contacts=1 | hide $pbInitiated; popup PhoneBookDownloadComplete
contacts, phone gone     | $contacts=2; bluetooth.deviceConnected=false | $contacts=1 | hide $pbInitiated
contacts stopped         | $contacts=2         | $contacts=3 | hide $pbInitiated
)";

const char *const names[][2] = {
        {"$call", "phone.callConnected=true"},
        {"$battery", "phone.lowBatteryNotification"},
        {"$lost", "phone!nonUserDeviceDisconnectReceived"},
        {"$door", "phone!phoneDriverDoorOpenLinkLossReconnectFailedReceived"},
        {"$standby", "PhoneCallStandByModePopup"},
        {"$extended", "phone.status=12; phone.extendedModeTimerValue"},
        {"$mode", "phone!currentExtendedModeChanged"},
        {"$private", "phone.togglePrivacyMode()"},
        {"$shutdown", "global.sendDisplayOnlyModeBeginShutdownRequest()"},
        {"$cleared", "phone.setPhoneCallStandByMode(false)"},
        {"$voiceMsg", "PhoneVoiceServiceActivatedTransientMsg"},
        {"$voice", "PhoneVoiceServiceActivatedPopup"},
        {"$contacts", "phone.phoneBookStatus"},
        {"$pbInitiated", "PhonebookDownloadInitiated"},
};

class TestConnection : public GlobalSuite
{
    Q_OBJECT

private slots:
    void reactions_data();
    void reactions();

private:
    void play(const QString &step);

    QStringList m_outputs;
    qint64 m_start = 0; // the virtual time the row's steps began
    qint64 m_minute = 0; // the last minute marked in the outputs
};

void TestConnection::reactions_data()
{
    QTest::addColumn<QStringList>("setup");
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QStringList>("outputs");
    const QRegularExpression separator(QStringLiteral("\\s*;\\s*"));
    for (QString line :
         QString::fromUtf8(reactionTable).split(QLatin1Char('\n'), Qt::SkipEmptyParts)) {
        for (const auto &name : names)
            line.replace(QLatin1String(name[0]), QLatin1String(name[1]));
        const QStringList cells = line.split(QLatin1Char('|'));
        QTest::newRow(qPrintable(cells.at(0).trimmed()))
                << cells.at(1).trimmed().split(separator, Qt::SkipEmptyParts)
                << cells.at(2).trimmed().split(separator, Qt::SkipEmptyParts)
                << cells.at(3).trimmed().split(separator, Qt::SkipEmptyParts);
    }
}

void TestConnection::reactions()
{
    QFETCH(QStringList, setup);
    QFETCH(QStringList, steps);
    QFETCH(QStringList, outputs);
    if (setup.removeAll(QStringLiteral("nobar")))
        Brisken::DataStore::remove(QStringLiteral("StatusBarController"));
    QVERIFY(m_hmi->run());
    for (const QString &step : setup)
        play(step);
    m_outputs.clear();
    m_start = Simulator::VirtualEventDispatcher::instance()->now();
    m_minute = 0;
    for (const QString &step : steps)
        play(step);
    QCOMPARE(m_outputs, outputs);
}

void TestConnection::play(const QString &step)
{
    auto *clock = Simulator::VirtualEventDispatcher::instance();
    const qint64 since = GlobalHmi::mark();
    const QString value = step.section(QLatin1Char('='), 1);
    if (step.startsWith(QLatin1Char('+'))) {
        for (int minute = 0; minute < step.toInt(); ++minute)
            play(QStringLiteral("tick"));
        return;
    } else if (step == QLatin1String("tick")) {
        clock->advance(60000);
    } else if (step.startsWith(QLatin1String("bar="))) {
        Brisken::DataStore::get<Brisken::StatusBarController>(QStringLiteral("StatusBarController"))
                ->setStatusBarVisible(value == QLatin1String("1"));
    } else if (step.startsWith(QLatin1String("context="))) {
        Brisken::DataStore::get<Brisken::ViewManager>(QStringLiteral("ViewManager"))
                ->setDisplayContext(value.toInt());
    } else if (step.startsWith(QLatin1String("view "))) {
        auto *machine = Quorvel::StateMachine::instance();
        machine->goToState(new Quorvel::HmiViewState(step.mid(5), machine->screensState()));
    } else {
        m_hmi->apply(step);
    }
    TestSupport::processUntilIdle();

    QStringList outputs = TestSupport::journalLines(
            since,
            {QStringLiteral("popup-request"), QStringLiteral("popup-dismiss"),
             QStringLiteral("transient"), QStringLiteral("transient-hide"),
             QStringLiteral("intent"), QStringLiteral("bridge")});
    const qint64 minute = (clock->now() - m_start) / 60000;
    if (!outputs.isEmpty() && minute != m_minute)
        m_outputs.append(QLatin1Char('@') + QString::number(m_minute = minute));
    m_outputs += outputs.replaceInStrings(QStringLiteral("popup-request PHONE."),
                                          QStringLiteral("popup "))
                         .replaceInStrings(QStringLiteral("popup-dismiss PHONE."),
                                           QStringLiteral("dismiss "))
                         .replaceInStrings(QStringLiteral("transient-hide "),
                                           QStringLiteral("hide "));
}

int main(int argc, char *argv[])
{
    QCoreApplication::setEventDispatcher(new Simulator::VirtualEventDispatcher);
    QCoreApplication app(argc, argv);
    TestConnection test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_connection.moc"
