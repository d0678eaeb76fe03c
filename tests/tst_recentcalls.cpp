// The recent-calls screen and the phone menu under a plain parent state of the root hierarchy,
// entered by transitions as the phone's root component does.

#include "testsupport.h"

#include <hmiphoneevents.h>
#include <hmiphoneviews.h>
#include <phonemenustate.h>
#include <recentcallsviewstate.h>

#include <brisken/viewcontroller.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmitransition.h>
#include <quorvel/statemachine.h>

#include <QtTest>

using namespace HmiPhone;

namespace {

const QEvent::Type KeepListTypeEvent = static_cast<QEvent::Type>(1263);

// Enters its target on a framework event of one type.
class EventTypeTransition : public QAbstractTransition
{
public:
    EventTypeTransition(QEvent::Type type, QState *source)
        : QAbstractTransition(source)
        , m_type(type)
    { }

protected:
    bool eventTest(QEvent *event) override { return event->type() == m_type; }
    void onTransition(QEvent *) override { }

private:
    QEvent::Type m_type;
};

// The popups on screen (without "PHONE.RecentCalls") and the phone's commands since `since`.
QString screen(qint64 since)
{
    QStringList words;
    for (const QString &id : Brisken::ViewController::instance()->shownPopups())
        words << QString(id).remove(QStringLiteral("PHONE.RecentCalls"));
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind != QLatin1String("bridge"))
            continue;
        QStringList args;
        for (const QVariant &arg : entry.fields.value(QStringLiteral("args")).toList())
            args << arg.toString();
        words << entry.fields.value(QStringLiteral("call")).toString().section(QLatin1Char('.'), 1)
                        + QLatin1Char('(') + args.join(QLatin1Char(',')) + QLatin1Char(')');
    }
    return words.join(QLatin1Char(' '));
}

void post(QEvent *event)
{
    Quorvel::StateMachine::instance()->postEvent(event);
    TestSupport::processUntilIdle();
}

void post(const QString &event)
{
    post(new Quorvel::HmiEvent(event));
}

} // namespace

class TestRecentCalls : public QObject
{
    Q_OBJECT

private slots:
    void init() { Mavrosk::resetAll(); }
    void cleanup()
    {
        Quorvel::StateMachine::destroyInstance();
        QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
    }

    void entry_data();
    void entry();
    void statusChangesWhileShown_data();
    void statusChangesWhileShown();
    void requestRecentCallList();
    void menuVoiceAssistants_data();
    void menuVoiceAssistants();

private:
    // A home screen and the phone's root stand-in with the menu and recent calls, built as the
    // root component builds them.
    void start()
    {
        auto *machine = Quorvel::StateMachine::instance();
        auto *screens = machine->screensState();
        auto *home = new Quorvel::HmiState(QStringLiteral("Home"), screens);
        auto *root = new Quorvel::HmiState(QStringLiteral("PhoneRoot"), screens);
        screens->setInitialHmiState(home);
        m_menu = new PhoneMenuState(Views::PhoneMenu, QStringLiteral("PhoneMenuViewState"), root);
        m_recentCalls = new RecentCallsViewState(nullptr, Views::RecentCalls,
                                                 QStringLiteral("RecentCallsListViewState"), root);
        m_recentCalls->setHandlesBackEvent(true);
        root->setInitialHmiState(m_menu);
        (new Quorvel::HmiTransition(QStringLiteral("Recent"), screens))
                ->setTargetState(m_recentCalls);
        (new EventTypeTransition(KeepListTypeEvent, screens))->setTargetState(m_recentCalls);
        (new Quorvel::HmiTransition(QStringLiteral("Menu"), screens))->setTargetState(m_menu);
        machine->start();
        TestSupport::processUntilIdle();
    }

    TestSupport::FrameworkWarningGuard m_warnings;
    RecentCallsViewState *m_recentCalls = nullptr;
    PhoneMenuState *m_menu = nullptr;
};

void TestRecentCalls::entry_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("keepType");
    QTest::addColumn<QString>("screen");

    QTest::addRow("available") << 1 << false
                               << "setCurrentRecentCallListType(0) downloadRecentCallsList()";
    QTest::addRow("downloading") << 3 << false << "Downloading setCurrentRecentCallListType(0)";
    QTest::addRow("failed call") << 4 << false << "FailedCallKOVA setCurrentRecentCallListType(0)";
    QTest::addRow("retry error") << 5 << false << "RetryError setCurrentRecentCallListType(0)";
    QTest::addRow("failed") << 6 << false << "DownloadFailed setCurrentRecentCallListType(0)";
    QTest::addRow("failed, status 0: no popup") << 0 << false << "setCurrentRecentCallListType(0)";
    QTest::addRow("entered by event 1263") << 1 << true << "downloadRecentCallsList()";
}

// Each entry shows the popup of the status, resets the list type (unless entered by an event of
// type 1263) and downloads the list when it is available.
void TestRecentCalls::entry()
{
    QFETCH(int, status);
    QFETCH(bool, keepType);
    QFETCH(QString, screen);

    auto *phone = Mavrosk::PhoneSource::instance();
    phone->setBridgeValue(QStringLiteral("currentRecentCallListType"), 2);
    phone->setBridgeValue(QStringLiteral("recentCallListStatus"), status);
    start();
    const qint64 since = Platform::Journal::instance()->lastSequence();
    keepType ? post(new QEvent(KeepListTypeEvent)) : post(QStringLiteral("Recent"));

    QCOMPARE(Brisken::ViewController::instance()->activeView(), Views::RecentCalls);
    QCOMPARE(::screen(since), screen);
}

void TestRecentCalls::statusChangesWhileShown_data()
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

// A status change closes the popup shown; the new status's popup, requested for the same change,
// stays on screen.
void TestRecentCalls::statusChangesWhileShown()
{
    QFETCH(int, from);
    QFETCH(int, to);
    QFETCH(QString, screen);

    auto *phone = Mavrosk::PhoneSource::instance();
    phone->setBridgeValue(QStringLiteral("recentCallListStatus"), from);
    start();
    post(QStringLiteral("Recent"));
    const qint64 since = Platform::Journal::instance()->lastSequence();
    phone->setBridgeValue(QStringLiteral("recentCallListStatus"), to);
    TestSupport::processUntilIdle();

    QCOMPARE(::screen(since), screen);
    QVERIFY(m_recentCalls->isActive());
}

// The reload request belongs to the screen: it reloads the current type only while shown.
void TestRecentCalls::requestRecentCallList()
{
    start();
    qint64 since = Platform::Journal::instance()->lastSequence();
    post(Events::HmiPhone_RequestRecentCallList);
    QCOMPARE(screen(since), QString());

    post(QStringLiteral("Recent"));
    since = Platform::Journal::instance()->lastSequence();
    post(Events::HmiPhone_RequestRecentCallList);
    QCOMPARE(screen(since), QStringLiteral("downloadRecentCallsList(0)"));
}

void TestRecentCalls::menuVoiceAssistants_data()
{
    QTest::addColumn<QString>("property");
    QTest::addColumn<bool>("to");
    QTest::addColumn<QString>("shown");
    QTest::addColumn<int>("fired");

    QTest::addRow("Siri activated") << "siriActive" << true << "Menu" << 1;
    QTest::addRow("voice service activated") << "phoneVoiceServiceActive" << true << "Menu" << 1;
    QTest::addRow("Siri deactivated") << "siriActive" << false << "Menu" << 0;
    QTest::addRow("Siri activated elsewhere") << "siriActive" << true << "Recent" << 0;
}

// A voice assistant turning active while the menu is shown fires the menu's parallel-exclusive
// transition; the menu stays.
void TestRecentCalls::menuVoiceAssistants()
{
    QFETCH(QString, property);
    QFETCH(bool, to);
    QFETCH(QString, shown);
    QFETCH(int, fired);

    auto *phone = Mavrosk::PhoneSource::instance();
    phone->setBridgeValue(property, !to);
    start();
    post(shown);
    QSignalSpy siri(m_menu->transitions().at(0), &QAbstractTransition::triggered);
    QSignalSpy voiceService(m_menu->transitions().at(1), &QAbstractTransition::triggered);
    phone->setBridgeValue(property, to);
    TestSupport::processUntilIdle();

    QCOMPARE(siri.size() + voiceService.size(), fired);
    QCOMPARE(m_menu->isActive(), shown == QLatin1String("Menu"));
}

QTEST_GUILESS_MAIN(TestRecentCalls)
#include "tst_recentcalls.moc"
