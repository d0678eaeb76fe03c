// The GUI framework's services: view identifiers, the data store, the status bar, the request
// objects that modules connect to their transitions, the module controller and menu actions.

#include "testsupport.h"

#include <brisken/conditionalshowtransientorpopuprequest.h>
#include <brisken/datastore.h>
#include <brisken/dismisspopup.h>
#include <brisken/hidetransientrequest.h>
#include <brisken/hmiaction.h>
#include <brisken/modulecontroller.h>
#include <brisken/popuputils.h>
#include <brisken/requestpopup.h>
#include <brisken/requestview.h>
#include <brisken/showtransientorpopuprequest.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewcontroller.h>
#include <brisken/viewmanager.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QRegularExpression>
#include <QSignalSpy>
#include <QTest>

using Brisken::DataStore;
using Brisken::StatusBarController;
using Brisken::ViewManager;
using Platform::Journal;

namespace {

// Made while the library loads, before any application object exists.
const QString loadTimeIdentifier
        = ViewManager::viewIdentifier(QStringLiteral("PHONE"), QStringLiteral("PhoneMenu"));

StatusBarController *sharedStatusBar()
{
    return DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"));
}

// A running machine with one screen, two global popups and a source-less transition on "Fire".
struct Machine
{
    Machine()
    {
        machine = Quorvel::StateMachine::instance();
        auto *home = new Quorvel::HmiViewState(QStringLiteral("T.Home"), QStringLiteral("Home"),
                                               machine->screensState());
        machine->screensState()->setInitialHmiState(home);
        first = new Quorvel::PopupState(QStringLiteral("T.First"), 1);
        second = new Quorvel::PopupState(QStringLiteral("T.Second"), 1);
        fire = new Quorvel::HmiTransition(QStringLiteral("Fire"));
        QObject::connect(fire, &QAbstractTransition::triggered, [this] { ++fired; });
        machine->installRootHierarchy(
                {{Quorvel::StateLevel3, fire}},
                {{Quorvel::StateLevel3, first}, {Quorvel::StateLevel3, second}});
    }
    ~Machine() { Quorvel::StateMachine::destroyInstance(); }
    void start()
    {
        machine->start();
        TestSupport::processUntilIdle();
    }

    Quorvel::StateMachine *machine;
    Quorvel::PopupState *first;
    Quorvel::PopupState *second;
    Quorvel::HmiTransition *fire;
    int fired = 0;
};

} // namespace

class TestBriskenServices : public TestSupport::Suite
{
    Q_OBJECT
protected:
    void tearDown() override { DataStore::reset(); }
private slots:

    void viewIdentifier()
    {
        QCOMPARE(loadTimeIdentifier, QStringLiteral("PHONE.PhoneMenu"));
        QCOMPARE(ViewManager::viewIdentifier(QStringLiteral("PHONE"), QStringLiteral("PhoneMenu")),
                 loadTimeIdentifier);
    }

    void dataStore()
    {
        auto *viewManager = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
        QVERIFY(viewManager);
        QVERIFY(sharedStatusBar());
        QVERIFY(!DataStore::get(QStringLiteral("NoSuchService")));

        QSignalSpy contextSpy(viewManager, &ViewManager::displayContextChanged);
        viewManager->setDisplayContext(5);
        viewManager->setDisplayContext(5);
        QCOMPARE(viewManager->displayContext(), 5);
        QCOMPARE(contextSpy.size(), 1);

        DataStore::remove(QStringLiteral("StatusBarController"));
        QVERIFY(!sharedStatusBar());
        {
            StatusBarController hostStatusBar;
            DataStore::set(QStringLiteral("StatusBarController"), &hostStatusBar);
            QCOMPARE(sharedStatusBar(), &hostStatusBar);
        }
        // The store does not keep an object the host destroyed.
        QVERIFY(!sharedStatusBar());

        DataStore::reset();
        QCOMPARE(DataStore::get<ViewManager>(QStringLiteral("ViewManager")), viewManager);
        QCOMPARE(viewManager->displayContext(), 0);
        QVERIFY(sharedStatusBar());
    }

    void statusBar()
    {
        StatusBarController *bar = sharedStatusBar();
        QSignalSpy visibleSpy(bar, &StatusBarController::statusBarVisibleChanged);
        QVERIFY(bar->statusBarVisible());
        bar->setStatusBarVisible(true);
        bar->setStatusBarVisible(false);
        QCOMPARE(visibleSpy.size(), 1);
        QCOMPARE(visibleSpy.first().first().toBool(), false);

        const qint64 since = Journal::instance()->lastSequence();
        bar->requestTransientWidget(QStringLiteral("First"), 0);
        bar->requestTransientWidget(QStringLiteral("Second"), 3);
        bar->hideTransientWidget(QStringLiteral("First"));
        QCOMPARE(TestSupport::journalLines(since),
                 (QStringList{QStringLiteral("transient First"), QStringLiteral("transient Second"),
                              QStringLiteral("transient-hide First")}));
        QCOMPARE(TestSupport::journalValues(QStringLiteral("transient"), QStringLiteral("value"),
                                            since),
                 (QStringList{QStringLiteral("0"), QStringLiteral("3")}));
        QCOMPARE(bar->transientWidgets(), QStringList{QStringLiteral("Second")});
    }

    // Built once, each request object runs each time its signal fires, in the order connected.
    void requestObjects()
    {
        Machine machine;
        machine.start();
        StatusBarController *bar = sharedStatusBar();
        StatusBarController hiddenBar;
        hiddenBar.setStatusBarVisible(false);
        QObject siri;
        siri.setProperty("siriActive", true);
        const QString note = QStringLiteral("Note");
        const QString popup = QStringLiteral("T.Second");
        QObject trigger;
        auto add = [&trigger](auto request) {
            QObject::connect(&trigger, &QObject::objectNameChanged, request);
        };
        add(Brisken::RequestPopup(machine.first, QVariant()));
        add(Brisken::DismissPopup(QStringLiteral("T.First")));
        add(Brisken::RequestView(Quorvel::NamedState::stateForName(QStringLiteral("Home"))));
        add(Brisken::ShowTransientOrPopupRequest(bar, note, popup));
        add(Brisken::ShowTransientOrPopupRequest(&hiddenBar, note, popup));
        add(Brisken::ShowTransientOrPopupRequest(nullptr, note, popup));
        add(Brisken::ConditionalShowTransientOrPopupRequest(bar, note, popup, &siri, "siriActive",
                                                            true));
        add(Brisken::ConditionalShowTransientOrPopupRequest(bar, note, popup, &siri, "siriActive",
                                                            false));
        add(Brisken::HideTransientRequest(bar, note));
        const qint64 since = TestSupport::mark();

        trigger.setObjectName(QStringLiteral("once"));
        trigger.setObjectName(QStringLiteral("twice"));

        const QStringList once{
                QStringLiteral("popup-request T.First"),  QStringLiteral("popup-dismiss T.First"),
                QStringLiteral("view-request Home"),      QStringLiteral("transient Note"),
                QStringLiteral("popup-request T.Second"), QStringLiteral("popup-request T.Second"),
                QStringLiteral("transient Note"),         QStringLiteral("transient-hide Note")};
        QCOMPARE(TestSupport::journalLines(
                         since,
                         {QStringLiteral("popup-request"), QStringLiteral("popup-dismiss"),
                          QStringLiteral("view-request"), QStringLiteral("transient"),
                          QStringLiteral("transient-hide")}),
                 once + once);
    }

    void actionEnabledBinding()
    {
        Brisken::HmiAction action(hmiActionNameTr("Phone"), QStringLiteral("settings/icon_phone"),
                                  3);
        action.setTranslationContext(QStringLiteral("Some::Context"));
        QCOMPARE(action.text(), QStringLiteral("Phone"));
        StatusBarController sender;
        QVERIFY(action.enabledBinding(&sender, SIGNAL(statusBarVisibleChanged(bool))));
        QSignalSpy triggered(&action, &Brisken::HmiAction::triggered);

        emit sender.statusBarVisibleChanged(false);
        action.trigger();
        QVERIFY(!action.isEnabled());
        emit sender.statusBarVisibleChanged(true);
        action.trigger();
        QVERIFY(action.isEnabled());
        QCOMPARE(triggered.size(), 1);

        expectMessage(QtWarningMsg, QRegularExpression(QStringLiteral("No such signal")));
        expectMessage(QtCriticalMsg, QRegularExpression(QStringLiteral("cannot bind")));
        QVERIFY(!action.enabledBinding(&sender, SIGNAL(noSuchSignal(bool))));
    }

    // Events posted through the module controller or straight to the machine: journaled once
    // when posted, handled later, held until the machine runs.
    void postedEvents_data()
    {
        QTest::addColumn<bool>("startFirst");
        QTest::addColumn<bool>("viaController");
        QTest::addRow("controller, running machine") << true << true;
        QTest::addRow("controller, before the machine starts") << false << true;
        QTest::addRow("straight to the machine, running") << true << false;
        QTest::addRow("straight to the machine, before it starts") << false << false;
    }

    void postedEvents()
    {
        QFETCH(bool, startFirst);
        QFETCH(bool, viaController);
        // Held for a machine destroyed before it started: never reaches the next one.
        Brisken::ModuleController().postEvent(new Quorvel::HmiEvent(QStringLiteral("Fire"), 7));
        Quorvel::StateMachine::destroyInstance();
        Machine machine;
        if (startFirst)
            machine.start();
        Brisken::ModuleController controller;
        const qint64 since = Journal::instance()->lastSequence();

        for (auto *event : {new Quorvel::HmiEvent(QStringLiteral("Fire"), 42),
                            new Quorvel::HmiEvent(QStringLiteral("fire"))}) {
            if (viaController)
                controller.postEvent(event);
            else
                machine.machine->postEvent(event);
        }

        QCOMPARE(machine.fired, 0);
        QCOMPARE(TestSupport::journalValues(QStringLiteral("event"), QStringLiteral("name"), since),
                 (QStringList{QStringLiteral("Fire"), QStringLiteral("fire")}));
        QCOMPARE(TestSupport::journalValues(QStringLiteral("event"), QStringLiteral("value"), since)
                         .first(),
                 QStringLiteral("42"));
        if (!startFirst)
            machine.start();
        TestSupport::processUntilIdle();
        QCOMPARE(machine.fired, 1);
        QCOMPARE(machine.fire->transitionData(), QVariant(42));
    }

    void makeExclusiveClosesPopups()
    {
        Machine machine;
        machine.start();
        auto *other = new Quorvel::HmiTransition(QStringLiteral("Other"));
        machine.machine->installRootHierarchy({{Quorvel::StateLevel3, other}}, {});
        Brisken::PopupUtils::makeExclusive(machine.fire,
                                           QList<Quorvel::PopupState *>{machine.first});
        Brisken::PopupUtils::makeExclusive(other, {machine.second});
        Brisken::ViewController *views = Brisken::ViewController::instance();
        views->requestPopup(QStringLiteral("T.First"));
        views->requestPopup(QStringLiteral("T.Second"));
        TestSupport::processUntilIdle();

        machine.machine->postEvent(new Quorvel::HmiEvent(QStringLiteral("Fire")));
        TestSupport::processUntilIdle();

        QCOMPARE(views->shownPopups(), QStringList{QStringLiteral("T.Second")});
        QCOMPARE(machine.machine->popupStack(QStringLiteral("T.First")),
                 QStringList{QStringLiteral("T.Second")});
    }
};

QTEST_GUILESS_MAIN(TestBriskenServices)
#include "tst_brisken_services.moc"
