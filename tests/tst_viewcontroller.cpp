// The view controller: popups stacked per region and shown while their layer is active,
// dismissals, auto-dismiss, requests made during one notification, direct view requests and
// back navigation with the per-view back settings.

#include "testsupport.h"

#include <mavrosk/phonesource.h>

#include <brisken/popuputils.h>
#include <brisken/viewcontroller.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmiconditionalstate.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmilayeredstate.h>
#include <quorvel/hmitargetblacklistfilter.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QTest>

using namespace Quorvel;
using Brisken::ViewController;
using TestSupport::journalValues;
using TestSupport::processUntilIdle;

namespace {

QString id(const char *name)
{
    return QLatin1String("T.") + QLatin1String(name);
}

// A phone-like screen tree with the back settings of the phone screens, and popups.
struct Screens
{
    Screens()
    {
        machine = StateMachine::instance();
        HmiState *screens = machine->screensState();
        home = view("Home", screens);
        root = new HmiLayeredState(QStringLiteral("PhoneRoot"), screens);
        auto *choose = new HmiConditionalState(QStringLiteral("PhoneChoose"), root);
        call = new HmiState(QStringLiteral("Call"), root);
        HmiViewState *callView = view("CallView", call);
        callView->setHandlesBackEvent(true);
        callView->setBackStackStateId(QStringLiteral("PhoneRoot"), true);
        HmiViewState *inCallKeypad = view("InCallKeypad", call);
        inCallKeypad->setHasBackStackPresence(false);
        inCallKeypad->setBackTargetProviderState(callView);
        call->setInitialHmiState(callView);
        menu = view("Menu", root);
        menu->setBackStackStateId(QStringLiteral("PhoneRoot"), false);
        view("Keypad", root)->setHandlesBackEvent(true);
        auto *book = new HmiLayeredState(QStringLiteral("Book"), root);
        auto *bookChoose = new HmiConditionalState(QStringLiteral("BookChoose"), book);
        HmiViewState *bookList = view("BookList", book);
        bookList->createDirectBackTransition(root);
        bookList->setBackStackStateId(QStringLiteral("BookChoose"), false);
        view("BookSearch", book);
        bookChoose->setTargetState(bookList);
        book->setInitialHmiState(bookChoose);
        view("SmsList", root)
                ->addBackTargetFilter(QSharedPointer<HmiTargetFilter>(
                        new HmiTargetBlacklistFilter(QStringLiteral("SmsReply"))));
        view("SmsReply", root);
        QObject::connect(choose, &HmiConditionalState::conditionTest,
                         [this, choose] { choose->setTargetState(inCall ? call : menu); });
        root->setInitialHmiState(choose);
        screens->setInitialHmiState(home);

        globalA = new PopupState(id("A"), 1);
        globalB = new PopupState(id("B"), 1);
        globalHigh = new PopupState(id("High"), 2);
        layerPopup = new PopupState(id("Layer"), root, 1);
    }
    HmiViewState *view(const char *name, QState *parent)
    {
        return new HmiViewState(id(name), QLatin1String(name), parent);
    }
    void start(StateMachine::RootHierarchyTransitions transitions = {})
    {
        machine->installRootHierarchy(
                transitions,
                {{StateLevel3, globalA}, {StateLevel3, globalB}, {StateLevel2, globalHigh}});
        machine->start();
        processUntilIdle();
    }
    void goTo(const QString &name)
    {
        machine->goToState(NamedState::stateForName(name));
        processUntilIdle();
    }
    QString activeView() const
    {
        HmiViewState *view = HmiViewState::activeViewState();
        return view ? view->name() : QString();
    }

    StateMachine *machine;
    HmiViewState *home;
    HmiLayeredState *root;
    HmiState *call;
    HmiViewState *menu;
    PopupState *globalA;
    PopupState *globalB;
    PopupState *globalHigh;
    PopupState *layerPopup;
    bool inCall = false;
};

QStringList words(const char *text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

QStringList ids(const QStringList &names)
{
    QStringList result;
    for (const QString &name : names)
        result << QLatin1String("T.") + name;
    return result;
}

} // namespace

class TestViewController : public TestSupport::Suite
{
    Q_OBJECT
protected:
    void tearDown() override
    {
        StateMachine::destroyInstance();
        Platform::Journal::instance()->clear();
    }
private slots:

    // Operations: "+X" request, "-X" dismiss, "go:State" navigate.
    void popupStacking_data()
    {
        QTest::addColumn<QStringList>("operations");
        QTest::addColumn<QStringList>("shown");
        QTest::addColumn<QStringList>("globalStack");
        auto row = [](const char *tag, const char *operations, const char *shown,
                      const char *stack) {
            QTest::addRow("%s", tag) << words(operations) << ids(words(shown)) << ids(words(stack));
        };
        // clang-format off
        row("newest on top among equals", "+A +B", "B", "A B");
        row("higher priority stays above", "+High +A", "High", "A High");
        row("re-request moves up among equals", "+A +B +A", "A", "B A");
        row("dismissing the top reveals the next", "+A +B -B", "A", "A");
        row("dismissing below keeps the top", "+A +B -A", "B", "B");
        row("unknown identifier: dropped, and said", "+Nowhere", "", "");
        row("layer inactive: opens over the screen shown", "+Layer", "Layer", "Layer");
        row("... stays while its layer is entered", "+Layer go:Menu", "Layer", "Layer");
        row("... closes when its layer, once entered, is left", "+Layer go:Menu go:Home", "", "");
        row("layer active: shown beside the global one", "go:Menu +Layer +A", "A Layer", "A");
        row("leaving the layer closes its popups", "go:Menu +Layer go:Home go:Menu", "", "");
        // clang-format on
    }
    void popupStacking()
    {
        QFETCH(QStringList, operations);
        QFETCH(QStringList, shown);
        QFETCH(QStringList, globalStack);
        Screens screens;
        screens.start();
        ViewController *controller = ViewController::instance();
        QStringList requested;
        for (const QString &operation : operations) {
            const QString name = operation.mid(1);
            if (operation.startsWith(QLatin1String("go:")))
                screens.goTo(operation.mid(3));
            else if (operation == QLatin1String("+Nowhere"))
                expectMessage(QtWarningMsg,
                              QRegularExpression(QStringLiteral("T.Nowhere dropped")));
            if (operation.startsWith(QLatin1Char('+')))
                controller->requestPopup(id(name.toLatin1().constData()));
            else if (operation.startsWith(QLatin1Char('-')))
                controller->dismissPopup(id(name.toLatin1().constData()));
            processUntilIdle();
        }
        QCOMPARE(controller->shownPopups(), shown);
        QCOMPARE(screens.machine->popupStack(id("A")), globalStack);
        for (const QString &operation : operations) {
            if (operation.startsWith(QLatin1Char('+')))
                requested << id(operation.mid(1).toLatin1().constData());
        }
        QCOMPARE(journalValues(QStringLiteral("popup-request")), requested);
        QCOMPARE(journalValues(QStringLiteral("popup-dropped")),
                 requested.filter(QStringLiteral("Nowhere")));
    }

    // A state entering may ask for a popup of its own layer.
    void requestOnEntryOfLayer()
    {
        Screens screens;
        QObject::connect(screens.root, &QState::entered,
                         [] { ViewController::instance()->requestPopup(id("Layer")); });
        screens.start();
        screens.goTo(QStringLiteral("PhoneRoot"));
        QCOMPARE(ViewController::instance()->shownPopups(), ids({QStringLiteral("Layer")}));
    }

    // Popups closed for the module: after the auto-dismiss interval, with a registered
    // dismissing popup, or left by a module transition for another popup (no longer requested).
    void popupClosing_data()
    {
        QTest::addColumn<QString>("closing");
        QTest::addColumn<QStringList>("shown");
        QTest::addRow("auto-dismiss") << "auto" << ids({QStringLiteral("B")});
        QTest::addRow("dismissing popup") << "dismissing" << QStringList();
        QTest::addRow("left by a transition") << "transition" << ids({QStringLiteral("A")});
    }
    void popupClosing()
    {
        QFETCH(QString, closing);
        QFETCH(QStringList, shown);
        Screens screens;
        ViewController *controller = ViewController::instance();
        screens.globalA->setAutoDismissTimeoutActive(closing == QLatin1String("auto"));
        screens.globalA->setAutoDismissTimeoutInterval(20);
        if (closing == QLatin1String("dismissing"))
            screens.globalA->registerDismissingPopup(screens.globalB);
        (new HmiTransition(QStringLiteral("Accept"), screens.globalB))
                ->setTargetState(screens.globalHigh);
        screens.start();
        const bool autoDismiss = closing == QLatin1String("auto");
        controller->requestPopup(id(autoDismiss ? "B" : "A"));
        controller->requestPopup(id(autoDismiss ? "A" : "B"));
        processUntilIdle();
        if (autoDismiss) {
            QVERIFY(screens.globalA->isActive());
            QTRY_VERIFY(!screens.globalA->isActive());
            processUntilIdle();
            QCOMPARE(journalValues(QStringLiteral("popup-hidden")), ids({QStringLiteral("A")}));
        } else if (closing == QLatin1String("dismissing")) {
            controller->dismissPopup(id("B"));
        } else {
            screens.machine->postEvent(new HmiEvent(QStringLiteral("Accept")));
            processUntilIdle();
            QCOMPARE(screens.machine->popupStack(id("A")),
                     ids({QStringLiteral("A"), QStringLiteral("High")}));
            controller->dismissPopup(id("High"));
        }
        processUntilIdle();
        QCOMPARE(controller->shownPopups(), shown);
    }

    // Popup A (with the child states A1 and A2) open, B of the same priority covers it; then one
    // operation: "step" fires A1 -> A2, "leave" fires A -> the screen "Menu", "wait" lets A's
    // auto-dismiss run out, "+X"/"-X" request/dismiss. A covered popup stays an active state.
    void coveredPopup_data()
    {
        QTest::addColumn<QStringList>("operations");
        QTest::addColumn<QStringList>("journal"); // popup-shown/hidden/closed since B covered A
        QTest::addColumn<QStringList>("open");
        QTest::addColumn<QString>("active");
        QTest::addColumn<int>("exitsOfA");
        auto row = [](const char *tag, const char *operations, const char *journal,
                      const char *open, const char *active, int exits) {
            QTest::addRow("%s", tag) << words(operations) << words(journal) << ids(words(open))
                                     << QString::fromLatin1(active) << exits;
        };
        // clang-format off
        row("covered: A stays open in its state", "", "", "A B", "A1", 0);
        row("a transition from A to a screen closes only A", "leave", "popup-closed:T.A", "B", "Menu", 1);
        row("A's child state is kept and listens", "step -B", "popup-hidden:T.B popup-shown:T.A", "A", "A2", 0);
        row("A's auto-dismiss runs out while covered", "wait", "popup-closed:T.A", "B", "Home", 1);
        row("A dismissed while covered", "-A", "popup-closed:T.A", "B", "Home", 1);
        row("B dismissed: A shows again, not entered again", "-B", "popup-hidden:T.B popup-shown:T.A", "A", "A1", 0);
        row("A requested again: moves up, not entered again", "+A", "popup-hidden:T.B popup-shown:T.A", "B A", "A1", 0);
        // clang-format on
    }
    void coveredPopup()
    {
        QFETCH(QStringList, operations);
        QFETCH(QStringList, journal);
        QFETCH(QStringList, open);
        QFETCH(QString, active);
        QFETCH(int, exitsOfA);
        Screens screens;
        PopupState *a = screens.globalA;
        auto *a1 = new HmiState(QStringLiteral("A1"), a);
        (new HmiTransition(QStringLiteral("Step"), a1))
                ->setTargetState(new HmiState(QStringLiteral("A2"), a));
        a->setInitialState(a1);
        (new HmiTransition(QStringLiteral("Leave"), a))->setTargetState(screens.menu);
        a->setAutoDismissTimeoutActive(true);
        a->setAutoDismissTimeoutInterval(operations.contains(QStringLiteral("wait")) ? 30 : 60000);
        int entries = 0, exits = 0;
        QObject::connect(a, &QState::entered, [&] { ++entries; });
        QObject::connect(a, &QState::exited, [&] { ++exits; });
        screens.start();
        ViewController *controller = ViewController::instance();
        controller->requestPopup(id("A"));
        processUntilIdle();
        controller->requestPopup(id("B"));
        processUntilIdle();
        const qint64 since = TestSupport::mark();

        for (const QString &operation : operations) {
            const QByteArray name = operation.mid(1).toLatin1();
            if (operation == QLatin1String("wait"))
                QTRY_VERIFY(!a->isActive());
            else if (operation.startsWith(QLatin1Char('+')))
                controller->requestPopup(id(name.constData()));
            else if (operation.startsWith(QLatin1Char('-')))
                controller->dismissPopup(id(name.constData()));
            else
                screens.machine->postEvent(
                        new HmiEvent(operation.at(0).toUpper() + operation.mid(1)));
            processUntilIdle();
        }
        QCOMPARE(TestSupport::journalLines(since,
                                           {QStringLiteral("popup-shown"),
                                            QStringLiteral("popup-hidden"),
                                            QStringLiteral("popup-closed")})
                         .replaceInStrings(QStringLiteral(" "), QStringLiteral(":")),
                 journal);
        QCOMPARE(controller->openPopups(), open);
        QCOMPARE(controller->shownPopups(), QStringList{open.last()});
        QVERIFY2(NamedState::stateForName(active)->isActive(), qPrintable(active));
        QCOMPARE(entries, 1);
        QCOMPARE(exits, exitsOfA);
    }

    // Requests and dismissals made by the transitions of one notification take effect after all
    // of them, in the order made; a registered dismissing transition closes at once.
    void requestsDuringOneNotification_data()
    {
        QTest::addColumn<QString>("first");
        QTest::addColumn<QString>("second");
        QTest::addColumn<QStringList>("shown");
        // clang-format off
        QTest::addRow("request, then a transition closing the set") << "+A" << "close" << ids({QStringLiteral("A")});
        QTest::addRow("dismiss, then request") << "-A" << "+A" << ids({QStringLiteral("A")});
        QTest::addRow("request, then dismiss") << "+A" << "-A" << ids({QStringLiteral("B")});
        // clang-format on
    }
    void requestsDuringOneNotification()
    {
        QFETCH(QString, first);
        QFETCH(QString, second);
        QFETCH(QStringList, shown);
        Screens screens;
        Mavrosk::PhoneSource *source = Mavrosk::PhoneSource::instance();
        source->setStatus(0);
        StateMachine::RootHierarchyTransitions adopted;
        for (const QString &action : {first, second}) {
            QAbstractTransition *t = nullptr;
            if (action == QLatin1String("close")) {
                t = new GuardedSignalTransition(source, &Mavrosk::PhoneSource::statusChanged);
                Brisken::PopupUtils::makeExclusive(
                        t, QList<PopupState *>{screens.globalA, screens.globalB});
            } else {
                t = new GuardedPropertyChangeTransition(source, "status", {}, 3);
                QObject::connect(t, &QAbstractTransition::triggered, [action] {
                    if (action.startsWith(QLatin1Char('+')))
                        ViewController::instance()->requestPopup(id("A"));
                    else
                        ViewController::instance()->dismissPopup(id("A"));
                });
            }
            adopted.append({StateLevel3, t});
        }
        screens.start(adopted);
        ViewController::instance()->requestPopup(id("B"));
        processUntilIdle();
        source->setStatus(3);
        processUntilIdle();
        QCOMPARE(ViewController::instance()->shownPopups(), shown);
    }

    void showView_data()
    {
        QTest::addColumn<QString>("request");
        QTest::addColumn<QString>("activeView");
        QTest::addColumn<QString>("otherState"); // a further state of that name
        // clang-format off
        QTest::addRow("state name: the component chooses") << "PhoneRoot" << "Menu" << "";
        QTest::addRow("view identifier") << "T.Keypad" << "Keypad" << "";
        QTest::addRow("view identifier wins over a state's name") << "T.Keypad" << "Keypad" << "T.Keypad";
        QTest::addRow("unknown: recorded only") << "T.Nowhere" << "Home" << "";
        // clang-format on
    }
    void showView()
    {
        QFETCH(QString, request);
        QFETCH(QString, activeView);
        QFETCH(QString, otherState);
        if (!otherState.isEmpty())
            new HmiState(otherState, StateMachine::instance()->screensState());
        Screens screens;
        screens.start();
        ViewController::instance()->showView(request, QVariant(), false, QVariant());
        processUntilIdle();
        QCOMPARE(screens.activeView(), activeView);
        QCOMPARE(journalValues(QStringLiteral("view-request")), QStringList{request});
    }

    // Back handling of the phone screens.
    void back_data()
    {
        QTest::addColumn<QStringList>("path");
        QTest::addColumn<bool>("inCall");
        QTest::addColumn<int>("steps");
        QTest::addColumn<QString>("landsOn");
        QTest::addColumn<QStringList>("backStack");
        auto row = [](const char *tag, const char *path, bool inCall, int steps,
                      const char *landsOn, const char *stack) {
            QTest::addRow("%s", tag) << words(path) << inCall << steps
                                     << QString::fromLatin1(landsOn) << words(stack);
        };
        // clang-format off
        row("keypad back to the menu", "Menu Keypad", false, 1, "Menu", "Home Menu");
        row("menu back to home", "Menu", false, 1, "Home", "Home");
        row("two steps", "Menu Keypad", false, 2, "Home", "Home");
        row("back to the menu lets the root choose again", "Menu Keypad", true, 1, "CallView", "Home CallView");
        row("in-call keypad back where the call view goes", "Menu CallView InCallKeypad", false, 1, "Menu", "Home Menu");
        row("call view entry is unique", "CallView Menu CallView", false, 1, "Menu", "Home Menu");
        row("contacts list straight to the phone root", "Menu BookSearch BookList", false, 1, "Menu", "Home Menu BookSearch Menu");
        row("back to the contacts list re-enters its chooser", "BookList BookSearch", false, 1, "BookList", "Home BookList");
        row("message list skips the reply view", "SmsReply SmsList", false, 1, "Home", "Home");
        row("nothing to go back to", "Home", false, 1, "Home", "Home");
        // clang-format on
    }
    void back()
    {
        QFETCH(QStringList, path);
        QFETCH(bool, inCall);
        QFETCH(int, steps);
        QFETCH(QString, landsOn);
        QFETCH(QStringList, backStack);
        Screens screens;
        screens.start();
        for (const QString &state : path)
            screens.goTo(state);
        QCOMPARE(screens.activeView(), path.last());
        screens.inCall = inCall;
        ViewController::instance()->back(steps);
        processUntilIdle();
        QCOMPARE(screens.activeView(), landsOn);
        QCOMPARE(ViewController::instance()->backStack(), backStack);
        QCOMPARE(journalValues(QStringLiteral("back"), QStringLiteral("steps")),
                 QStringList{QString::number(steps)});
    }
};

QTEST_GUILESS_MAIN(TestViewController)
#include "tst_viewcontroller.moc"
