// The guards of the global transitions as tables: the phone's data when a notification arrives,
// and whether the guarded transition then fires, seen through what the HMI shows.

#include "globalhmi.h"

#include <brisken/viewmanager.h>
#include <mavrosk/navsource.h>
#include <mavrosk/projectionsource.h>

using namespace HmiPhone;

namespace {

Mavrosk::PhoneSource *phone()
{
    return GlobalHmi::phone();
}

void setProjection(int mode, bool rendering)
{
    Mavrosk::ProjectionSource::instance()->setProjectionMode(mode);
    Mavrosk::ProjectionSource::instance()->setIsRendering(rendering);
}

QStringList popupRequestsSince(qint64 since)
{
    return GlobalHmi::outputsSince(since).filter(QStringLiteral("popup-request"));
}

} // namespace

class TestGlobalGuards : public GlobalSuite
{
    Q_OBJECT

private slots:

    void incomingCall_data();
    void incomingCall();
    void incomingCallAfterProjection_data();
    void incomingCallAfterProjection();
    void callConnected_data();
    void callConnected();
};

void TestGlobalGuards::incomingCall_data()
{
    QTest::addColumn<int>("projectionMode");
    QTest::addColumn<bool>("rendering");
    QTest::addColumn<bool>("popup");

    QTest::addRow("no projection") << 0 << false << true;
    QTest::addRow("projection 1, not rendering") << 1 << false << false;
    QTest::addRow("projection 1, rendering") << 1 << true << true;
    QTest::addRow("projection 2, not rendering") << 2 << false << true;
}

void TestGlobalGuards::incomingCall()
{
    QFETCH(int, projectionMode);
    QFETCH(bool, rendering);
    QFETCH(bool, popup);
    setProjection(projectionMode, rendering);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::mark();
    phone()->setIncomingCall(true);
    TestSupport::processUntilIdle();
    QCOMPARE(popupRequestsSince(since).contains(QStringLiteral("popup-request IncomingCall")),
             popup);
}

void TestGlobalGuards::incomingCallAfterProjection_data()
{
    QTest::addColumn<bool>("ringing");
    QTest::addColumn<bool>("doNotDisturb");
    QTest::addColumn<int>("projectionMode");
    QTest::addColumn<bool>("popup");

    QTest::addRow("ringing, projection gone") << true << false << 0 << true;
    QTest::addRow("ringing, projection still on") << true << false << 1 << false;
    QTest::addRow("not ringing") << false << false << 0 << false;
    QTest::addRow("do not disturb") << true << true << 0 << false;
}

// A call that rang while a projection owned it comes to the HMI when the projection ends.
void TestGlobalGuards::incomingCallAfterProjection()
{
    QFETCH(bool, ringing);
    QFETCH(bool, doNotDisturb);
    QFETCH(int, projectionMode);
    QFETCH(bool, popup);
    phone()->setIncomingCall(ringing);
    phone()->setDoNotDisturb(doNotDisturb);
    setProjection(projectionMode, false);
    QVERIFY(m_hmi->run());

    const qint64 since = GlobalHmi::mark();
    emit Mavrosk::ProjectionSource::instance()->projectionNotActive(true);
    TestSupport::processUntilIdle();
    QCOMPARE(popupRequestsSince(since),
             popup ? QStringList{QStringLiteral("popup-request IncomingCall")} : QStringList());
}

void TestGlobalGuards::callConnected_data()
{
    QTest::addColumn<int>("displayContext");
    QTest::addColumn<bool>("routeActive");
    QTest::addColumn<bool>("callConnected");
    QTest::addColumn<bool>("dialing");
    QTest::addColumn<bool>("callScreen");

    QTest::addRow("context 0, connected") << 0 << false << true << false << true;
    QTest::addRow("context 0, dialling") << 0 << false << false << true << true;
    QTest::addRow("context 0, no call") << 0 << false << false << false << false;
    QTest::addRow("context 1, connected") << 1 << false << true << false << false;
    QTest::addRow("context 5, route active") << 5 << true << true << false << false;
    QTest::addRow("context 5, no route") << 5 << false << true << false << true;
    QTest::addRow("context 6, route active") << 6 << true << true << false << true;
}

void TestGlobalGuards::callConnected()
{
    QFETCH(int, displayContext);
    QFETCH(bool, routeActive);
    QFETCH(bool, callConnected);
    QFETCH(bool, dialing);
    QFETCH(bool, callScreen);
    Brisken::DataStore::get<Brisken::ViewManager>(QStringLiteral("ViewManager"))
            ->setDisplayContext(displayContext);
    Mavrosk::NavSource::instance()->setRouteActive(routeActive);
    QVERIFY(m_hmi->run());

    phone()->setCallConnected(callConnected);
    phone()->setDialingInProgress(dialing);
    phone()->setStatus(callConnected ? 7 : 3);
    TestSupport::processUntilIdle();
    QCOMPARE(GlobalHmi::isActive(QStringLiteral("PhoneCallCmp")), callScreen);
}

QTEST_GUILESS_MAIN(TestGlobalGuards)
#include "tst_globalguards.moc"
