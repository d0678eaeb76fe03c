// The phone's reactions to calls wherever the driver is in the HMI, seen as the HMI sees them:
// popups, transients, events and commands to the phone.

#include "globalhmi.h"
#include "hmiphoneevents.h"

#include <brisken/statusbarcontroller.h>
#include <mavrosk/projectionsource.h>
#include <mavrosk/speechsource.h>

using namespace HmiPhone;
using Outputs = QStringList;

class TestCallReactions : public QObject
{
    Q_OBJECT

private slots:
    void init() { m_hmi = std::make_unique<GlobalHmi>(); }
    void cleanup();

    void incomingCall_data();
    void incomingCall();
    void answer_data();
    void answer();
    void waitingCall();
    void missedCall_data();
    void missedCall();
    void dialingFailures_data();
    void dialingFailures();
    void callEnded_data();
    void callEnded();
    void roamingConfirmation_data();
    void roamingConfirmation();
    void incomingCallRoadThroughThePlugin();

private:
    Mavrosk::PhoneSource *phone() const { return GlobalHmi::phone(); }

    std::unique_ptr<GlobalHmi> m_hmi;
    TestSupport::FrameworkWarningGuard m_guard;
};

void TestCallReactions::cleanup()
{
    m_hmi.reset();
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

void TestCallReactions::incomingCall_data()
{
    QTest::addColumn<bool>("doNotDisturb");
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("twoCalls");
    QTest::addColumn<bool>("readingAloud");
    QTest::addColumn<Outputs>("outputs");

    const QString incoming = QStringLiteral("popup-request IncomingCall");
    const QString reject = QStringLiteral("bridge phone.rejectIncomingCall");
    QTest::addRow("idle") << false << 0 << false << false << Outputs{incoming};
    QTest::addRow("message read aloud")
            << false << 0 << false << true
            << Outputs{QStringLiteral("bridge phone.stopTextMessagePlayback"), incoming};
    QTest::addRow("during a call, message read aloud")
            << false << 7 << false << true << Outputs{QStringLiteral("popup-request WaitingCall")};
    QTest::addRow("two calls connected") << false << 9 << true << false << Outputs{reject};
    QTest::addRow("status 11") << false << 11 << false << false << Outputs{reject};
    QTest::addRow("do not disturb") << true << 0 << false << false << Outputs();
}

void TestCallReactions::incomingCall()
{
    QFETCH(bool, doNotDisturb);
    QFETCH(int, status);
    QFETCH(bool, twoCalls);
    QFETCH(bool, readingAloud);
    QFETCH(Outputs, outputs);
    phone()->setDoNotDisturb(doNotDisturb);
    phone()->setStatus(status);
    phone()->setCallConnected(status >= 7);
    phone()->setMultipleCallsConnected(twoCalls);
    Mavrosk::SpeechSource::instance()->setTtsSessionActive(readingAloud);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::mark();
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);
    QCOMPARE(GlobalHmi::shown(QStringLiteral("IncomingCall")),
             outputs.endsWith(QStringLiteral("popup-request IncomingCall")));
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
    QTest::addRow("caller hung up") << QString() << rejected;
}

void TestCallReactions::answer()
{
    QFETCH(QString, event);
    QFETCH(Outputs, outputs);
    QVERIFY(m_hmi->run());
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(GlobalHmi::shown(QStringLiteral("IncomingCall")));

    qint64 since = GlobalHmi::mark();
    if (event.isEmpty())
        emit phone()->phoneIncomingCallRemoteRejection();
    else
        since = GlobalHmi::post(event);
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);
    QVERIFY(!GlobalHmi::shown(QStringLiteral("IncomingCall")));
}

void TestCallReactions::waitingCall()
{
    phone()->setStatus(7);
    phone()->setCallConnected(true);
    QVERIFY(m_hmi->run());
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(GlobalHmi::shown(QStringLiteral("WaitingCall")));

    // Accepted once: a second accept finds nothing ringing.
    qint64 since = GlobalHmi::mark();
    GlobalHmi::post(Events::HmiPhone_AcceptWaitingCall);
    GlobalHmi::post(Events::HmiPhone_AcceptWaitingCall);
    QCOMPARE(GlobalHmi::outputsSince(since).filter(QStringLiteral("bridge")),
             Outputs{QStringLiteral("bridge phone.acceptIncomingCall")});

    // The phone fails to take it: the waiting-call popup gives way to the failure.
    emit phone()->phoneCallAcceptingFailed();
    TestSupport::processUntilIdle();
    QVERIFY(GlobalHmi::shown(QStringLiteral("CallAnswerNotResponding")));
    QVERIFY(!GlobalHmi::shown(QStringLiteral("WaitingCall")));

    // A further waiting call whose caller hangs up.
    phone()->setIncomingCall(false);
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(GlobalHmi::shown(QStringLiteral("WaitingCall")));
    emit phone()->phoneWaitingCallRemoteRejection();
    TestSupport::processUntilIdle();
    QVERIFY(!GlobalHmi::shown(QStringLiteral("WaitingCall")));
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
    emit phone()->missedCallsPresent();
    TestSupport::processUntilIdle();
    const Outputs missed{QStringLiteral("popup-dismiss IncomingCall"),
                         QStringLiteral("popup-request MissedCallPopup")};
    QCOMPARE(GlobalHmi::outputsSince(since), popup ? missed : Outputs());
    QCOMPARE(GlobalHmi::shown(QStringLiteral("MissedCallPopup")), popup);

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
    phone()->setStatus(7);
    TestSupport::processUntilIdle();
    QVERIFY(!GlobalHmi::shown(QStringLiteral("DialingFailed")));
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
    emit phone()->multipartyActiveCallEnded();
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::outputsSince(since), outputs);

    // Confirming closes the popup; a confirmation without the popup does nothing.
    const qint64 confirmed = GlobalHmi::mark();
    GlobalHmi::post(Events::HmiPhone_CallEndConfirmed);
    GlobalHmi::post(Events::HmiPhone_CallEndConfirmed);
    QCOMPARE(GlobalHmi::outputsSince(confirmed).count(QStringLiteral("popup-dismiss CallEnded")),
             statusBar == 2 ? 0 : 1);
    QVERIFY(!GlobalHmi::shown(QStringLiteral("CallEnded")));
}

void TestCallReactions::roamingConfirmation_data()
{
    QTest::addColumn<bool>("fromRecentCalls");
    QTest::addColumn<QString>("command");
    QTest::addColumn<QVariantList>("args");

    QTest::addRow("entered number") << false << QStringLiteral("phone.dialNumber")
                                    << QVariantList{QStringLiteral("0123456")};
    QTest::addRow("recent calls list")
            << true << QStringLiteral("phone.dialRecentCall") << QVariantList{2, 5};
}

void TestCallReactions::roamingConfirmation()
{
    QFETCH(bool, fromRecentCalls);
    QFETCH(QString, command);
    QFETCH(QVariantList, args);
    phone()->setCallNumberEntered(QStringLiteral("0123456"));
    phone()->setOutboundRoamingCallIsFromRecentList(fromRecentCalls);
    phone()->setOutboundRoamingRecentCallType(2);
    phone()->setOutboundRoamingRecentCallIndex(5);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::post(Events::HmiPhone_ConfirmRoamingCall);
    const auto entries = Platform::Journal::instance()->entriesSince(since);
    QVERIFY(!entries.isEmpty());
    QCOMPARE(entries.first().fields.value(QStringLiteral("call")).toString(), command);
    QCOMPARE(entries.first().fields.value(QStringLiteral("args")).toList(), args);
    QVERIFY(!phone()->outboundRoamingCallIsFromRecentList());
}

// The whole road through the built plug-in file: ringing, accepted from the popup's view, the
// call screen once the phone reports the call, and one step back when it ends.
void TestCallReactions::incomingCallRoadThroughThePlugin()
{
    QVERIFY(m_hmi->run(QStringLiteral(HMIPHONE_PLUGIN_FILE)));
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(GlobalHmi::shown(QStringLiteral("IncomingCall")));

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
    QVERIFY(!GlobalHmi::shown(QStringLiteral("IncomingCall")));

    phone()->setCallConnected(true);
    phone()->setIncomingCall(false);
    phone()->setStatus(7);
    TestSupport::processUntilIdle();
    QCOMPARE(Brisken::ViewController::instance()->activeView(),
             QStringLiteral("PHONE.CallInProgress"));

    since = GlobalHmi::mark();
    phone()->setCallConnected(false);
    phone()->setStatus(0);
    TestSupport::processUntilIdle();
    QCOMPARE(TestSupport::journalValues(QStringLiteral("back"), QStringLiteral("steps"), since),
             QStringList{QStringLiteral("1")});
    QCOMPARE(Brisken::ViewController::instance()->activeView(), QStringLiteral("HOST.Home"));
}

QTEST_GUILESS_MAIN(TestCallReactions)
#include "tst_callreactions.moc"
