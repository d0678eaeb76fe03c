// The recent-calls screen and the phone menu under a plain parent state of the root hierarchy,
// entered by transitions as the phone's root component does.

#include "screenfixture.h"

#include <hmiphoneevents.h>
#include <hmiphoneviews.h>
#include <phonemenustate.h>
#include <recentcallsviewstate.h>

#include <brisken/viewcontroller.h>

#include <QtTest>

using namespace HmiPhone;
using namespace ScreenFixture;

namespace {

// The popups on screen (without "PHONE.RecentCalls") and the phone's commands since `since`.
QString screen(qint64 since)
{
    QStringList words;
    for (const QString &id : Brisken::ViewController::instance()->shownPopups())
        words << QString(id).remove(QStringLiteral("PHONE.RecentCalls"));
    for (const QString &command : bridgeCommandsSince(since))
        words << command.section(QLatin1Char('.'), 1);
    return words.join(QLatin1Char(' '));
}

} // namespace

class TestRecentCalls : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void tearDown() override { Quorvel::StateMachine::destroyInstance(); }

private slots:

    void entry_data()
    {
        QTest::addColumn<int>("status");
        QTest::addColumn<bool>("keepType");
        QTest::addColumn<QString>("screen");

        // clang-format off
        QTest::addRow("available") << 1 << false << "setCurrentRecentCallListType(0) downloadRecentCallsList()";
        QTest::addRow("downloading") << 3 << false << "Downloading setCurrentRecentCallListType(0)";
        QTest::addRow("failed call") << 4 << false << "FailedCallKOVA setCurrentRecentCallListType(0)";
        QTest::addRow("retry error") << 5 << false << "RetryError setCurrentRecentCallListType(0)";
        QTest::addRow("failed") << 6 << false << "DownloadFailed setCurrentRecentCallListType(0)";
        QTest::addRow("failed, status 0: no popup") << 0 << false << "setCurrentRecentCallListType(0)";
        QTest::addRow("returned to by back") << 1 << true << "downloadRecentCallsList()";
        // clang-format on
    }

    // Each entry shows the popup of the status, resets the list type (unless the driver comes back
    // to the screen) and downloads the list when it is available.
    void entry()
    {
        QFETCH(int, status);
        QFETCH(bool, keepType);
        QFETCH(QString, screen);

        start(QStringLiteral("currentRecentCallListType=2 recentCallListStatus=%1").arg(status));
        if (keepType) { // the driver opens the recent calls, then the menu
            post(QStringLiteral("Recent"));
            post(QStringLiteral("Menu"));
        }
        const qint64 since = mark();
        if (keepType)
            Brisken::ViewController::instance()->back();
        else
            post(QStringLiteral("Recent"));
        TestSupport::processUntilIdle();

        QCOMPARE(Brisken::ViewController::instance()->activeView(), Views::RecentCalls);
        QCOMPARE(::screen(since), screen);
    }

    void statusChangesWhileShown_data()
    {
        QTest::addColumn<int>("from");
        QTest::addColumn<int>("to");
        QTest::addColumn<QString>("screen");

        QTest::addRow("3 to 1: downloaded") << 3 << 1 << "downloadRecentCallsList()";
        QTest::addRow("1 to 3") << 1 << 3 << "Downloading";
        QTest::addRow("3 to 6") << 3 << 6 << "DownloadFailed";
        QTest::addRow("3 to 0") << 3 << 0 << "DownloadFailed";
        QTest::addRow("4 to 5") << 4 << 5 << "RetryError";
        QTest::addRow("5 to 4") << 5 << 4 << "FailedCallKOVA";
        QTest::addRow("6 to 2: closed") << 6 << 2 << "";
    }

    // A status change closes the popup shown; the new status's popup, requested for the same
    // change, stays on screen.
    void statusChangesWhileShown()
    {
        QFETCH(int, from);
        QFETCH(int, to);
        QFETCH(QString, screen);

        auto *phone = Mavrosk::PhoneSource::instance();
        start(QStringLiteral("recentCallListStatus=%1").arg(from));
        post(QStringLiteral("Recent"));
        const qint64 since = mark();
        phone->setBridgeValue(QStringLiteral("recentCallListStatus"), to);
        TestSupport::processUntilIdle();

        QCOMPARE(::screen(since), screen);
        QVERIFY(m_recentCalls->isActive());
    }

    // The reload request belongs to the screen: it reloads the current type only while shown.
    void requestRecentCallList()
    {
        start();
        qint64 since = mark();
        post(Events::HmiPhone_RequestRecentCallList);
        QCOMPARE(screen(since), QString());

        post(QStringLiteral("Recent"));
        since = mark();
        post(Events::HmiPhone_RequestRecentCallList);
        QCOMPARE(screen(since), QStringLiteral("downloadRecentCallsList(0)"));
    }

    void menuVoiceAssistants_data()
    {
        QTest::addColumn<QString>("property");
        QTest::addColumn<bool>("to");
        QTest::addColumn<QString>("shown");
        QTest::addColumn<int>("fired");

        QTest::addRow("Siri activated") << "siriActive" << true << "Menu" << 1;
        QTest::addRow("voice service activated")
                << "phoneVoiceServiceActive" << true << "Menu" << 1;
        QTest::addRow("Siri deactivated") << "siriActive" << false << "Menu" << 0;
        QTest::addRow("Siri activated elsewhere") << "siriActive" << true << "Recent" << 0;
    }

    // A voice assistant turning active while the menu is shown fires the menu's parallel-exclusive
    // transition; the menu stays.
    void menuVoiceAssistants()
    {
        QFETCH(QString, property);
        QFETCH(bool, to);
        QFETCH(QString, shown);
        QFETCH(int, fired);

        auto *phone = Mavrosk::PhoneSource::instance();
        start(property + QLatin1String(to ? "=false" : "=true"));
        post(shown);
        QSignalSpy siri(m_menu->transitions().at(0), &QAbstractTransition::triggered);
        QSignalSpy voiceService(m_menu->transitions().at(1), &QAbstractTransition::triggered);
        phone->setBridgeValue(property, to);
        TestSupport::processUntilIdle();

        QCOMPARE(siri.size() + voiceService.size(), fired);
        QCOMPARE(m_menu->isActive(), shown == QLatin1String("Menu"));
    }

private:
    // The menu and the recent calls under the phone's root stand-in, built as the root component
    // builds them; "Recent" opens the recent calls, "Menu" the menu.
    void start(const QString &values = QString())
    {
        Quorvel::HmiState *parent = buildRoot();
        for (const QString &value : values.split(QLatin1Char(' '), Qt::SkipEmptyParts))
            Mavrosk::PhoneSource::instance()->setBridgeValue(value.section(QLatin1Char('='), 0, 0),
                                                             value.section(QLatin1Char('='), 1));
        m_menu = new PhoneMenuState(Views::PhoneMenu, QStringLiteral("PhoneMenuViewState"), parent);
        m_recentCalls = new RecentCallsViewState(
                nullptr, Views::RecentCalls, QStringLiteral("RecentCallsListViewState"), parent);
        m_recentCalls->setHandlesBackEvent(true);
        parent->setInitialHmiState(m_menu);
        addOpener(QStringLiteral("Recent"), m_recentCalls);
        addOpener(QStringLiteral("Menu"), m_menu);
        ScreenFixture::start();
    }

    RecentCallsViewState *m_recentCalls = nullptr;
    PhoneMenuState *m_menu = nullptr;
};

QTEST_GUILESS_MAIN(TestRecentCalls)
#include "tst_recentcalls.moc"
