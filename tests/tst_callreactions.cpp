// The phone's reactions to calls wherever the driver is in the HMI, seen as the HMI sees them:
// popups, transients, events and commands to the phone.

#include "globalhmi.h"
#include "hmiphoneevents.h"

#include <brisken/statusbarcontroller.h>
#include <mavrosk/eaphonesource.h>
#include <mavrosk/keysource.h>
#include <mavrosk/projectionsource.h>
#include <mavrosk/speechsource.h>

using namespace HmiPhone;
using Outputs = QStringList;

class TestCallReactions : public GlobalSuite
{
    Q_OBJECT

private slots:

    void incomingCall_data();
    void incomingCall();
    void answer_data();
    void answer();
    void waitingCall();
    void ringingEnds_data();
    void ringingEnds();
    void missedCall_data();
    void missedCall();
    void dialingFailures_data();
    void dialingFailures();
    void callEnded_data();
    void callEnded();
    void roamingConfirmation_data();
    void roamingConfirmation();
    void incomingCallRoadThroughThePlugin();
    void keys_data();
    void keys();

private:
    Mavrosk::PhoneSource *phone() const { return GlobalHmi::phone(); }
};

void TestCallReactions::incomingCall_data()
{
    QTest::addColumn<bool>("doNotDisturb");
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("twoCalls");
    QTest::addColumn<bool>("readingAloud");
    QTest::addColumn<QString>("screen"); // an event posted before the call: the screen shown
    QTest::addColumn<Outputs>("outputs");

    const QString incoming = QStringLiteral("popup-request IncomingCall");
    const QString reject = QStringLiteral("bridge phone.rejectIncomingCall");
    const QString home;
    QTest::addRow("idle") << false << 0 << false << false << home << Outputs{incoming};
    QTest::addRow("message read aloud")
            << false << 0 << false << true << home
            << Outputs{QStringLiteral("bridge phone.stopTextMessagePlayback"), incoming};
    QTest::addRow("during a call, message read aloud")
            << false << 7 << false << true << home
            << Outputs{QStringLiteral("popup-request WaitingCall")};
    QTest::addRow("two calls connected") << false << 9 << true << false << home << Outputs{reject};
    QTest::addRow("status 11") << false << 11 << false << false << home << Outputs{reject};
    // Under do-not-disturb the call is refused at once, whatever is on screen.
    const char *const screens[][2] = {{"home", ""},
                                      {"phone menu", "HmiPhone_RootStateRequest"},
                                      {"contacts", "HmiPhone_ShowContactsRequest"},
                                      {"status alerts", "HmiPhone_ShowStatusBarAlertsRequest"}};
    for (const auto &screen : screens)
        QTest::addRow("do not disturb, %s", screen[0])
                << true << 0 << false << false << QString::fromLatin1(screen[1]) << Outputs{reject};
    QTest::addRow("do not disturb, call screen")
            << true << 7 << false << false << home << Outputs{reject};
}

void TestCallReactions::incomingCall()
{
    QFETCH(bool, doNotDisturb);
    QFETCH(int, status);
    QFETCH(bool, twoCalls);
    QFETCH(bool, readingAloud);
    QFETCH(QString, screen);
    QFETCH(Outputs, outputs);
    phone()->setDoNotDisturb(doNotDisturb);
    phone()->setStatus(status);
    phone()->setCallConnected(status >= 7);
    phone()->setMultipleCallsConnected(twoCalls);
    Mavrosk::SpeechSource::instance()->setTtsSessionActive(readingAloud);
    QVERIFY(m_hmi->run());
    if (!screen.isEmpty())
        GlobalHmi::post(screen);

    const qint64 since = GlobalHmi::mark();
    m_hmi->apply("phone.incomingCall=true"_q);
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);
    QCOMPARE(GlobalHmi::isOpen(QStringLiteral("IncomingCall")),
             outputs.endsWith(QStringLiteral("popup-request IncomingCall")));
    QCOMPARE(GlobalHmi::isOpen(QStringLiteral("WaitingCall")),
             outputs.endsWith(QStringLiteral("popup-request WaitingCall")));
}

void TestCallReactions::answer_data()
{
    QTest::addColumn<QString>("event");
    QTest::addColumn<Outputs>("outputs");

    QTest::addRow("accepted") << QString(Events::HmiPhone_AcceptIncomingCall)
                              << Outputs{QStringLiteral("popup-dismiss IncomingCall"),
                                         QStringLiteral("bridge phone.acceptIncomingCall"),
                                         QStringLiteral("transient PhoneAcceptedIncomingCall")};
    const Outputs rejected{QStringLiteral("popup-dismiss IncomingCall"),
                           QStringLiteral("bridge phone.rejectIncomingCall"),
                           QStringLiteral("transient PhoneRejectedIncomingCall")};
    QTest::addRow("rejected") << QString(Events::HmiPhone_RejectIncomingCall) << rejected;
    QTest::addRow("caller hung up") << "phone!phoneIncomingCallRemoteRejection"_q << rejected;
    // Switched on while the call rings: refused as a call ringing under it, and its popup closed
    // at once, since the call keys no longer answer it (see keys()).
    QTest::addRow("do not disturb switched on")
            << "phone.doNotDisturb=true"_q
            << Outputs{QStringLiteral("popup-dismiss IncomingCall"),
                       QStringLiteral("popup-dismiss WaitingCall"),
                       QStringLiteral("bridge phone.rejectIncomingCall")};
}

void TestCallReactions::answer()
{
    QFETCH(QString, event);
    QFETCH(Outputs, outputs);
    QVERIFY(m_hmi->run());
    m_hmi->apply("phone.incomingCall=true"_q);
    QVERIFY(GlobalHmi::isOpen(QStringLiteral("IncomingCall")));

    qint64 since = GlobalHmi::mark();
    if (event.contains(QRegularExpression(QStringLiteral("[.!]"))))
        m_hmi->apply(event);
    else
        since = GlobalHmi::post(event);
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("IncomingCall")));
}

void TestCallReactions::waitingCall()
{
    phone()->setStatus(7);
    phone()->setCallConnected(true);
    QVERIFY(m_hmi->run());
    m_hmi->apply("phone.incomingCall=true"_q);
    QVERIFY(GlobalHmi::isOpen(QStringLiteral("WaitingCall")));

    // Accepted once: a second accept finds nothing ringing.
    qint64 since = GlobalHmi::mark();
    GlobalHmi::post(Events::HmiPhone_AcceptWaitingCall);
    GlobalHmi::post(Events::HmiPhone_AcceptWaitingCall);
    QCOMPARE(GlobalHmi::outputsSince(since).filter(QStringLiteral("bridge")),
             Outputs{QStringLiteral("bridge phone.acceptIncomingCall")});

    // The phone fails to take it: the waiting-call popup gives way to the failure.
    m_hmi->apply("phone!phoneCallAcceptingFailed"_q);
    QVERIFY(GlobalHmi::isOpen(QStringLiteral("CallAnswerNotResponding")));
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("WaitingCall")));

    // A further waiting call whose caller hangs up.
    phone()->setIncomingCall(false);
    m_hmi->apply("phone.incomingCall=true"_q);
    QVERIFY(GlobalHmi::isOpen(QStringLiteral("WaitingCall")));
    m_hmi->apply("phone!phoneWaitingCallRemoteRejection"_q);
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("WaitingCall")));
}

void TestCallReactions::ringingEnds_data()
{
    QTest::addColumn<bool>("duringCall");
    QTest::addColumn<bool>("connectionFirst"); // the call connects (or the connected one ends)

    QTest::addRow("answered on the handset, connected first") << false << true;
    QTest::addRow("answered on the handset, ringing ended first") << false << false;
    QTest::addRow("waiting call ends") << true << false;
    QTest::addRow("connected call ends, then the waiting call") << true << true;
}

// However the ringing ends, and in whichever order the phone reports it, no call popup stays.
void TestCallReactions::ringingEnds()
{
    QFETCH(bool, duringCall);
    QFETCH(bool, connectionFirst);
    phone()->setCallConnected(duringCall);
    QVERIFY(m_hmi->run());
    m_hmi->apply("phone.incomingCall=true"_q);
    QVERIFY(GlobalHmi::isOpen(duringCall ? QStringLiteral("WaitingCall")
                                         : QStringLiteral("IncomingCall")));

    for (const bool connectionNow : {connectionFirst, !connectionFirst})
        m_hmi->apply(connectionNow ? QStringLiteral("phone.callConnected=")
                                     + QLatin1String(duringCall ? "false" : "true")
                                   : "phone.incomingCall=false"_q);
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("IncomingCall")));
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("WaitingCall")));
}

void TestCallReactions::missedCall_data()
{
    QTest::addColumn<int>("projectionMode");
    QTest::addColumn<bool>("rendering");
    QTest::addColumn<int>("recentCallListType");
    QTest::addColumn<bool>("popup");
    QTest::addColumn<bool>("listRequested");

    QTest::addRow("all calls list") << 0 << false << 0 << true << true;
    QTest::addRow("missed calls list") << 0 << false << 3 << true << true;
    QTest::addRow("dialled calls list") << 0 << false << 1 << true << false;
    QTest::addRow("projection rendering") << 1 << true << 0 << false << false;
    QTest::addRow("projection not rendering") << 1 << false << 0 << true << true;
}

void TestCallReactions::missedCall()
{
    QFETCH(int, projectionMode);
    QFETCH(bool, rendering);
    QFETCH(int, recentCallListType);
    QFETCH(bool, popup);
    QFETCH(bool, listRequested);
    Mavrosk::ProjectionSource::instance()->setProjectionMode(projectionMode);
    Mavrosk::ProjectionSource::instance()->setIsRendering(rendering);
    phone()->setCurrentRecentCallListType(recentCallListType);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::mark();
    m_hmi->apply("phone!missedCallsPresent"_q);
    const Outputs missed{QStringLiteral("popup-dismiss IncomingCall"),
                         QStringLiteral("popup-request MissedCallPopup")};
    QCOMPARE(GlobalHmi::outputsSince(since), popup ? missed : Outputs());
    QCOMPARE(GlobalHmi::isOpen(QStringLiteral("MissedCallPopup")), popup);

    // Leaving the popup asks the recent-calls list for the calls just missed.
    const qint64 closed = GlobalHmi::mark();
    Brisken::ViewController::instance()->dismissPopup(QStringLiteral("PHONE.MissedCallPopup"));
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(closed).contains(
                     QStringLiteral("event HmiPhone_RequestRecentCallList")),
             listRequested);
}

void TestCallReactions::dialingFailures_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<QList<int>>("kinds");
    QTest::addColumn<Outputs>("popups");

    const QString failed = QStringLiteral("popup-request DialingFailed");
    const QString third = QStringLiteral("popup-request Dialing3rdFailure");
    QTest::addRow("1, 2, 3rd, then again")
            << 3 << QList<int>{1, 1, 1, 1} << Outputs{failed, failed, third, failed};
    QTest::addRow("no signal does not count")
            << 0 << QList<int>{1, 0, 1, 1}
            << Outputs{failed, QStringLiteral("popup-request NoCellularSignal"), failed, third};
    QTest::addRow("call connected") << 7 << QList<int>{1} << Outputs();
    QTest::addRow("unknown kind") << 3 << QList<int>{2} << Outputs();
}

void TestCallReactions::dialingFailures()
{
    QFETCH(int, status);
    QFETCH(QList<int>, kinds);
    QFETCH(Outputs, popups);
    phone()->setStatus(status);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::mark();
    for (int kind : kinds)
        emit phone()->phoneDialingFailed(kind);
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(since), popups);

    // A call getting through clears a failure still shown.
    phone()->setStatus(3);
    m_hmi->apply("phone.status=7"_q);
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("DialingFailed")));
}

void TestCallReactions::callEnded_data()
{
    QTest::addColumn<int>("statusBar"); // 0 none, 1 hidden, 2 visible
    QTest::addColumn<Outputs>("outputs");

    const QString hideDialing = QStringLiteral("transient-hide PhoneOutgoingDialing");
    QTest::addRow("status bar visible")
            << 2 << Outputs{hideDialing, QStringLiteral("transient PhoneCallEnded")};
    QTest::addRow("status bar hidden")
            << 1 << Outputs{hideDialing, QStringLiteral("popup-request CallEnded")};
    QTest::addRow("no status bar") << 0 << Outputs{QStringLiteral("popup-request CallEnded")};
}

void TestCallReactions::callEnded()
{
    QFETCH(int, statusBar);
    QFETCH(Outputs, outputs);
    if (statusBar == 0)
        Brisken::DataStore::remove(QStringLiteral("StatusBarController"));
    else
        Brisken::DataStore::get<Brisken::StatusBarController>(QStringLiteral("StatusBarController"))
                ->setStatusBarVisible(statusBar == 2);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::mark();
    m_hmi->apply("phone!multipartyActiveCallEnded"_q);
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);

    // Confirming closes the popup; a confirmation without the popup does nothing.
    const qint64 confirmed = GlobalHmi::mark();
    GlobalHmi::post(Events::HmiPhone_CallEndConfirmed);
    GlobalHmi::post(Events::HmiPhone_CallEndConfirmed);
    QCOMPARE(GlobalHmi::outputsSince(confirmed).count(QStringLiteral("popup-dismiss CallEnded")),
             statusBar == 2 ? 0 : 1);
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("CallEnded")));
}

void TestCallReactions::roamingConfirmation_data()
{
    QTest::addColumn<bool>("fromRecentCalls");
    QTest::addColumn<QString>("command"); // the first thing the confirmation does

    QTest::addRow("entered number") << false << QStringLiteral("phone.dialNumber(0123456)");
    QTest::addRow("recent calls list") << true << QStringLiteral("phone.dialRecentCall(2,5)");
}

void TestCallReactions::roamingConfirmation()
{
    QFETCH(bool, fromRecentCalls);
    QFETCH(QString, command);
    phone()->setCallNumberEntered(QStringLiteral("0123456"));
    phone()->setOutboundRoamingCallIsFromRecentList(fromRecentCalls);
    phone()->setOutboundRoamingRecentCallType(2);
    phone()->setOutboundRoamingRecentCallIndex(5);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::post(Events::HmiPhone_ConfirmRoamingCall);
    QCOMPARE(TestSupport::journalLines(since).value(0), command);
    QVERIFY(!phone()->outboundRoamingCallIsFromRecentList());
}

// The whole road through the built plug-in file: ringing, accepted from the popup's view, the
// call screen once the phone reports the call, and one step back when it ends.
void TestCallReactions::incomingCallRoadThroughThePlugin()
{
    QVERIFY(m_hmi->run(QStringLiteral(HMIPHONE_PLUGIN_FILE)));
    m_hmi->apply("phone.incomingCall=true"_q);
    QVERIFY(GlobalHmi::isOpen(QStringLiteral("IncomingCall")));

    QObject *controller = nullptr;
    for (QObject *child : m_hmi->host().integration()->children()) {
        if (qstrcmp(child->metaObject()->className(), "HmiPhone::HmiPhoneController") == 0)
            controller = child;
    }
    QVERIFY(controller);
    qint64 since = GlobalHmi::mark();
    QVERIFY(QMetaObject::invokeMethod(controller, "acceptIncomingCall"));
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(since),
             (Outputs{QStringLiteral("event HmiPhone_AcceptIncomingCall"),
                      QStringLiteral("popup-dismiss IncomingCall"),
                      QStringLiteral("bridge phone.acceptIncomingCall"),
                      QStringLiteral("transient PhoneAcceptedIncomingCall")}));
    QVERIFY(!GlobalHmi::isOpen(QStringLiteral("IncomingCall")));

    phone()->setCallConnected(true);
    phone()->setIncomingCall(false);
    m_hmi->apply("phone.status=7"_q);
    QCOMPARE(Brisken::ViewController::instance()->activeView(),
             QStringLiteral("PHONE.CallInProgress"));

    since = GlobalHmi::mark();
    phone()->setCallConnected(false);
    m_hmi->apply("phone.status=0"_q);
    QCOMPARE(TestSupport::journalValues(QStringLiteral("back"), QStringLiteral("steps"), since),
             QStringList{QStringLiteral("1")});
    QCOMPARE(Brisken::ViewController::instance()->activeView(), QStringLiteral("HOST.Home"));
}

namespace {

// The last four: no call, in call status 1, 2, 11 and 12.
enum Situation {
    Idle,
    Ringing,
    Waiting,
    OneCall,
    TwoCalls,
    Dialling,
    Status1,
    Status2,
    Status11,
    Status12
};
// Covered: another popup comes up over the call popup before the key.
enum Condition {
    Private = 1,
    Blocked = 2,
    Projection = 4,
    Rendering = 8,
    DoNotDisturb = 16,
    Covered = 32,
    DoNotDisturbLater = 64 // switched on while the call rings
};

} // namespace

// What each phone key does in each call situation, as the HMI and the phone see it. Every output
// a key leads to is listed, so a key reaching the wrong slot, or two slots, shows.
void TestCallReactions::keys_data()
{
    QTest::addColumn<int>("situation");
    QTest::addColumn<int>("conditions");
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("kind");
    QTest::addColumn<Outputs>("outputs");

    const auto row = [](const char *tag, Situation situation, int conditions, int key, int kind,
                        const Outputs &outputs) {
        QTest::newRow(tag) << int(situation) << conditions << key << kind << outputs;
    };
    const auto out = [](const char *line) { return QString::fromLatin1(line); };
    const auto hardKey = [&](const char *call) { return Outputs{out("hardkey ") + out(call)}; };
    const Outputs accepted{out("popup-dismiss IncomingCall"),
                           out("bridge phone.acceptIncomingCall"),
                           out("transient PhoneAcceptedIncomingCall")};
    const Outputs rejected{out("popup-dismiss IncomingCall"),
                           out("bridge phone.rejectIncomingCall"),
                           out("transient PhoneRejectedIncomingCall")};
    const Outputs acceptEvent = Outputs{out("event HmiPhone_AcceptIncomingCall")} + accepted;
    const Outputs rejectEvent = Outputs{out("event HmiPhone_RejectIncomingCall")} + rejected;
    const Outputs acceptWaiting = Outputs{out("event HmiPhone_AcceptWaitingCall")} + accepted;
    const Outputs rejectWaiting = Outputs{out("event HmiPhone_RejectWaitingCall")} + rejected;
    const Outputs closeIncoming{out("popup-dismiss IncomingCall")};
    const Outputs closeWaiting{out("popup-dismiss WaitingCall")};
    // Entering the phone menu also takes the voice-service message away.
    const Outputs phoneMenu{out("bridge phone.checkPhoneStatus"), out("view PhoneMenu"),
                            out("transient-hide PhoneVoiceServiceActivatedTransientMsg"),
                            out("popup-dismiss PhoneVoiceServiceActivatedPopup")};
    const Outputs phoneSection = Outputs{out("view-request Root")} + phoneMenu;
    const Outputs endCall{out("bridge phone.endCall")};
    const Outputs swapCall{out("bridge phone.swapCall")};

    // clang-format off
    row("idle: phone key opens the phone", Idle, 0, 12, 2, phoneMenu);
    row("idle: phone key press", Idle, 0, 12, 1, {});
    row("idle: phone key long", Idle, 0, 12, 3, {});
    row("idle: 77 seeks left", Idle, 0, 77, 1, hardKey("processCombinedSeekLeftKey"));
    row("idle: 78 seeks right", Idle, 0, 78, 1, hardKey("processCombinedSeekRightKey"));
    row("idle: send", Idle, 0, 49, 1, {});
    row("idle: end opens the phone", Idle, 0, 50, 1, phoneSection);
    row("idle: end 80 opens the phone", Idle, 0, 80, 1, phoneSection);
    row("idle: 90 short", Idle, 0, 90, 2, hardKey("processSWCSeekDownShortPress"));
    row("idle: 91 short", Idle, 0, 91, 2, hardKey("processSWCSeekUpShortPress"));
    row("idle: 90 long", Idle, 0, 90, 3, hardKey("processSWCSeekDownLongPress"));
    row("idle: 90 release", Idle, 0, 90, 4, hardKey("processSWCSeekDownLongRelease"));
    row("idle: 91 long", Idle, 0, 91, 3, hardKey("processSWCSeekUpLongPress"));
    row("idle: 91 release", Idle, 0, 91, 4, hardKey("processSWCSeekUpLongRelease"));
    row("idle: 90 press", Idle, 0, 90, 1, {});
    row("idle: unknown key", Idle, 0, 13, 2, {});
    row("idle: unknown kind", Idle, 0, 77, 9, {});
    row("idle, projection: phone key", Idle, Projection, 12, 2, {});
    row("idle, projection: 77", Idle, Projection, 77, 1, {});
    row("idle, projection: 91 release", Idle, Projection, 91, 4, {});
    for (const auto &[key, kind] :
         {std::pair{78, 1}, {50, 1}, {80, 1}, {90, 2}, {91, 2}, {90, 3}, {90, 4}, {91, 3}})
        QTest::addRow("idle, projection: %d/%d", key, kind) << int(Idle) << int(Projection) << key << kind << Outputs();
    row("two calls, projection: send 79", TwoCalls, Projection, 79, 1, {});
    row("idle, blocked: 77", Idle, Blocked, 77, 1, {});
    row("idle, blocked: end", Idle, Blocked, 50, 1, {});
    row("idle, blocked: 90 long", Idle, Blocked, 90, 3, hardKey("processSWCSeekDownLongPress"));
    row("idle, blocked: 90 short", Idle, Blocked, 90, 2, {});
    row("idle, blocked: 91 short", Idle, Blocked, 91, 2, {});
    row("ringing: phone key accepts", Ringing, 0, 12, 2, accepted + closeIncoming);
    row("ringing: phone key long rejects", Ringing, 0, 12, 3, rejected + closeIncoming);
    row("ringing: 77", Ringing, 0, 77, 1, acceptEvent);
    row("ringing: 78", Ringing, 0, 78, 1, rejectEvent);
    row("ringing: send 79", Ringing, 0, 79, 1, acceptEvent);
    row("ringing: end 50", Ringing, 0, 50, 1, rejectEvent);
    row("ringing: 90 short", Ringing, 0, 90, 2, acceptEvent);
    row("ringing: 91 short", Ringing, 0, 91, 2, rejectEvent);
    row("ringing, projection: phone key", Ringing, Projection, 12, 2, {});
    row("ringing, projection: phone key long", Ringing, Projection, 12, 3, {});
    row("ringing, rendering: phone key", Ringing, Rendering, 12, 2, accepted + closeIncoming);
    row("ringing, rendering: send", Ringing, Rendering, 49, 1, {});
    row("ringing, do not disturb: phone key", Ringing, DoNotDisturb, 12, 2, {});
    // Under do-not-disturb the call was refused at once: the call keys do what they do without
    // a ringing call, though the phone still reports it.
    row("ringing, do not disturb: 77 seeks", Ringing, DoNotDisturb, 77, 1, hardKey("processCombinedSeekLeftKey"));
    row("ringing, do not disturb: 78 seeks", Ringing, DoNotDisturb, 78, 1, hardKey("processCombinedSeekRightKey"));
    row("ringing, do not disturb: send", Ringing, DoNotDisturb, 49, 1, {});
    row("ringing, do not disturb: send 79", Ringing, DoNotDisturb, 79, 1, {});
    row("ringing, do not disturb: end", Ringing, DoNotDisturb, 50, 1, phoneSection);
    row("ringing, do not disturb: 90 seeks", Ringing, DoNotDisturb, 90, 2, hardKey("processSWCSeekDownShortPress"));
    row("ringing, do not disturb: 91 seeks", Ringing, DoNotDisturb, 91, 2, hardKey("processSWCSeekUpShortPress"));
    row("ringing, switched to do not disturb: 90 seeks", Ringing, DoNotDisturbLater, 90, 2, hardKey("processSWCSeekDownShortPress"));
    row("ringing, switched to do not disturb: 80", Ringing, DoNotDisturbLater, 80, 1, phoneSection);
    row("waiting, do not disturb: 77", Waiting, DoNotDisturb, 77, 1, {});
    row("waiting, do not disturb: 78 ends the call", Waiting, DoNotDisturb, 78, 1, endCall);
    row("ringing, blocked: 90 short", Ringing, Blocked, 90, 2, {});
    row("ringing, blocked: 91 short", Ringing, Blocked, 91, 2, {});
    row("ringing, blocked: 77", Ringing, Blocked, 77, 1, {});
    row("ringing, blocked: phone key", Ringing, Blocked, 12, 2, accepted + closeIncoming);
    row("waiting: phone key accepts", Waiting, 0, 12, 2, accepted + closeWaiting);
    row("waiting: phone key long rejects", Waiting, 0, 12, 3, rejected + closeWaiting);
    row("waiting: 77", Waiting, 0, 77, 1, acceptWaiting);
    row("waiting: 77 short", Waiting, 0, 77, 2, closeWaiting);
    row("waiting: 78 rejects, then closes", Waiting, 0, 78, 1, rejectWaiting + closeWaiting);
    row("waiting: 78 short", Waiting, 0, 78, 2, {});
    row("waiting: send", Waiting, 0, 49, 1, acceptWaiting);
    row("waiting: send 79 short", Waiting, 0, 79, 2, closeWaiting);
    row("waiting: end 80", Waiting, 0, 80, 1, rejectWaiting);
    row("waiting: end short", Waiting, 0, 50, 2, closeWaiting);
    row("waiting: end 80 short", Waiting, 0, 80, 2, closeWaiting);
    row("waiting: 90 accepts, then closes", Waiting, 0, 90, 2, acceptWaiting + closeWaiting);
    row("waiting: 91 short", Waiting, 0, 91, 2, rejected + closeWaiting + rejectEvent);
    row("waiting, rendering: send short", Waiting, Rendering, 49, 2, closeWaiting);
    row("waiting, rendering: 77", Waiting, Rendering, 77, 1, {});
    row("waiting, covered: phone key", Waiting, Covered, 12, 2, accepted + closeWaiting);
    row("waiting, covered: 78", Waiting, Covered, 78, 1, rejectWaiting + closeWaiting);
    row("waiting, blocked: end", Waiting, Blocked, 50, 1, {});
    row("one call: phone key", OneCall, 0, 12, 2, {});
    row("one call: phone key long ends", OneCall, 0, 12, 3, endCall);
    row("one call: 77", OneCall, 0, 77, 1, {});
    row("one call: send", OneCall, 0, 49, 1, {});
    row("one call: 78", OneCall, 0, 78, 1, endCall);
    row("one call: end", OneCall, 0, 50, 1, endCall);
    row("one call: 90 short", OneCall, 0, 90, 2, {});
    row("one call: 91 short", OneCall, 0, 91, 2, endCall);
    row("one call: 90 long", OneCall, 0, 90, 3, {});
    row("one call: 91 long", OneCall, 0, 91, 3, endCall);
    row("one call: 91 release", OneCall, 0, 91, 4, {});
    row("one call, private: phone key long", OneCall, Private, 12, 3, {});
    row("one call, private: 77", OneCall, Private, 77, 1, hardKey("processCombinedSeekLeftKey"));
    row("one call, private: 78", OneCall, Private, 78, 1, hardKey("processCombinedSeekRightKey"));
    row("one call, private: end", OneCall, Private, 80, 1, {});
    row("one call, private: 90 short", OneCall, Private, 90, 2, hardKey("processSWCSeekDownShortPress"));
    row("one call, private: 91 long", OneCall, Private, 91, 3, hardKey("processSWCSeekUpLongPress"));
    row("one call, private: 91 short", OneCall, Private, 91, 2, hardKey("processSWCSeekUpShortPress"));
    row("one call, private: 90 release", OneCall, Private, 90, 4, hardKey("processSWCSeekDownLongRelease"));
    row("one call, blocked: phone key long", OneCall, Blocked, 12, 3, {});
    row("one call, blocked: 78", OneCall, Blocked, 78, 1, {});
    row("one call, blocked: 91 long", OneCall, Blocked, 91, 3, endCall);
    row("one call, projection: phone key long", OneCall, Projection, 12, 3, {});
    row("two calls: phone key swaps", TwoCalls, 0, 12, 2, swapCall);
    row("two calls: 77", TwoCalls, 0, 77, 1, swapCall);
    row("two calls: send 79", TwoCalls, 0, 79, 1, swapCall);
    row("two calls: 90 short", TwoCalls, 0, 90, 2, swapCall);
    row("two calls: end", TwoCalls, 0, 50, 1, endCall);
    row("two calls, private: phone key", TwoCalls, Private, 12, 2, {});
    row("two calls, private: send", TwoCalls, Private, 49, 1, {});
    row("two calls, blocked: phone key", TwoCalls, Blocked, 12, 2, swapCall);
    row("two calls, blocked: send", TwoCalls, Blocked, 49, 1, {});
    row("dialling: phone key long", Dialling, 0, 12, 3, endCall);
    row("dialling: 77", Dialling, 0, 77, 1, hardKey("processCombinedSeekLeftKey"));
    row("dialling: 78", Dialling, 0, 78, 1, endCall);
    row("dialling: end 80", Dialling, 0, 80, 1, endCall);
    row("dialling: 91 short", Dialling, 0, 91, 2, endCall);
    row("dialling: 90 release", Dialling, 0, 90, 4, {});
    // The end key opens the phone in status 0 only; the phone keeps long presses in 3 to 11.
    row("status 1: end", Status1, 0, 50, 1, {});
    row("status 2: end 80", Status2, 0, 80, 1, {});
    row("status 12: end", Status12, 0, 50, 1, {});
    row("status 2: 90 long", Status2, 0, 90, 3, hardKey("processSWCSeekDownLongPress"));
    row("status 11: 90 long", Status11, 0, 90, 3, {});
    row("status 11: 91 release", Status11, 0, 91, 4, {});
    row("status 12: 90 long", Status12, 0, 90, 3, hardKey("processSWCSeekDownLongPress"));
    row("status 12: 91 release", Status12, 0, 91, 4, hardKey("processSWCSeekUpLongRelease"));
    // clang-format on
}

void TestCallReactions::keys()
{
    QFETCH(int, situation);
    QFETCH(int, conditions);
    QFETCH(int, key);
    QFETCH(int, kind);
    QFETCH(Outputs, outputs);
    const int status[] = {0, 0, 7, 7, 9, 3, 1, 2, 11, 12};
    phone()->setStatus(status[situation]);
    phone()->setCallConnected(situation >= Waiting && situation <= TwoCalls);
    phone()->setMultipleCallsConnected(situation == TwoCalls);
    phone()->setDialingInProgress(situation == Dialling);
    phone()->setPrivateMode(conditions & Private);
    phone()->setDoNotDisturb(conditions & DoNotDisturb);
    Mavrosk::EAPhoneSource::instance()->setEventsBlocked(conditions & Blocked);
    Mavrosk::ProjectionSource::instance()->setProjectionMode(
            conditions & (Projection | Rendering) ? 1 : 0);
    Mavrosk::ProjectionSource::instance()->setIsRendering(conditions & Rendering);
    QVERIFY(m_hmi->run());
    if (situation == Ringing || situation == Waiting) {
        m_hmi->apply("phone.incomingCall=true"_q);
    }
    if (conditions & DoNotDisturbLater)
        m_hmi->apply(QStringLiteral("phone.doNotDisturb=true"));
    if (conditions & Covered) {
        m_hmi->apply("phone!phoneRoamingModeReceived"_q);
        QVERIFY(GlobalHmi::isOpen(QStringLiteral("RoamingWarning")));
    }

    const qint64 since = GlobalHmi::mark();
    Mavrosk::KeySource::instance()->sendKeyEvent(key, kind);
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);
}

QTEST_GUILESS_MAIN(TestCallReactions)
#include "tst_callreactions.moc"
