// The phone status alerts: the clear and fix popups per alert, the driver's decisions sent to
// the phone, and the retries of contact and message downloads.

#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphoneviews.h"
#include "phonestatusalerts.h"
#include "screenfixture.h"

#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/popupstate.h>

using namespace HmiPhone;
using namespace ScreenFixture;

namespace {
const QString OpenAlerts = QStringLiteral("Test_OpenAlerts");

QStringList popupRequestsSince(qint64 since)
{
    return TestSupport::journalValues(QStringLiteral("popup-request"), QStringLiteral("id"), since);
}

// The one expected entry, or none.
QStringList popups(const QString &popup)
{
    return popup.isEmpty() ? QStringList() : QStringList{popup};
}

Mavrosk::PhoneSource *phone()
{
    return Mavrosk::PhoneSource::instance();
}
} // namespace

class TestStatusAlerts : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        Quorvel::HmiState *parent = buildRoot();
        auto *alerts = new PhoneStatusAlerts(m_integration, QStringLiteral("PhoneStatusAlertsCmp"),
                                             parent);
        parent->setInitialHmiState(alerts);
        addOpener(OpenAlerts, alerts);
        start();
        post(OpenAlerts);
        QVERIFY(activeStates().contains(QStringLiteral("PhoneStatusAlertsViewState")));
        QCOMPARE(TestSupport::journalValues(QStringLiteral("view")).last(),
                 m_integration->createViewIdentifier(QStringLiteral("PhoneStatusAlerts")));
    }

    void tearDown() override { Quorvel::StateMachine::destroyInstance(); }

private slots:
    void initTestCase() { m_integration = new HmiPhoneIntegration(this); }

    void requests_data()
    {
        QTest::addColumn<QString>("event");
        QTest::addColumn<QVariant>("data");
        QTest::addColumn<QString>("popup"); // empty: none
        QTest::addColumn<QString>("command"); // empty: none

        const QString clear = Events::HmiPhone_ClearStatusAlertRequest;
        const QString fix = Events::HmiPhone_FixStatusAlertRequest;
        const QString permanently = Events::HmiPhone_ClearAlertPermanentlyRequest;
        const QString cycle = Events::HmiPhone_ClearAlertForThisCycleRequest;
        const QString call = Events::HmiPhone_CallForFixAlertRequest;
        auto fixData = [](const QVariant &id, const QVariant &number) {
            QVariantMap map{{QStringLiteral("alertId"), id},
                            {QStringLiteral("supportPhoneNumber"), number}};
            return QVariant(map);
        };
        // clang-format off
        QTest::addRow("clear 1001") << clear << QVariant(1001) << Views::PhoneStatusAlertPopup50 << QString();
        QTest::addRow("clear 1004 at once") << clear << QVariant(1004) << QString() << QStringLiteral("phone.clearAlertForThisCycle(1004)");
        QTest::addRow("clear 1005") << clear << QVariant(1005) << Views::PhoneStatusAlertPopup54 << QString();
        QTest::addRow("clear 1011") << clear << QVariant(1011) << QString() << QString();
        QTest::addRow("fix 1004") << fix << QVariant(1004) << Views::PhoneStatusAlertPopup63 << QString();
        QTest::addRow("fix 1010") << fix << QVariant(1010) << Views::PhoneStatusAlertPopup69 << QString();
        QTest::addRow("fix 1011") << fix << QVariant(1011) << QString() << QString();
        QTest::addRow("clear permanently") << permanently << QVariant(1003) << QString() << QStringLiteral("phone.clearAlertPermanently(1003)");
        QTest::addRow("clear permanently, negative id") << permanently << QVariant(-1) << QString() << QString();
        QTest::addRow("clear for this cycle, not a number") << cycle << QVariant(QStringLiteral("alert")) << QString() << QString();
        QTest::addRow("call for fix") << call << fixData(1005, QStringLiteral("0800123")) << QString() << QStringLiteral("phone.callForFixAlert(1005,0800123)");
        QTest::addRow("call for fix without a number") << call << fixData(1005, QVariant()) << QString() << QString();
        QTest::addRow("call for fix without an id") << call << fixData(QVariant(), QStringLiteral("0800123")) << QString() << QString();
        // clang-format on
    }

    void requests()
    {
        QFETCH(QString, event);
        QFETCH(QVariant, data);
        QFETCH(QString, popup);
        QFETCH(QString, command);

        const qint64 since = mark();
        post(event, data);
        QCOMPARE(popupRequestsSince(since), popups(popup));
        QCOMPARE(Quorvel::StateMachine::instance()->shownPopups(), popups(popup));
        QCOMPARE(bridgeCommandsSince(since), popups(command));
    }

    void retries_data()
    {
        QTest::addColumn<QString>("retry"); // empty: no retry requested
        QTest::addColumn<QString>("property");
        QTest::addColumn<int>("status");
        QTest::addColumn<QStringList>("commands"); // after the retry's own command
        QTest::addColumn<QString>("popup");

        const QString contacts = Events::HmiPhone_RetryDownloadContactRequest;
        const QString messages = Events::HmiPhone_RetryAccessTextMessagesRequest;
        const QString phoneBook = QStringLiteral("phoneBookStatus");
        const QString downloading = QStringLiteral("messagesDownloadingStatus");
        const QStringList clears{QStringLiteral("phone.clearAlertForThisCycle(1002)")};
        // clang-format off
        QTest::addRow("contacts downloading") << contacts << phoneBook << 2 << clears << QString();
        QTest::addRow("contacts failed") << contacts << phoneBook << 5 << QStringList() << Views::PhoneStatusAlertPopup70;
        QTest::addRow("contacts failed, no retry") << QString() << phoneBook << 5 << QStringList() << QString();
        QTest::addRow("messages running") << messages << downloading << 2 << QStringList() << QString();
        QTest::addRow("messages finished") << messages << downloading << 3 << clears << QString();
        QTest::addRow("messages failed") << messages << downloading << 4 << QStringList() << Views::PhoneStatusAlertPopup75;
        // clang-format on
    }

    void retries()
    {
        QFETCH(QString, retry);
        QFETCH(QString, property);
        QFETCH(int, status);
        QFETCH(QStringList, commands);
        QFETCH(QString, popup);

        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("phoneDevice"), 3);
        qint64 since = mark();
        if (!retry.isEmpty()) {
            post(retry, 1002);
            const QString retryCommand = retry == Events::HmiPhone_RetryDownloadContactRequest
                    ? QStringLiteral("phone.retryPhoneBookDownload(3)")
                    : QStringLiteral("phone.retrySmsDownload()");
            QCOMPARE(bridgeCommandsSince(since), QStringList{retryCommand});
        }

        since = mark();
        phone()->setBridgeValue(property, status);
        TestSupport::processUntilIdle();
        QCOMPARE(bridgeCommandsSince(since), commands);
        QCOMPARE(popupRequestsSince(since), popups(popup));
        QCOMPARE(Quorvel::StateMachine::instance()->shownPopups(), popups(popup));
        if (!popup.isEmpty()) {
            Quorvel::PopupState *shown = Quorvel::StateMachine::instance()->popupState(popup);
            QVERIFY(shown->autoDismissTimeoutActive());
            QCOMPARE(shown->autoDismissTimeoutInterval(), 3000);
        }
    }

    void reEntryForgetsContactRetryOnly()
    {
        post(Events::HmiPhone_RetryDownloadContactRequest, 1002);
        post(Events::HmiPhone_RetryAccessTextMessagesRequest, 1006);
        post(OpenHome);
        post(OpenAlerts);

        const qint64 since = mark();
        phone()->setBridgeValue(QStringLiteral("phoneBookStatus"), 2);
        TestSupport::processUntilIdle();
        phone()->setBridgeValue(QStringLiteral("phoneBookStatus"), 5);
        TestSupport::processUntilIdle();
        phone()->setBridgeValue(QStringLiteral("messagesDownloadingStatus"), 3);
        TestSupport::processUntilIdle();
        phone()->setBridgeValue(QStringLiteral("messagesDownloadingStatus"), 4);
        TestSupport::processUntilIdle();

        QCOMPARE(bridgeCommandsSince(since),
                 QStringList{QStringLiteral("phone.clearAlertForThisCycle(1006)")});
        QCOMPARE(popupRequestsSince(since), QStringList{Views::PhoneStatusAlertPopup75});
    }

private:
    HmiPhoneIntegration *m_integration = nullptr;
};

QTEST_GUILESS_MAIN(TestStatusAlerts)
#include "tst_statusalerts.moc"
