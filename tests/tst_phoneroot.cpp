#include "phonerootfixture.h"

#include <hmiphoneevents.h>
#include <hmiphoneviews.h>

#include <mavrosk/bridge.h>

#include <QtTest>

using namespace HmiPhone;
using namespace PhoneRootFixture;

static const QString Connected = QStringLiteral("bluetooth.deviceConnected=true ");

class TestPhoneRoot : public TestSupport::Suite
{
    Q_OBJECT

private slots:
    void firstScreen_data()
    {
        QTest::addColumn<QString>("data");
        QTest::addColumn<QString>("expected");

        const QString addPhone = QStringLiteral("HmiPhone_Limbo"),
                      call = QStringLiteral("PhoneCallCmp"), sos = QStringLiteral("PhoneEmgcyAsst"),
                      menu = QStringLiteral("PhoneMenuViewState");
        QTest::addRow("no device") << QString() << addPhone;
        QTest::addRow("no device, call reported")
                << "phone.status=4 phone.callConnected=true"_q << addPhone;
        QTest::addRow("idle") << Connected << menu;
        QTest::addRow("status 2 is no call") << Connected + "phone.status=2"_q << menu;
        QTest::addRow("status 3") << Connected + "phone.status=3"_q << call;
        QTest::addRow("status 5") << Connected + "phone.status=5"_q << call;
        QTest::addRow("status 6 alone is no call") << Connected + "phone.status=6"_q << menu;
        QTest::addRow("call connected") << Connected + "phone.callConnected=true"_q << call;
        QTest::addRow("status 4, emergency 1: the call wins")
                << Connected + "phone.status=4 phone.emergencyCallStatus=1"_q << call;
        QTest::addRow("emergency 1") << Connected + "phone.emergencyCallStatus=1"_q << sos;
        QTest::addRow("emergency 2") << Connected + "phone.emergencyCallStatus=2"_q << sos;
        QTest::addRow("emergency 3 is none") << Connected + "phone.emergencyCallStatus=3"_q << menu;
    }

    void firstScreen()
    {
        QFETCH(QString, data);
        QFETCH(QString, expected);

        Phone_Cmp *phone = build();
        // The choice is made on every entry, from the data of that moment.
        for (const QString &screen : {QStringLiteral("HmiPhone_Limbo"), expected}) {
            ScreenFixture::post(ScreenFixture::OpenHome);
            setValues(screen == expected ? data : QString());
            const qint64 since = ScreenFixture::mark();
            enter(phone);

            const QStringList active = ScreenFixture::activeStates();
            for (const QString &name :
                 {QStringLiteral("HmiPhone_Limbo"), QStringLiteral("PhoneCallCmp"),
                  QStringLiteral("PhoneEmgcyAsst"), QStringLiteral("PhoneMenuViewState")})
                QVERIFY2(active.contains(name) == (name == screen), qPrintable(name));
            // Without a device the platform is asked to add a phone; with one, the phone for its
            // status.
            const bool connected = Mavrosk::BluetoothSource::instance()->deviceConnected();
            QCOMPARE(outputs(since).contains(QStringLiteral("phone.checkPhoneStatus()")),
                     connected);
            QCOMPARE(outputs(since).contains(QStringLiteral("intent 70()")), !connected);
        }
    }

    // Steps before the last one lead to the screen the last one starts from: events, "status=N"_q,
    // and the phone's reports "reconnect failed" and "notification on".
    void navigation_data()
    {
        QTest::addColumn<QString>("data");
        QTest::addColumn<QStringList>("steps");
        QTest::addColumn<QString>("expected");
        QTest::addColumn<QString>("outputs");

        const QString keypad = Events::HmiPhone_ShowPhoneKeyPadRequest;
        const QString recent = Events::HmiPhone_ShowRecentCallsRequest;
        const QString notification = QStringLiteral("notification on");
        const QString inCall = Connected + "phone.status=4"_q;
        // clang-format off
        QTest::addRow("keypad from the menu") << Connected << QStringList{keypad} << "DialKeypadViewState"_q << ""_q;
        QTest::addRow("no keypad from the call") << inCall << QStringList{keypad} << "CallInProgressViewState"_q << ""_q;
        QTest::addRow("recent calls from the call") << inCall << QStringList{recent} << "RecentCallsListViewState"_q << ""_q;
        QTest::addRow("recent calls from the keypad") << Connected << QStringList{keypad, recent} << "RecentCallsListViewState"_q << ""_q;
        QTest::addRow("reconnection failed during a call") << inCall << QStringList{"reconnect failed"_q} << "HmiPhone_Limbo"_q << "intent 70()"_q;
        QTest::addRow("notification on in the menu") << Connected << QStringList{notification} << "PhoneMenuViewState"_q << "event HmiPhone_ShowSmsRequest"_q;
        QTest::addRow("notification on in the keypad") << Connected << QStringList{keypad, notification} << "DialKeypadViewState"_q << ""_q;
        QTest::addRow("status 5 to 3: the call goes on") << Connected + "phone.status=5"_q << QStringList{"status=3"_q} << "CallInProgressViewState"_q << ""_q;
        QTest::addRow("status 3 to 2: the call ended") << Connected + "phone.status=3"_q << QStringList{"status=2"_q} << "HostHome"_q << "back 1"_q;
        // clang-format on
    }

    void navigation()
    {
        QFETCH(QString, data);
        QFETCH(QStringList, steps);
        QFETCH(QString, expected);
        QFETCH(QString, outputs);

        enter(build(data));
        qint64 since = 0;
        for (const QString &step : steps) {
            since = ScreenFixture::mark();
            if (step.startsWith(QLatin1String("status=")))
                setValues(QStringLiteral("phone.") + step);
            else if (step == QLatin1String("reconnect failed"))
                emit Mavrosk::PhoneSource::instance()
                        ->phoneDriverDoorOpenLinkLossReconnectFailedReceived();
            else if (step == QLatin1String("notification on"))
                setValues(QStringLiteral("phone.messageNotificationEnabled=true"));
            else
                since = ScreenFixture::post(step);
            TestSupport::processUntilIdle();
        }
        QVERIFY2(ScreenFixture::activeStates().contains(expected), qPrintable(expected));
        const QRegularExpression navigationOutputs(QStringLiteral("^(intent|event|back) "));
        QCOMPARE(PhoneRootFixture::outputs(since)
                         .filter(navigationOutputs)
                         .join(QLatin1String("; ")),
                 outputs);
    }

    // The phone-wide requests: Siri, do-not-disturb and dialling.
    void actions_data()
    {
        QTest::addColumn<QString>("data");
        QTest::addColumn<QString>("request");
        QTest::addColumn<QString>("outputs");

        const QString siri = Events::HmiPhone_SiriRequest,
                      dnd = Events::HmiPhone_DoNotDisturbToggleRequest,
                      call = QStringLiteral("makeCall");
        const QString siriOk = Connected + "phone.siriSupported=true phone.siriEnabled=true"_q;
        const QString refused
                = QStringLiteral("popup-request ") + Views::siriFeatureNotEnabledPopup;
        const QString number = Connected + "phone.callNumberEntered=0123"_q;
        const QString dial = QStringLiteral("phone.dialNumber(0123)");

        const QString popup = QStringLiteral("popup-request ");
        // clang-format off
        QTest::addRow("Siri activated") << siriOk << siri << "phone.toggleSiriActivation(true)"_q;
        QTest::addRow("Siri deactivated, voice session cancelled") << siriOk + " phone.siriActive=true speech.sessionState=3"_q << siri << "speech.cancelVRSession(); phone.toggleSiriActivation(false)"_q;
        QTest::addRow("Siri unsupported") << Connected + "phone.siriEnabled=true"_q << siri << refused;
        QTest::addRow("Siri disabled") << Connected + "phone.siriSupported=true"_q << siri << refused;
        QTest::addRow("Siri without a device") << siriOk.mid(Connected.size()) << siri << refused;
        QTest::addRow("DND on, whatever the key") << Connected + "ardel.ignitionKeyType=2"_q << dnd << "phone.enableDoNotDisturb()"_q;
        QTest::addRow("DND off") << Connected + "phone.doNotDisturb=true"_q << dnd << "phone.disableDoNotDisturb()"_q;
        QTest::addRow("DND off, allowed by the restricted key") << Connected + "phone.doNotDisturb=true ardel.ignitionKeyType=2 ardel.doNotDisturbOption=true"_q << dnd << "phone.disableDoNotDisturb()"_q;
        QTest::addRow("DND off, forbidden by the restricted key") << Connected + "phone.doNotDisturb=true ardel.ignitionKeyType=2"_q << dnd << popup + Views::PhoneDndActiveArdel;
        QTest::addRow("dial") << number << call << dial;
        QTest::addRow("dial roaming, warning off") << number + " phone.roaming=true"_q << call << dial;
        QTest::addRow("dial roaming, warning on") << number + " phone.roaming=true phone.roamingWarning=true"_q << call << popup + Views::RoamingWarning;
        // clang-format on
    }

    void actions()
    {
        QFETCH(QString, data);
        QFETCH(QString, request);
        QFETCH(QString, outputs);

        Phone_Cmp *phone = build(data);
        enter(phone);
        // The phone's screens alone: the global popups are not installed, and a request for one
        // is dropped with a word.
        if (outputs.contains(QLatin1String("popup-request"))
            && !outputs.endsWith(Views::PhoneDndActiveArdel))
            expectMessage(QtWarningMsg, QRegularExpression(QStringLiteral("dropped")));
        qint64 since = ScreenFixture::mark();
        if (request == QLatin1String("makeCall"))
            phone->makeCall();
        else
            since = ScreenFixture::post(request);
        QCOMPARE(PhoneRootFixture::outputs(since).join(QLatin1String("; ")), outputs);
        // The do-not-disturb popup belongs to the phone's own layer and shows while the phone does.
        if (outputs.endsWith(Views::PhoneDndActiveArdel))
            QCOMPARE(TestSupport::journalValues(QStringLiteral("popup-shown"), QStringLiteral("id"),
                                                since),
                     QStringList{Views::PhoneDndActiveArdel});
    }

private:
};

QTEST_GUILESS_MAIN(TestPhoneRoot)
#include "tst_phoneroot.moc"
