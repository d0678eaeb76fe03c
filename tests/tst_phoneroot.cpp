#include "phonescreenfixture.h"

#include <hmiphoneevents.h>
#include <hmiphoneviews.h>

#include <mavrosk/ardelsource.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/speechsource.h>

#include <QtTest>

using namespace HmiPhone;

class TestPhoneRoot : public QObject
{
    Q_OBJECT

private slots:
    void init()
    {
        m_fixture.reset();
        TestSupport::FrameworkWarningGuard::take();
    }
    void cleanup() { QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList()); }

    void firstScreen_data();
    void firstScreen();
    void firstScreenIsChosenOnEveryEntry();
    void siriRequest_data();
    void siriRequest();
    void doNotDisturbToggle_data();
    void doNotDisturbToggle();
    void callEnded_data();
    void callEnded();
    void phoneWideTransitions_data();
    void phoneWideTransitions();
    void makeCall_data();
    void makeCall();

private:
    Mavrosk::PhoneSource *phone() const { return Mavrosk::PhoneSource::instance(); }
    void connectDevice(bool connected = true)
    {
        Mavrosk::BluetoothSource::instance()->setDeviceConnected(connected);
    }

    TestSupport::FrameworkWarningGuard m_guard;
    PhoneScreenFixture m_fixture;
};

static const QStringList FirstScreens
        = {QStringLiteral("HmiPhone_Limbo"), QStringLiteral("PhoneCallCmp"),
           QStringLiteral("PhoneEmgcyAsst"), QStringLiteral("PhoneMenuViewState")};

void TestPhoneRoot::firstScreen_data()
{
    QTest::addColumn<bool>("connected");
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("callConnected");
    QTest::addColumn<int>("emergency");
    QTest::addColumn<QString>("expected");

    const QString addPhone = QStringLiteral("HmiPhone_Limbo");
    const QString call = QStringLiteral("PhoneCallCmp");
    const QString emergency = QStringLiteral("PhoneEmgcyAsst");
    const QString menu = QStringLiteral("PhoneMenuViewState");

    QTest::addRow("no device") << false << 0 << false << 0 << addPhone;
    QTest::addRow("no device, call reported") << false << 4 << true << 1 << addPhone;
    QTest::addRow("idle") << true << 0 << false << 0 << menu;
    QTest::addRow("status 2 is no call") << true << 2 << false << 0 << menu;
    QTest::addRow("status 3") << true << 3 << false << 0 << call;
    QTest::addRow("status 5") << true << 5 << false << 0 << call;
    QTest::addRow("status 6 alone is no call") << true << 6 << false << 0 << menu;
    QTest::addRow("call connected at status 7") << true << 7 << true << 0 << call;
    QTest::addRow("status 4, emergency 1: call wins") << true << 4 << false << 1 << call;
    QTest::addRow("connected call, emergency 2: call wins") << true << 0 << true << 2 << call;
    QTest::addRow("emergency 1") << true << 0 << false << 1 << emergency;
    QTest::addRow("emergency 2") << true << 0 << false << 2 << emergency;
    QTest::addRow("emergency 3 is none") << true << 0 << false << 3 << menu;
}

void TestPhoneRoot::firstScreen()
{
    QFETCH(bool, connected);
    QFETCH(int, status);
    QFETCH(bool, callConnected);
    QFETCH(int, emergency);
    QFETCH(QString, expected);

    connectDevice(connected);
    phone()->setStatus(status);
    phone()->setCallConnected(callConnected);
    phone()->setEmergencyCallStatus(emergency);
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());

    for (const QString &screen : FirstScreens)
        QCOMPARE(m_fixture.isActive(screen), screen == expected);

    // The phone is asked for its status only when a device is connected; without one the
    // platform is asked to add a phone.
    QCOMPARE(m_fixture.bridgeCalls().contains(QStringLiteral("phone.checkPhoneStatus()")),
             connected);
    QCOMPARE(m_fixture.journal(QStringLiteral("intent"), QStringLiteral("action")),
             connected ? QStringList() : QStringList{QStringLiteral("70")});
}

void TestPhoneRoot::firstScreenIsChosenOnEveryEntry()
{
    connectDevice();
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());
    QVERIFY(m_fixture.isActive(QStringLiteral("PhoneMenuViewState")));

    m_fixture.enter(m_fixture.home());
    phone()->setStatus(4);
    m_fixture.enter(m_fixture.phone());
    QVERIFY(m_fixture.isActive(QStringLiteral("CallInProgressViewState")));
}

void TestPhoneRoot::siriRequest_data()
{
    QTest::addColumn<bool>("connected");
    QTest::addColumn<bool>("supported");
    QTest::addColumn<bool>("enabled");
    QTest::addColumn<bool>("siriActive");
    QTest::addColumn<int>("session");
    QTest::addColumn<QStringList>("calls");
    QTest::addColumn<QStringList>("popups");

    const QStringList refused{Views::siriFeatureNotEnabledPopup};
    QTest::addRow("activate") << true << true << true << false << 0
                              << QStringList{QStringLiteral("phone.toggleSiriActivation(true)")}
                              << QStringList();
    QTest::addRow("deactivate during a voice session")
            << true << true << true << true << 3
            << QStringList{QStringLiteral("speech.cancelVRSession()"),
                           QStringLiteral("phone.toggleSiriActivation(false)")}
            << QStringList();
    QTest::addRow("unsupported") << true << false << true << false << 0 << QStringList() << refused;
    QTest::addRow("disabled") << true << true << false << false << 0 << QStringList() << refused;
    QTest::addRow("no device") << false << true << true << false << 0 << QStringList() << refused;
}

void TestPhoneRoot::siriRequest()
{
    QFETCH(bool, connected);
    QFETCH(bool, supported);
    QFETCH(bool, enabled);
    QFETCH(bool, siriActive);
    QFETCH(int, session);
    QFETCH(QStringList, calls);
    QFETCH(QStringList, popups);

    connectDevice(connected);
    phone()->setSiriSupported(supported);
    phone()->setSiriEnabled(enabled);
    phone()->setSiriActive(siriActive);
    Mavrosk::SpeechSource::instance()->setSessionState(session);
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());
    m_fixture.mark();

    m_fixture.post(Events::HmiPhone_SiriRequest);
    QCOMPARE(m_fixture.bridgeCalls(), calls);
    QCOMPARE(m_fixture.journal(QStringLiteral("popup-request")), popups);
}

void TestPhoneRoot::doNotDisturbToggle_data()
{
    QTest::addColumn<bool>("doNotDisturb");
    QTest::addColumn<int>("keyType");
    QTest::addColumn<bool>("option");
    QTest::addColumn<QStringList>("calls");
    QTest::addColumn<QStringList>("popups");

    const QStringList enable{QStringLiteral("phone.enableDoNotDisturb()")};
    const QStringList disable{QStringLiteral("phone.disableDoNotDisturb()")};
    QTest::addRow("off, restricted key") << false << 2 << false << enable << QStringList();
    QTest::addRow("on, ordinary key") << true << 0 << false << disable << QStringList();
    QTest::addRow("on, restricted key allowing it")
            << true << 2 << true << disable << QStringList();
    QTest::addRow("on, restricted key forbidding it")
            << true << 2 << false << QStringList() << QStringList{Views::PhoneDndActiveArdel};
}

void TestPhoneRoot::doNotDisturbToggle()
{
    QFETCH(bool, doNotDisturb);
    QFETCH(int, keyType);
    QFETCH(bool, option);
    QFETCH(QStringList, calls);
    QFETCH(QStringList, popups);

    connectDevice();
    phone()->setDoNotDisturb(doNotDisturb);
    Mavrosk::ArdelSource::instance()->setIgnitionKeyType(keyType);
    Mavrosk::ArdelSource::instance()->setDoNotDisturbOption(option);
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());
    m_fixture.mark();

    m_fixture.post(Events::HmiPhone_DoNotDisturbToggleRequest);
    QCOMPARE(m_fixture.bridgeCalls(), calls);
    QCOMPARE(m_fixture.journal(QStringLiteral("popup-request")), popups);
    // The popup belongs to the phone's own layer: it is shown while the phone is.
    QCOMPARE(m_fixture.journal(QStringLiteral("popup-shown")), popups);
}

void TestPhoneRoot::callEnded_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<int>("to");
    QTest::addColumn<int>("backSteps");

    QTest::addRow("5 to 3: still a call") << 5 << 3 << 0;
    QTest::addRow("3 to 2: ended") << 3 << 2 << 1;
    QTest::addRow("4 to 0: ended") << 4 << 0 << 1;
}

void TestPhoneRoot::callEnded()
{
    QFETCH(int, from);
    QFETCH(int, to);
    QFETCH(int, backSteps);

    connectDevice();
    phone()->setStatus(from);
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());
    QVERIFY(m_fixture.isActive(QStringLiteral("PhoneCallCmp")));
    m_fixture.mark();

    phone()->setStatus(to);
    TestSupport::processUntilIdle();
    QCOMPARE(m_fixture.journal(QStringLiteral("back"), QStringLiteral("steps")),
             backSteps ? QStringList{QString::number(backSteps)} : QStringList());
}

// How the phone-wide transitions act, by the screen they start from.
void TestPhoneRoot::phoneWideTransitions_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("onKeypad");
    QTest::addColumn<QString>("trigger");
    QTest::addColumn<QString>("expected");
    QTest::addColumn<bool>("textMessagesRequested");

    const QString menu = QStringLiteral("PhoneMenuViewState");
    const QString keypad = QStringLiteral("DialKeypadViewState");
    const QString call = QStringLiteral("CallInProgressViewState");
    const QString recent = QStringLiteral("RecentCallsListViewState");
    const QString addPhone = QStringLiteral("HmiPhone_Limbo");
    const QString keypadRequest = Events::HmiPhone_ShowPhoneKeyPadRequest;
    const QString recentRequest = Events::HmiPhone_ShowRecentCallsRequest;
    const QString reconnectFailed = QStringLiteral("reconnect failed");
    const QString notification = QStringLiteral("notification on");

    QTest::addRow("keypad from the menu") << 0 << false << keypadRequest << keypad << false;
    QTest::addRow("keypad not from the call") << 4 << false << keypadRequest << call << false;
    QTest::addRow("recent calls from the call") << 4 << false << recentRequest << recent << false;
    QTest::addRow("recent calls from the keypad") << 0 << true << recentRequest << recent << false;
    QTest::addRow("reconnection failed in a call")
            << 4 << false << reconnectFailed << addPhone << false;
    QTest::addRow("notification on in the menu") << 0 << false << notification << menu << true;
    QTest::addRow("notification on in the keypad") << 0 << true << notification << keypad << false;
}

void TestPhoneRoot::phoneWideTransitions()
{
    QFETCH(int, status);
    QFETCH(bool, onKeypad);
    QFETCH(QString, trigger);
    QFETCH(QString, expected);
    QFETCH(bool, textMessagesRequested);

    connectDevice();
    phone()->setStatus(status);
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());
    if (onKeypad)
        m_fixture.post(Events::HmiPhone_ShowPhoneKeyPadRequest);
    m_fixture.mark();

    if (trigger == QLatin1String("reconnect failed"))
        emit phone()->phoneDriverDoorOpenLinkLossReconnectFailedReceived();
    else if (trigger == QLatin1String("notification on"))
        phone()->setMessageNotificationEnabled(true);
    else
        m_fixture.post(trigger);
    TestSupport::processUntilIdle();

    QVERIFY2(m_fixture.isActive(expected), qPrintable(expected));
    QCOMPARE(m_fixture.journal(QStringLiteral("event"), QStringLiteral("name"))
                     .contains(Events::HmiPhone_ShowSmsRequest),
             textMessagesRequested);
}

void TestPhoneRoot::makeCall_data()
{
    QTest::addColumn<bool>("roaming");
    QTest::addColumn<bool>("warning");
    QTest::addColumn<QStringList>("calls");
    QTest::addColumn<QStringList>("popups");

    const QStringList dial{QStringLiteral("phone.dialNumber(0123)")};
    QTest::addRow("home network") << false << true << dial << QStringList();
    QTest::addRow("roaming, warning off") << true << false << dial << QStringList();
    QTest::addRow("roaming, warning on")
            << true << true << QStringList() << QStringList{Views::RoamingWarning};
}

void TestPhoneRoot::makeCall()
{
    QFETCH(bool, roaming);
    QFETCH(bool, warning);
    QFETCH(QStringList, calls);
    QFETCH(QStringList, popups);

    connectDevice();
    phone()->setRoaming(roaming);
    phone()->setBridgeValue(QStringLiteral("roamingWarning"), warning);
    phone()->setBridgeValue(QStringLiteral("callNumberEntered"), QStringLiteral("0123"));
    m_fixture.build();
    m_fixture.phone()->makeCall();
    QCOMPARE(m_fixture.bridgeCalls(), calls);
    QCOMPARE(m_fixture.journal(QStringLiteral("popup-request")), popups);
}

QTEST_GUILESS_MAIN(TestPhoneRoot)
#include "tst_phoneroot.moc"
