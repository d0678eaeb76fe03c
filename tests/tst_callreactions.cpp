// The phone's reactions to calls, wherever the driver is in the HMI: ringing, answering,
// waiting calls, missed calls, dialling failures, the end of a call and roaming confirmation,
// seen as the HMI sees them (popups, transients, commands to the phone) with the module run by a
// host.

#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "testsupport.h"

#include <brisken/datastore.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewcontroller.h>
#include <brisken/viewmanager.h>
#include <host/modulehost.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/projectionsource.h>
#include <mavrosk/speechsource.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

#include <QRegularExpression>
#include <memory>

using namespace HmiPhone;

namespace {

Mavrosk::PhoneSource *phone()
{
    return Mavrosk::PhoneSource::instance();
}

// The HMI's outputs since `since` that a driver or the phone would notice, in order, as
// "kind name" (popup requests and dismissals by view name, transients, phone commands).
QStringList outputsSince(qint64 since)
{
    QStringList outputs;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        QString what;
        if (entry.kind.startsWith(QLatin1String("popup-request"))
            || entry.kind == QLatin1String("popup-dismiss"))
            what = entry.fields.value(QStringLiteral("id")).toString().section(QLatin1Char('.'), 1);
        else if (entry.kind.startsWith(QLatin1String("transient")))
            what = entry.fields.value(QStringLiteral("name")).toString();
        else if (entry.kind == QLatin1String("bridge") || entry.kind == QLatin1String("event"))
            what = entry.fields
                           .value(entry.kind == QLatin1String("bridge") ? QStringLiteral("call")
                                                                        : QStringLiteral("name"))
                           .toString();
        else
            continue;
        outputs.append(entry.kind + QLatin1Char(' ') + what);
    }
    return outputs;
}

qint64 mark()
{
    return Platform::Journal::instance()->lastSequence();
}

bool shown(const QString &view)
{
    for (const QString &id : Brisken::ViewController::instance()->shownPopups()) {
        if (id.endsWith(QLatin1Char('.') + view))
            return true;
    }
    return false;
}

} // namespace

class TestCallReactions : public QObject
{
    Q_OBJECT

private slots:
    void init();
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
    void outgoingCallTransients_data();
    void outgoingCallTransients();
    void callEnded_data();
    void callEnded();
    void roamingConfirmation_data();
    void roamingConfirmation();
    void incomingCallRoadThroughThePlugin();

private:
    void startHmi(const QString &pluginFile = QString());
    void post(const QString &event);

    std::unique_ptr<HmiPhoneModule> m_module;
    std::unique_ptr<Host::ModuleHost> m_host;
    TestSupport::FrameworkWarningGuard m_guard;
};

void TestCallReactions::init()
{
    Quorvel::StateMachine::destroyInstance();
    Mavrosk::resetAll();
    Brisken::DataStore::reset();
    Platform::Journal::instance()->clear();
}

void TestCallReactions::cleanup()
{
    m_host.reset();
    m_module.reset();
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

// Brings the HMI up as a host does, with the phone connected and the home screen shown.
void TestCallReactions::startHmi(const QString &pluginFile)
{
    Mavrosk::BluetoothSource::instance()->setDeviceConnected(true);
    m_host = std::make_unique<Host::ModuleHost>();
    if (pluginFile.isEmpty()) {
        m_module = std::make_unique<HmiPhoneModule>();
        m_host->use(m_module.get());
    } else {
        QVERIFY2(m_host->load(pluginFile), qPrintable(m_host->errorString()));
    }
    QVERIFY2(m_host->setUp(QStringLiteral("HmiPhone")), qPrintable(m_host->errorString()));
    m_host->start();
}

void TestCallReactions::post(const QString &event)
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(event));
    TestSupport::processUntilIdle();
}

void TestCallReactions::incomingCall_data()
{
    QTest::addColumn<bool>("doNotDisturb");
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("callConnected");
    QTest::addColumn<bool>("twoCalls");
    QTest::addColumn<bool>("readingAloud");
    QTest::addColumn<QStringList>("outputs");

    const QString incoming = QStringLiteral("popup-request IncomingCall");
    const QString reject = QStringLiteral("bridge phone.rejectIncomingCall");
    QTest::addRow("idle") << false << 0 << false << false << false << QStringList{incoming};
    QTest::addRow("message read aloud")
            << false << 0 << false << false << true
            << QStringList{QStringLiteral("bridge phone.stopTextMessagePlayback"), incoming};
    QTest::addRow("during a call, message read aloud")
            << false << 7 << true << false << true
            << QStringList{QStringLiteral("popup-request WaitingCall")};
    QTest::addRow("two calls connected")
            << false << 9 << true << true << false << QStringList{reject};
    QTest::addRow("status 11") << false << 11 << true << false << false << QStringList{reject};
    QTest::addRow("do not disturb") << true << 0 << false << false << false << QStringList();
}

void TestCallReactions::incomingCall()
{
    QFETCH(bool, doNotDisturb);
    QFETCH(int, status);
    QFETCH(bool, callConnected);
    QFETCH(bool, twoCalls);
    QFETCH(bool, readingAloud);
    QFETCH(QStringList, outputs);

    phone()->setDoNotDisturb(doNotDisturb);
    phone()->setStatus(status);
    phone()->setCallConnected(callConnected);
    phone()->setMultipleCallsConnected(twoCalls);
    Mavrosk::SpeechSource::instance()->setTtsSessionActive(readingAloud);
    startHmi();

    const qint64 since = mark();
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QCOMPARE(outputsSince(since), outputs);
    QCOMPARE(shown(QStringLiteral("IncomingCall")),
             outputs.endsWith(QStringLiteral("popup-request IncomingCall")));
}

void TestCallReactions::answer_data()
{
    QTest::addColumn<QString>("event");
    QTest::addColumn<QStringList>("outputs");

    QTest::addRow("accepted") << QString(Events::HmiPhone_AcceptIncomingCall)
                              << QStringList{QStringLiteral("popup-dismiss IncomingCall"),
                                             QStringLiteral("bridge phone.acceptIncomingCall"),
                                             QStringLiteral("transient PhoneAcceptedIncomingCall")};
    const QStringList rejected{QStringLiteral("popup-dismiss IncomingCall"),
                               QStringLiteral("bridge phone.rejectIncomingCall"),
                               QStringLiteral("transient PhoneRejectedIncomingCall")};
    QTest::addRow("rejected") << QString(Events::HmiPhone_RejectIncomingCall) << rejected;
    QTest::addRow("caller hung up") << QString() << rejected;
}

void TestCallReactions::answer()
{
    QFETCH(QString, event);
    QFETCH(QStringList, outputs);
    startHmi();
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(shown(QStringLiteral("IncomingCall")));

    const qint64 since = mark();
    if (event.isEmpty()) {
        emit phone()->phoneIncomingCallRemoteRejection();
        TestSupport::processUntilIdle();
    } else {
        post(event);
    }
    QCOMPARE(outputsSince(since), outputs);
    QVERIFY(!shown(QStringLiteral("IncomingCall")));
}

void TestCallReactions::waitingCall()
{
    phone()->setStatus(7);
    phone()->setCallConnected(true);
    startHmi();
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(shown(QStringLiteral("WaitingCall")));

    // Accepting moves the popup on; a second accept finds nothing ringing.
    qint64 since = mark();
    post(Events::HmiPhone_AcceptWaitingCall);
    post(Events::HmiPhone_AcceptWaitingCall);
    QCOMPARE(outputsSince(since).filter(QStringLiteral("bridge")),
             QStringList{QStringLiteral("bridge phone.acceptIncomingCall")});

    // The phone fails to take the call: the waiting-call popup gives way to the failure.
    since = mark();
    emit phone()->phoneCallAcceptingFailed();
    TestSupport::processUntilIdle();
    QVERIFY(outputsSince(since).contains(QStringLiteral("popup-request CallAnswerNotResponding")));
    QVERIFY(shown(QStringLiteral("CallAnswerNotResponding")));
    QVERIFY(!shown(QStringLiteral("WaitingCall")));

    // The caller of a waiting call hangs up.
    phone()->setIncomingCall(false);
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(shown(QStringLiteral("WaitingCall")));
    emit phone()->phoneWaitingCallRemoteRejection();
    TestSupport::processUntilIdle();
    QVERIFY(!shown(QStringLiteral("WaitingCall")));
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
    startHmi();

    const qint64 since = mark();
    emit phone()->missedCallsPresent();
    TestSupport::processUntilIdle();
    const QStringList missed{QStringLiteral("popup-dismiss IncomingCall"),
                             QStringLiteral("popup-request MissedCallPopup")};
    QCOMPARE(outputsSince(since), popup ? missed : QStringList());
    QCOMPARE(shown(QStringLiteral("MissedCallPopup")), popup);

    // Leaving the popup asks the recent-calls list for the calls just missed.
    const qint64 closed = mark();
    Brisken::ViewController::instance()->dismissPopup(Brisken::ViewManager::viewIdentifier(
            QStringLiteral("PHONE"), QStringLiteral("MissedCallPopup")));
    TestSupport::processUntilIdle();
    QCOMPARE(outputsSince(closed).contains(QStringLiteral("event HmiPhone_RequestRecentCallList")),
             listRequested);
}

void TestCallReactions::dialingFailures_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<QList<int>>("kinds");
    QTest::addColumn<QStringList>("popups");

    const QString failed = QStringLiteral("DialingFailed");
    const QString third = QStringLiteral("Dialing3rdFailure");
    QTest::addRow("1, 2, 3rd, then again")
            << 3 << QList<int>{1, 1, 1, 1} << QStringList{failed, failed, third, failed};
    QTest::addRow("no signal does not count")
            << 0 << QList<int>{1, 0, 1, 1}
            << QStringList{failed, QStringLiteral("NoCellularSignal"), failed, third};
    QTest::addRow("call connected") << 7 << QList<int>{1} << QStringList();
    QTest::addRow("unknown kind") << 3 << QList<int>{2} << QStringList();
}

void TestCallReactions::dialingFailures()
{
    QFETCH(int, status);
    QFETCH(QList<int>, kinds);
    QFETCH(QStringList, popups);
    phone()->setStatus(status);
    startHmi();

    const qint64 since = mark();
    for (int kind : kinds)
        emit phone()->phoneDialingFailed(kind);
    TestSupport::processUntilIdle();
    QCOMPARE(outputsSince(since).replaceInStrings(QStringLiteral("popup-request "), QString()),
             popups);
}

void TestCallReactions::outgoingCallTransients_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<QList<int>>("statuses");
    QTest::addColumn<QStringList>("outputs");

    const QString dialing = QStringLiteral("transient PhoneOutgoingDialing");
    const QString connected = QStringLiteral("transient PhoneConnectedOutgoingCall");
    QTest::addRow("0, 3, 7") << 0 << QList<int>{3, 7}
                             << QStringList{dialing, connected,
                                            QStringLiteral("popup-dismiss DialingFailed")};
    QTest::addRow("0, 4, 9") << 0 << QList<int>{4, 9} << QStringList{dialing, connected};
    QTest::addRow("6, 11") << 6 << QList<int>{11} << QStringList{connected};
    QTest::addRow("7, 3") << 7 << QList<int>{3} << QStringList{dialing};
    QTest::addRow("8, 7") << 8 << QList<int>{7} << QStringList();
}

void TestCallReactions::outgoingCallTransients()
{
    QFETCH(int, from);
    QFETCH(QList<int>, statuses);
    QFETCH(QStringList, outputs);
    phone()->setStatus(from);
    startHmi();

    const qint64 since = mark();
    for (int status : statuses) {
        phone()->setStatus(status);
        TestSupport::processUntilIdle();
    }
    QStringList seen = outputsSince(since).filter(
            QRegularExpression(QStringLiteral("^transient |DialingFailed")));
    QCOMPARE(seen, outputs);
}

void TestCallReactions::callEnded_data()
{
    QTest::addColumn<int>("statusBar"); // 0 none, 1 hidden, 2 visible
    QTest::addColumn<QStringList>("outputs");

    QTest::addRow("status bar visible")
            << 2
            << QStringList{QStringLiteral("transient-hide PhoneOutgoingDialing"),
                           QStringLiteral("transient PhoneCallEnded")};
    QTest::addRow("status bar hidden")
            << 1
            << QStringList{QStringLiteral("transient-hide PhoneOutgoingDialing"),
                           QStringLiteral("popup-request CallEnded")};
    QTest::addRow("no status bar") << 0 << QStringList{QStringLiteral("popup-request CallEnded")};
}

void TestCallReactions::callEnded()
{
    QFETCH(int, statusBar);
    QFETCH(QStringList, outputs);
    if (statusBar == 0)
        Brisken::DataStore::remove(QStringLiteral("StatusBarController"));
    else
        Brisken::DataStore::get<Brisken::StatusBarController>(QStringLiteral("StatusBarController"))
                ->setStatusBarVisible(statusBar == 2);
    startHmi();

    const qint64 since = mark();
    emit phone()->multipartyActiveCallEnded();
    TestSupport::processUntilIdle();
    QCOMPARE(outputsSince(since), outputs);

    // The driver confirms the popup; the confirmation means nothing once it is gone.
    const qint64 confirmed = mark();
    post(Events::HmiPhone_CallEndConfirmed);
    post(Events::HmiPhone_CallEndConfirmed);
    const int dismissals = outputsSince(confirmed).count(QStringLiteral("popup-dismiss CallEnded"));
    QCOMPARE(dismissals, statusBar == 2 ? 0 : 1);
    QVERIFY(!shown(QStringLiteral("CallEnded")));
}

void TestCallReactions::roamingConfirmation_data()
{
    QTest::addColumn<bool>("fromRecentCalls");
    QTest::addColumn<QStringList>("commands");

    QTest::addRow("entered number")
            << false << QStringList{QStringLiteral("phone.dialNumber 0123456")};
    QTest::addRow("recent calls list")
            << true
            << QStringList{QStringLiteral("phone.dialRecentCall 2,5"),
                           QStringLiteral("phone.setOutboundRoamingCallIsFromRecentList false")};
}

void TestCallReactions::roamingConfirmation()
{
    QFETCH(bool, fromRecentCalls);
    QFETCH(QStringList, commands);
    phone()->setCallNumberEntered(QStringLiteral("0123456"));
    phone()->setOutboundRoamingCallIsFromRecentList(fromRecentCalls);
    phone()->setOutboundRoamingRecentCallType(2);
    phone()->setOutboundRoamingRecentCallIndex(5);
    startHmi();

    const qint64 since = mark();
    post(Events::HmiPhone_ConfirmRoamingCall);
    QStringList sent;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind != QLatin1String("bridge"))
            continue;
        QStringList args;
        for (const QVariant &arg : entry.fields.value(QStringLiteral("args")).toList())
            args.append(arg.toString());
        sent.append(entry.fields.value(QStringLiteral("call")).toString() + QLatin1Char(' ')
                    + args.join(QLatin1Char(',')));
    }
    QCOMPARE(sent, commands);
    QVERIFY(!phone()->outboundRoamingCallIsFromRecentList());
}

// The whole road through the built plug-in file: ringing, accepted from the popup's view, the
// call screen once the phone reports the call, and one step back when it ends.
void TestCallReactions::incomingCallRoadThroughThePlugin()
{
    startHmi(QStringLiteral(HMIPHONE_PLUGIN_FILE));
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QVERIFY(shown(QStringLiteral("IncomingCall")));

    QObject *controller = nullptr;
    for (QObject *child : m_host->integration()->children()) {
        if (qstrcmp(child->metaObject()->className(), "HmiPhone::HmiPhoneController") == 0)
            controller = child;
    }
    QVERIFY(controller);
    qint64 since = mark();
    QVERIFY(QMetaObject::invokeMethod(controller, "acceptIncomingCall"));
    TestSupport::processUntilIdle();
    QCOMPARE(outputsSince(since),
             (QStringList{QStringLiteral("event HmiPhone_AcceptIncomingCall"),
                          QStringLiteral("popup-dismiss IncomingCall"),
                          QStringLiteral("bridge phone.acceptIncomingCall"),
                          QStringLiteral("transient PhoneAcceptedIncomingCall")}));
    QVERIFY(!shown(QStringLiteral("IncomingCall")));

    phone()->setCallConnected(true);
    phone()->setIncomingCall(false);
    phone()->setStatus(7);
    TestSupport::processUntilIdle();
    QVERIFY2(Brisken::ViewController::instance()->activeView().endsWith(
                     QLatin1String(".CallInProgress")),
             qPrintable(Brisken::ViewController::instance()->activeView()));

    since = mark();
    phone()->setCallConnected(false);
    phone()->setStatus(0);
    TestSupport::processUntilIdle();
    QCOMPARE(TestSupport::journalValues(QStringLiteral("back"), QStringLiteral("steps"), since),
             QStringList{QStringLiteral("1")});
    QVERIFY(!Brisken::ViewController::instance()->activeView().endsWith(
            QLatin1String(".CallInProgress")));
}

QTEST_GUILESS_MAIN(TestCallReactions)
#include "tst_callreactions.moc"
