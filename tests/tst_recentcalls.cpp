// The recent-calls screen and the phone menu under a plain parent state of the root hierarchy,
// entered by transitions as the phone's root component does: popups shown, the phone's
// recent-call commands and the menu's voice-assistant transitions.

#include "testsupport.h"

#include <hmiphoneevents.h>
#include <hmiphoneviews.h>
#include <phonemenustate.h>
#include <recentcallsviewstate.h>

#include <brisken/viewcontroller.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmiabstracttransition.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmistate.h>
#include <quorvel/hmitransition.h>
#include <quorvel/namedstate.h>
#include <quorvel/statemachine.h>

#include <QAbstractTransition>
#include <QtTest>

using namespace HmiPhone;

namespace {

const QString EnterRecentCalls = QStringLiteral("Test_EnterRecentCalls");
const QString LeaveRecentCalls = QStringLiteral("Test_LeaveRecentCalls");
const QString EnterMenu = QStringLiteral("Test_EnterMenu");
const QEvent::Type KeepListTypeEvent = static_cast<QEvent::Type>(1263);

// Enters its target on a framework event of the given type.
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

// The phone's commands since `since`, as "member(args)".
QStringList phoneCalls(qint64 since)
{
    QStringList calls;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind != QLatin1String("bridge"))
            continue;
        QStringList args;
        for (const QVariant &arg : entry.fields.value(QStringLiteral("args")).toList())
            args.append(arg.toString());
        calls.append(
                entry.fields.value(QStringLiteral("call")).toString().section(QLatin1Char('.'), 1)
                + QLatin1Char('(') + args.join(QLatin1Char(',')) + QLatin1Char(')'));
    }
    return calls;
}

QStringList shownPopups()
{
    QStringList popups;
    for (const QString &id : Brisken::ViewController::instance()->shownPopups())
        popups.append(id.section(QLatin1Char('.'), 1));
    return popups;
}

void setListStatus(int status)
{
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("recentCallListStatus"),
                                                     status);
    TestSupport::processUntilIdle();
}

void post(const QString &event)
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(event));
    TestSupport::processUntilIdle();
}

} // namespace

class TestRecentCalls : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void entry_data();
    void entry();
    void statusChangesWhileShown_data();
    void statusChangesWhileShown();
    void requestRecentCallList_data();
    void requestRecentCallList();
    void menuVoiceAssistants_data();
    void menuVoiceAssistants();

private:
    void build();

    TestSupport::FrameworkWarningGuard m_warnings;
    RecentCallsViewState *m_recentCalls = nullptr;
    PhoneMenuState *m_menu = nullptr;
};

void TestRecentCalls::init()
{
    Mavrosk::resetAll();
    Platform::Journal::instance()->clear();
}

void TestRecentCalls::cleanup()
{
    Quorvel::StateMachine::destroyInstance();
    m_recentCalls = nullptr;
    m_menu = nullptr;
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

// The phone's root stand-in: the phone menu and recent calls, built as the root component does.
void TestRecentCalls::build()
{
    auto *machine = Quorvel::StateMachine::instance();
    auto *screens = machine->screensState();
    auto *home = new Quorvel::HmiState(QStringLiteral("Home"), screens);
    auto *phone = new Quorvel::HmiState(QStringLiteral("PhoneRoot"), screens);
    screens->setInitialHmiState(home);

    m_menu = new PhoneMenuState(Views::PhoneMenu, QStringLiteral("PhoneMenuViewState"), phone);
    m_recentCalls = new RecentCallsViewState(nullptr, Views::RecentCalls,
                                             QStringLiteral("RecentCallsListViewState"), phone);
    m_recentCalls->setHandlesBackEvent(true);
    phone->setInitialHmiState(m_menu);

    auto *enter = new Quorvel::HmiTransition(EnterRecentCalls, screens);
    enter->setTargetState(m_recentCalls);
    auto *keepType = new EventTypeTransition(KeepListTypeEvent, screens);
    keepType->setTargetState(m_recentCalls);
    auto *enterMenu = new Quorvel::HmiTransition(EnterMenu, screens);
    enterMenu->setTargetState(m_menu);
    auto *leave = new Quorvel::HmiTransition(LeaveRecentCalls, phone);
    leave->setTargetState(home);

    machine->start();
    TestSupport::processUntilIdle();
}

void TestRecentCalls::entry_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("keepType");
    QTest::addColumn<QStringList>("popups");
    QTest::addColumn<QStringList>("calls");

    const QString typeReset = QStringLiteral("setCurrentRecentCallListType(0)");
    QTest::addRow("list available")
            << 1 << false << QStringList()
            << QStringList{typeReset, QStringLiteral("downloadRecentCallsList()")};
    QTest::addRow("downloading") << 3 << false
                                 << QStringList{QStringLiteral("RecentCallsDownloading")}
                                 << QStringList{typeReset};
    QTest::addRow("failed call") << 4 << false
                                 << QStringList{QStringLiteral("RecentCallsFailedCallKOVA")}
                                 << QStringList{typeReset};
    QTest::addRow("retry error") << 5 << false
                                 << QStringList{QStringLiteral("RecentCallsRetryError")}
                                 << QStringList{typeReset};
    QTest::addRow("download failed")
            << 6 << false << QStringList{QStringLiteral("RecentCallsDownloadFailed")}
            << QStringList{typeReset};
    QTest::addRow("status 0 shows nothing at entry")
            << 0 << false << QStringList() << QStringList{typeReset};
    QTest::addRow("entry by event 1263 keeps the type")
            << 1 << true << QStringList()
            << QStringList{QStringLiteral("downloadRecentCallsList()")};
}

void TestRecentCalls::entry()
{
    QFETCH(int, status);
    QFETCH(bool, keepType);
    QFETCH(QStringList, popups);
    QFETCH(QStringList, calls);

    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("currentRecentCallListType"),
                                                     2);
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("recentCallListStatus"),
                                                     status);
    build();
    const qint64 since = Platform::Journal::instance()->lastSequence();

    if (keepType) {
        Quorvel::StateMachine::instance()->postEvent(new QEvent(KeepListTypeEvent));
        TestSupport::processUntilIdle();
    } else {
        post(EnterRecentCalls);
    }

    QVERIFY(Quorvel::NamedState::stateForName(QStringLiteral("RecentCallsListViewStateView"))
                    ->isActive());
    QCOMPARE(Brisken::ViewController::instance()->activeView(), Views::RecentCalls);
    QCOMPARE(shownPopups(), popups);
    QCOMPARE(phoneCalls(since), calls);
}

void TestRecentCalls::statusChangesWhileShown_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<int>("to");
    QTest::addColumn<QStringList>("popups");
    QTest::addColumn<QStringList>("calls");

    const QStringList noCalls;
    QTest::addRow("3 to 1: list downloaded")
            << 3 << 1 << QStringList() << QStringList{QStringLiteral("downloadRecentCallsList()")};
    QTest::addRow("1 to 3") << 1 << 3 << QStringList{QStringLiteral("RecentCallsDownloading")}
                            << noCalls;
    QTest::addRow("1 to 6") << 1 << 6 << QStringList{QStringLiteral("RecentCallsDownloadFailed")}
                            << noCalls;
    QTest::addRow("3 to 6") << 3 << 6 << QStringList{QStringLiteral("RecentCallsDownloadFailed")}
                            << noCalls;
    QTest::addRow("3 to 0") << 3 << 0 << QStringList{QStringLiteral("RecentCallsDownloadFailed")}
                            << noCalls;
    QTest::addRow("4 to 5") << 4 << 5 << QStringList{QStringLiteral("RecentCallsRetryError")}
                            << noCalls;
    QTest::addRow("5 to 4") << 5 << 4 << QStringList{QStringLiteral("RecentCallsFailedCallKOVA")}
                            << noCalls;
    QTest::addRow("6 to 2: popup closed") << 6 << 2 << QStringList() << noCalls;
}

// A status change closes the popup shown and the new status's popup stays on screen.
void TestRecentCalls::statusChangesWhileShown()
{
    QFETCH(int, from);
    QFETCH(int, to);
    QFETCH(QStringList, popups);
    QFETCH(QStringList, calls);

    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("recentCallListStatus"), from);
    build();
    post(EnterRecentCalls);
    const qint64 since = Platform::Journal::instance()->lastSequence();

    setListStatus(to);

    QCOMPARE(shownPopups(), popups);
    QCOMPARE(phoneCalls(since), calls);
    QVERIFY(m_recentCalls->isActive());
}

void TestRecentCalls::requestRecentCallList_data()
{
    QTest::addColumn<bool>("shown");
    QTest::addColumn<QStringList>("calls");

    QTest::addRow("recent calls shown")
            << true << QStringList{QStringLiteral("downloadRecentCallsList(0)")};
    QTest::addRow("recent calls not shown") << false << QStringList();
}

void TestRecentCalls::requestRecentCallList()
{
    QFETCH(bool, shown);
    QFETCH(QStringList, calls);

    build();
    if (shown)
        post(EnterRecentCalls);
    const qint64 since = Platform::Journal::instance()->lastSequence();

    post(Events::HmiPhone_RequestRecentCallList);

    QCOMPARE(phoneCalls(since), calls);
}

void TestRecentCalls::menuVoiceAssistants_data()
{
    QTest::addColumn<QString>("property");
    QTest::addColumn<bool>("from");
    QTest::addColumn<bool>("to");
    QTest::addColumn<bool>("menuShown");
    QTest::addColumn<int>("fired");

    QTest::addRow("Siri activated") << "siriActive" << false << true << true << 1;
    QTest::addRow("voice service activated")
            << "phoneVoiceServiceActive" << false << true << true << 1;
    QTest::addRow("Siri deactivated") << "siriActive" << true << false << true << 0;
    QTest::addRow("Siri activated, menu not shown") << "siriActive" << false << true << false << 0;
}

// Siri or the phone's voice service turning active while the menu is shown fires its
// parallel-exclusive transition; the menu stays.
void TestRecentCalls::menuVoiceAssistants()
{
    QFETCH(QString, property);
    QFETCH(bool, from);
    QFETCH(bool, to);
    QFETCH(bool, menuShown);
    QFETCH(int, fired);

    auto *phone = Mavrosk::PhoneSource::instance();
    phone->setBridgeValue(property, from);
    build();
    post(menuShown ? EnterMenu : EnterRecentCalls);

    const auto transitions = m_menu->findChildren<Quorvel::HmiAbstractTransition *>();
    QCOMPARE(transitions.size(), 2);
    QSignalSpy siri(transitions.at(0), &QAbstractTransition::triggered);
    QSignalSpy voiceService(transitions.at(1), &QAbstractTransition::triggered);
    for (auto *transition : transitions)
        QCOMPARE(transition->parallelExclusiveGroup(), 1);

    phone->setBridgeValue(property, to);
    TestSupport::processUntilIdle();

    QCOMPARE(siri.size() + voiceService.size(), fired);
    QCOMPARE(m_menu->isActive(), menuShown);
    if (menuShown)
        QCOMPARE(Brisken::ViewController::instance()->activeView(), Views::PhoneMenu);
}

QTEST_GUILESS_MAIN(TestRecentCalls)
#include "tst_recentcalls.moc"
