// The state framework: one machine with its root hierarchy, adopted transitions, fan-out of one
// notification to every enabled transition, the transition kinds and the state kinds.

#include "testsupport.h"

#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmiconditionalstate.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmilayeredstate.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/intsignaltransition.h>
#include <quorvel/keysignaltransition.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QTest>

#include <functional>

using namespace Quorvel;
using TestSupport::processUntilIdle;

namespace {

// A data source stand-in: notifying properties, a key signal and a plain signal.
class Source : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int status READ status WRITE setStatus NOTIFY statusChanged)
    Q_PROPERTY(QVariant value READ value WRITE setValue NOTIFY valueChanged)
public:
    int status() const { return m_status; }
    void setStatus(int status)
    {
        m_status = status;
        emit statusChanged(status); // also when unchanged: the transitions decide
    }
    QVariant value() const { return m_value; }
    void setValue(const QVariant &value)
    {
        m_value = value;
        emit valueChanged();
    }

signals:
    void statusChanged(int status);
    void valueChanged();
    void keyEvent(int key, int kind);
    void ping();

private:
    int m_status = 0;
    QVariant m_value;
};

// Screens: "Home" (view) and the layered "Phone" that opens on "Menu" through a conditional
// state, with "Contacts" > "ContactsList"; one global popup.
struct Tree
{
    Tree()
    {
        machine = StateMachine::instance();
        HmiState *screens = machine->screensState();
        home = new HmiViewState(QStringLiteral("T.Home"), QStringLiteral("Home"), screens);
        phone = new HmiLayeredState(QStringLiteral("Phone"), screens);
        choose = new HmiConditionalState(QStringLiteral("PhoneChoose"), phone);
        menu = new HmiViewState(QStringLiteral("T.Menu"), QStringLiteral("Menu"), phone);
        contacts = new HmiState(QStringLiteral("Contacts"), phone);
        contactsList = new HmiViewState(QStringLiteral("T.ContactsList"),
                                        QStringLiteral("ContactsList"), contacts);
        contacts->setInitialHmiState(contactsList);
        choose->setTargetState(menu);
        phone->setInitialHmiState(choose);
        screens->setInitialHmiState(home);
        popup = new PopupState(QStringLiteral("T.Global"), 1);
        QObject::connect(phone, &QState::entered, [this] { ++phoneEntries; });
        QObject::connect(contactsList, &QState::entered, [this] { ++contactsListEntries; });
    }
    void start(const StateMachine::RootHierarchyTransitions &transitions = {})
    {
        machine->installRootHierarchy(transitions, {{StateLevel3, popup}});
        machine->start();
        processUntilIdle();
    }
    void goTo(QAbstractState *state)
    {
        machine->goToState(state);
        processUntilIdle();
    }
    void post(const QString &event, const QVariant &value = QVariant())
    {
        machine->postEvent(new HmiEvent(event, value));
        processUntilIdle();
    }
    StateMachine *machine;
    HmiViewState *home;
    HmiLayeredState *phone;
    HmiConditionalState *choose;
    HmiViewState *menu;
    HmiState *contacts;
    HmiViewState *contactsList;
    PopupState *popup;
    int phoneEntries = 0;
    int contactsListEntries = 0;
};

bool active(const QString &name)
{
    NamedState *state = NamedState::stateForName(name);
    return state && state->isActive();
}

using Make = std::function<HmiAbstractTransition *(Source *, QState *)>;

} // namespace

Q_DECLARE_METATYPE(Make)

class TestQuorvel : public TestSupport::Suite
{
    Q_OBJECT
protected:
    void tearDown() override
    {
        StateMachine::destroyInstance();
        Platform::Journal::instance()->clear();
    }
private slots:

    void rootHierarchy()
    {
        Tree tree;
        auto *adopted = new HmiTransition(QStringLiteral("Adopted"));
        auto *listed = new HmiTransition(QStringLiteral("Listed"), tree.menu);
        tree.start({{StateLevel2, adopted}, {StateLevel3, listed}});

        for (const char *name : {"StateLevel1", "StateLevel2", "StateLevel3", "Screens", "Home"})
            QVERIFY2(active(QLatin1String(name)), name);
        QCOMPARE(tree.machine->regionPopups(tree.machine->popupRegion()),
                 QList<PopupState *>{tree.popup});
        QCOMPARE(adopted->adoptedLevel(), StateLevel2);
        QVERIFY(adopted->isAdopted());
        // A waiting adopted transition lies on no active state: other notifications never
        // look at it, however many the modules adopt.
        for (QAbstractState *state : tree.machine->configuration()) {
            auto *compound = qobject_cast<QState *>(state);
            QVERIFY(!compound || !compound->transitions().contains(adopted));
        }
        QCOMPARE(listed->sourceState(), tree.menu);
        QVERIFY(!listed->isAdopted());
        QCOMPARE(StateMachine::instance(), tree.machine);
    }

    // An adopted transition with a target leaves only what lies below the deepest active
    // proper ancestor of its target, and no popup closes.
    void adoptedTransition_data()
    {
        QTest::addColumn<QString>("startIn");
        QTest::addColumn<int>("phoneEntries");
        QTest::addColumn<int>("contactsListEntries");
        QTest::addRow("from the phone menu: menu left, phone stays") << "Menu" << 1 << 1;
        QTest::addRow("from home: phone entered") << "Home" << 1 << 1;
        QTest::addRow("target active: re-entered, phone stays") << "ContactsList" << 1 << 2;
    }
    void adoptedTransition()
    {
        QFETCH(QString, startIn);
        QFETCH(int, phoneEntries);
        QFETCH(int, contactsListEntries);
        Tree tree;
        auto *toContacts = new HmiTransition(QStringLiteral("ShowContacts"));
        toContacts->setTargetState(tree.contacts);
        tree.start({{StateLevel3, toContacts}});
        tree.goTo(NamedState::stateForName(startIn));
        QVERIFY(active(startIn));
        tree.machine->requestPopup(QStringLiteral("T.Global"));
        processUntilIdle();
        QVERIFY(tree.popup->isActive());
        tree.phoneEntries = 0;
        tree.contactsListEntries = startIn == QLatin1String("ContactsList") ? 1 : 0;

        tree.post(QStringLiteral("ShowContacts"));

        QVERIFY(active(QStringLiteral("ContactsList")));
        QVERIFY(!tree.menu->isActive());
        QVERIFY(!tree.home->isActive());
        QCOMPARE(tree.phoneEntries, startIn == QLatin1String("Home") ? phoneEntries : 0);
        QCOMPARE(tree.contactsListEntries, contactsListEntries);
        QVERIFY(tree.popup->isActive());
        QCOMPARE(TestSupport::journalValues(QStringLiteral("popup-hidden")), QStringList());
    }

    // One notification fires every transition it enables, guards asked first in creation order,
    // then the enabled ones in that order; one whose source was left meanwhile is dropped.
    void fanOut_data()
    {
        QTest::addColumn<QString>("trigger");
        QTest::addRow("hmi event") << "event";
        QTest::addRow("signal") << "signal";
        QTest::addRow("property notification") << "property";
        QTest::addRow("key event") << "key";
    }
    void fanOut()
    {
        QFETCH(QString, trigger);
        Tree tree;
        Source source;
        source.setStatus(1);
        QStringList trace;
        auto make = [&](const QString &name, QState *sourceState, int guard) {
            HmiAbstractTransition *t = nullptr;
            if (trigger == QLatin1String("event"))
                t = new HmiTransition(QStringLiteral("Notify"), sourceState);
            else if (trigger == QLatin1String("signal"))
                t = new GuardedSignalTransition(&source, &Source::ping, sourceState);
            else if (trigger == QLatin1String("property"))
                t = new GuardedPropertyTransition(&source, "status", sourceState);
            else
                t = new KeySignalTransition(&source, "2keyEvent(int, int)", 12, 2, sourceState);
            t->setObjectName(name);
            if (guard >= 0) {
                QObject::connect(t, &HmiAbstractTransition::transitionTest, t, [&trace, t, guard] {
                    trace << t->objectName() + QLatin1Char('?');
                    if (guard)
                        t->setAllowTransition(true);
                });
            }
            QObject::connect(t, &QAbstractTransition::triggered, t,
                             [&trace, t] { trace << t->objectName(); });
            return t;
        };
        make(QStringLiteral("A"), tree.phone, 1);
        make(QStringLiteral("B"), tree.menu, 0);
        make(QStringLiteral("C"), tree.menu, -1)->setTargetState(tree.contacts);
        make(QStringLiteral("D"), tree.menu, 1);
        HmiAbstractTransition *adopted = make(QStringLiteral("E"), nullptr, -1);
        make(QStringLiteral("F"), tree.home, -1);
        tree.start({{StateLevel3, adopted}});
        tree.goTo(tree.phone);
        QVERIFY(tree.menu->isActive());

        if (trigger == QLatin1String("event"))
            tree.machine->postEvent(new HmiEvent(QStringLiteral("Notify")));
        else if (trigger == QLatin1String("signal"))
            emit source.ping();
        else if (trigger == QLatin1String("property"))
            source.setStatus(2);
        else
            emit source.keyEvent(12, 2);
        processUntilIdle();

        QCOMPARE(trace,
                 (QStringList{QStringLiteral("A?"), QStringLiteral("B?"), QStringLiteral("D?"),
                              QStringLiteral("A"), QStringLiteral("C"), QStringLiteral("E")}));
        QVERIFY(tree.contactsList->isActive());
    }

    // Targetless transitions next to each other in creation order fire in one turn: still in
    // that order, and the popup requests and dismissals they make take effect after the last,
    // in the order made.
    void sharedTurn_data()
    {
        QTest::addColumn<bool>("thirdDismisses");
        QTest::addColumn<QStringList>("stack");
        QTest::addRow("both requested: the later on top")
                << false << QStringList{QStringLiteral("T.Global"), QStringLiteral("T.Second")};
        QTest::addRow("requested, then dismissed in the same notification")
                << true << QStringList{QStringLiteral("T.Second")};
    }
    void sharedTurn()
    {
        QFETCH(bool, thirdDismisses);
        QFETCH(QStringList, stack);
        Tree tree;
        auto *second = new PopupState(QStringLiteral("T.Second"), 1);
        QStringList trace;
        auto make = [&](const QString &name, QState *source, std::function<void()> action) {
            auto *t = new HmiTransition(QStringLiteral("Notify"), source);
            QObject::connect(t, &QAbstractTransition::triggered, t, [&trace, name, action] {
                trace << name;
                action();
            });
            return t;
        };
        make(QStringLiteral("menu"), tree.menu,
             [&] { tree.machine->requestPopup(QStringLiteral("T.Global")); });
        HmiTransition *adopted = make(QStringLiteral("adopted"), nullptr, [&] {
            tree.machine->requestPopup(QStringLiteral("T.Second"));
        });
        make(QStringLiteral("phone"), tree.phone, [&] {
            if (thirdDismisses)
                tree.machine->dismissPopup(QStringLiteral("T.Global"));
        });
        make(QStringLiteral("home"), tree.home, [] {});
        tree.machine->installRootHierarchy({}, {{StateLevel3, second}});
        tree.start({{StateLevel3, adopted}});
        tree.goTo(tree.phone);

        tree.post(QStringLiteral("Notify"));

        QCOMPARE(trace,
                 (QStringList{QStringLiteral("menu"), QStringLiteral("adopted"),
                              QStringLiteral("phone")}));
        QCOMPARE(TestSupport::journalValues(QStringLiteral("popup-shown")),
                 QStringList{QStringLiteral("T.Second")});
        QCOMPARE(tree.machine->popupStack(QStringLiteral("T.Second")), stack);
    }

    // The trigger of each kind, the guard's default and the transition data.
    void transitionKinds_data()
    {
        QTest::addColumn<Make>("make");
        QTest::addColumn<QString>("drive"); // the steps are: "event" names, "key"s, "status"es,
                                            // "value"s, "late" values (the source entered after
                                            // the first)
        QTest::addColumn<QVariantList>("steps");
        QTest::addColumn<int>("fires");
        QTest::addColumn<QVariant>("data");
        auto change = [](const QVariantList &from, const QVariant &to) {
            return Make([=](Source *source, QState *state) -> HmiAbstractTransition * {
                return new GuardedPropertyChangeTransition(source, "value", from, to, state);
            });
        };
        auto guarded = [](bool allow) {
            return Make([=](Source *source, QState *state) -> HmiAbstractTransition * {
                auto *t = new GuardedSignalTransition(source, "statusChanged(int)", state);
                t->setAllowTransitionDefault(allow);
                QObject::connect(t, &HmiAbstractTransition::transitionTest, [] {});
                return t;
            });
        };
        const Make event = [](Source *, QState *state) {
            return new HmiTransition(QStringLiteral("Go"), state);
        };
        const Make intSignal = [](Source *source, QState *state) {
            return new IntSignalTransition(source, SIGNAL(statusChanged(int)), 3, state);
        };
        const Make key = [](Source *source, QState *state) {
            return new KeySignalTransition(source, "2keyEvent(int, int)", 12, 2, state);
        };
        const Make property = [](Source *source, QState *state) {
            return new GuardedPropertyTransition(source, "value", state);
        };
        const QString go = QStringLiteral("Go");
        // clang-format off
        QTest::addRow("event: exact name, value as data") << event << "event" << QVariantList{go, QStringLiteral("go"), QStringLiteral("GO")} << 1 << QVariant(go);
        QTest::addRow("int signal: equal value only") << intSignal << "status" << QVariantList{1, 3, 4, 3} << 2 << QVariant(3);
        QTest::addRow("key: key and kind both equal") << key << "key" << QVariantList{QVariantList{12, 2}, QVariantList{12, 3}, QVariantList{77, 2}} << 1 << QVariant(QVariantList{12, 2});
        QTest::addRow("change: any to 3, only real changes") << change({}, 3) << "value" << QVariantList{3, 3, 4, 3} << 2 << QVariant(3);
        QTest::addRow("change: 3 to 7 only") << change({3}, 7) << "value" << QVariantList{4, 7, 3, 7} << 1 << QVariant(7);
        QTest::addRow("change: 12 to any other") << change({12}, QVariant()) << "value" << QVariantList{12, 5, 12, 12, 0} << 2 << QVariant(0);
        QTest::addRow("change: false to true") << change({false}, true) << "value" << QVariantList{false, true, true, false, true} << 2 << QVariant(true);
        QTest::addRow("change: remembered while source inactive") << change({3}, 7) << "late" << QVariantList{3, 7} << 1 << QVariant(7);
        QTest::addRow("guard: default refuses") << guarded(false) << "status" << QVariantList{1} << 0 << QVariant();
        QTest::addRow("guard: default allows when set") << guarded(true) << "status" << QVariantList{1} << 1 << QVariant(1);
        QTest::addRow("property: every notification") << property << "value" << QVariantList{1, 1} << 2 << QVariant(1);
        // clang-format on
    }
    void transitionKinds()
    {
        QFETCH(Make, make);
        QFETCH(QString, drive);
        QFETCH(QVariantList, steps);
        QFETCH(int, fires);
        QFETCH(QVariant, data);
        Tree tree;
        Source source;
        source.setValue(0);
        const bool late = drive == QLatin1String("late");
        HmiAbstractTransition *t = make(&source, late ? tree.contacts : tree.menu);
        QVariant lastData;
        int count = 0;
        QObject::connect(t, &QAbstractTransition::triggered, [&] {
            ++count;
            lastData = t->transitionData();
        });
        tree.start();
        tree.goTo(tree.menu);

        for (const QVariant &step : qAsConst(steps)) {
            if (drive == QLatin1String("event"))
                tree.machine->postEvent(new HmiEvent(step.toString(), step));
            else if (drive == QLatin1String("key"))
                emit source.keyEvent(step.toList().at(0).toInt(), step.toList().at(1).toInt());
            else if (drive == QLatin1String("status"))
                source.setStatus(step.toInt());
            else
                source.setValue(step);
            processUntilIdle();
            if (late && &step == &steps.constFirst())
                tree.goTo(tree.contacts); // the first change happened while the source was inactive
        }
        QCOMPARE(count, fires);
        QCOMPARE(lastData, data);
    }

    void conditionalState_data()
    {
        QTest::addColumn<bool>("setTarget");
        QTest::addColumn<QString>("landsOn");
        QTest::addRow("target chosen on entry") << true << "ContactsList";
        QTest::addRow("no target: stays") << false << "PhoneChoose";
    }
    void conditionalState()
    {
        QFETCH(bool, setTarget);
        QFETCH(QString, landsOn);
        Tree tree;
        tree.choose->setTargetState(nullptr);
        int tests = 0;
        QObject::connect(tree.choose, &HmiConditionalState::conditionTest, [&] {
            ++tests;
            if (setTarget)
                tree.choose->setTargetState(tree.contacts);
        });
        tree.start();
        tree.goTo(tree.phone);
        QCOMPARE(tests, 1);
        QVERIFY(active(landsOn));
    }

    void viewStates()
    {
        Tree tree;
        tree.start();
        QCOMPARE(HmiViewState::activeViewState(), tree.home);
        tree.goTo(tree.phone);
        QCOMPARE(HmiViewState::activeViewState(), tree.menu);
        QCOMPARE(HmiViewState::lastKnownViewState(), QStringLiteral("Home"));
        QCOMPARE(NamedState::stateForName(QStringLiteral("Menu")), tree.menu);
        QCOMPARE(TestSupport::journalValues(QStringLiteral("view")),
                 (QStringList{QStringLiteral("T.Home"), QStringLiteral("T.Menu")}));
        HmiViewState *dummy
                = HmiViewState::createDummyViewState(QStringLiteral("Limbo"), tree.phone);
        tree.goTo(dummy);
        QCOMPARE(HmiViewState::lastKnownViewState(), QStringLiteral("Menu"));
        QCOMPARE(TestSupport::journalValues(QStringLiteral("view")).size(), 2);

        // The back stack keeps the newest views only, and back still goes to the one before.
        for (int i = 0; i < StateMachine::BackStackDepth; ++i) {
            tree.goTo(tree.home);
            tree.goTo(tree.phone);
        }
        const QStringList stack = tree.machine->backStack();
        QCOMPARE(stack.size(), StateMachine::BackStackDepth);
        QCOMPARE(stack.mid(stack.size() - 2),
                 (QStringList{QStringLiteral("Home"), QStringLiteral("Menu")}));
        QVERIFY(tree.machine->back());
        processUntilIdle();
        QCOMPARE(HmiViewState::activeViewState(), tree.home);
        QCOMPARE(tree.machine->backStack().size(), StateMachine::BackStackDepth - 1);
    }
};

QTEST_GUILESS_MAIN(TestQuorvel)
#include "tst_quorvel.moc"
