#include "floortree.h"

#include <quorvel/guardedtransition.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmistate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QCoreApplication>
#include <QHash>
#include <QJsonArray>
#include <QSignalTransition>

namespace Bench {

QEvent::Type NamedEvent::s_type = static_cast<QEvent::Type>(QEvent::registerEventType());

namespace {

const QEvent::Type RouteEventType = static_cast<QEvent::Type>(QEvent::registerEventType());

class RouteTransition : public QAbstractTransition
{
public:
    RouteTransition() { setTransitionType(QAbstractTransition::InternalTransition); }

protected:
    bool eventTest(QEvent *event) override { return event->type() == RouteEventType; }
    void onTransition(QEvent *) override { }
};

struct Capture
{
    TreeShape &shape;
    QHash<const QAbstractState *, int> &indexes;
    QVector<QPair<QAbstractTransition *, int>> &transitions;
    Quorvel::StateMachine *hmiMachine;
    QList<QState *> regions;
};

int addNode(Capture &c, const QAbstractState *state, int parentIndex, bool parallel,
            const QString &name)
{
    const int index = c.shape.nodes.size();
    TreeShape::Node node;
    node.parent = parentIndex;
    node.parallel = parallel;
    node.name = name;
    c.shape.nodes.append(node);
    if (state)
        c.indexes.insert(state, index);
    return index;
}

void captureState(Capture &c, QAbstractState *abstract, int parentIndex)
{
    auto *state = qobject_cast<QState *>(abstract);
    const int index = addNode(c, abstract, parentIndex,
                              state && state->childMode() == QState::ParallelStates,
                              abstract->objectName());
    if (!state)
        return;
    // A popup region as it would be written by hand: an exclusive state with nothing shown
    // first and the region's popups beside it, one of them open at a time. None of the
    // framework's own places for popups is copied.
    if (c.regions.contains(state)) {
        const int none
                = addNode(c, nullptr, index, false, state->objectName() + QStringLiteral("None"));
        c.shape.nodes[index].initial = none;
        for (Quorvel::PopupState *popup : c.hmiMachine->regionPopups(state))
            captureState(c, popup, index);
        return;
    }
    for (QObject *child : state->children()) {
        if (auto *transition = qobject_cast<QAbstractTransition *>(child))
            c.transitions.append({transition, index});
        else if (auto *childState = qobject_cast<QAbstractState *>(child))
            captureState(c, childState, index);
    }
}

} // namespace

TreeShape TreeShape::capture(QStateMachine *machine)
{
    TreeShape shape;
    QHash<const QAbstractState *, int> indexes;
    QVector<QPair<QAbstractTransition *, int>> transitions;
    auto *hmiMachine = qobject_cast<Quorvel::StateMachine *>(machine);
    Capture c{shape, indexes, transitions, hmiMachine,
              hmiMachine ? hmiMachine->popupRegions() : QList<QState *>()};
    addNode(c, machine, -1, false, machine->objectName());
    // The machine's states other than its initial one hold the framework's waiting transitions
    // and closed popups: a hand-written machine has neither.
    for (QObject *child : machine->children()) {
        if (auto *transition = qobject_cast<QAbstractTransition *>(child))
            transitions.append({transition, 0});
        else if (!qobject_cast<QAbstractState *>(child))
            continue;
        else if (child == machine->initialState() || !hmiMachine)
            captureState(c, static_cast<QAbstractState *>(child), 0);
        else
            for (QObject *waiting : child->children()) {
                if (auto *transition = qobject_cast<QAbstractTransition *>(waiting))
                    transitions.append({transition, 0});
            }
    }
    for (auto it = indexes.constBegin(); it != indexes.constEnd(); ++it) {
        if (auto *state = qobject_cast<const QState *>(it.key()))
            shape.nodes[it.value()].initial = indexes.value(state->initialState(), -1);
    }
    // Regions keep the "nothing shown" state they were given.
    for (QState *region : qAsConst(c.regions)) {
        const int index = indexes.value(region, -1);
        if (index >= 0)
            shape.nodes[index].initial = index + 1;
    }
    for (const auto &entry : qAsConst(transitions)) {
        QAbstractTransition *transition = entry.first;
        Transition shaped;
        shaped.source = entry.second;
        shaped.target = indexes.value(transition->targetState(), -1);
        if (auto *hmi = qobject_cast<Quorvel::HmiAbstractTransition *>(transition)) {
            // An adopted transition is armed at its level.
            if (hmi->isAdopted() && hmiMachine)
                shaped.source = indexes.value(static_cast<const QAbstractState *>(
                                                      hmiMachine->levelState(hmi->adoptedLevel())),
                                              -1);
        } else if (!qobject_cast<QSignalTransition *>(transition)) {
            continue; // the framework's own routing
        }
        if (auto *signal = qobject_cast<Quorvel::HmiSignalTransition *>(transition)) {
            if (signal->senderObject()) {
                shaped.senderClass
                        = QString::fromLatin1(signal->senderObject()->metaObject()->className());
                shaped.signal = signal->signal();
            }
        } else if (auto *plain = qobject_cast<QSignalTransition *>(transition)) {
            if (plain->senderObject()) {
                shaped.senderClass
                        = QString::fromLatin1(plain->senderObject()->metaObject()->className());
                shaped.signal = plain->signal().mid(1);
            }
        } else if (auto *event = qobject_cast<Quorvel::GuardedTransition *>(transition)) {
            shaped.event = event->eventName();
        }
        if (shaped.source >= 0)
            shape.transitions.append(shaped);
    }
    return shape;
}

QJsonObject TreeShape::toJson() const
{
    QJsonArray nodeArray;
    for (const Node &node : nodes)
        nodeArray.append(QJsonArray{node.parent, node.parallel, node.initial, node.name});
    QJsonArray transitionArray;
    for (const Transition &transition : transitions)
        transitionArray.append(
                QJsonArray{transition.source, transition.target, transition.senderClass,
                           QString::fromLatin1(transition.signal), transition.event});
    return {{QStringLiteral("nodes"), nodeArray}, {QStringLiteral("transitions"), transitionArray}};
}

TreeShape TreeShape::fromJson(const QJsonObject &json)
{
    TreeShape shape;
    const QJsonArray nodeArray = json.value(QStringLiteral("nodes")).toArray();
    for (const QJsonValue &value : nodeArray) {
        const QJsonArray row = value.toArray();
        shape.nodes.append(
                {row.at(0).toInt(), row.at(1).toBool(), row.at(2).toInt(), row.at(3).toString()});
    }
    const QJsonArray transitionArray = json.value(QStringLiteral("transitions")).toArray();
    for (const QJsonValue &value : transitionArray) {
        const QJsonArray row = value.toArray();
        shape.transitions.append({row.at(0).toInt(), row.at(1).toInt(), row.at(2).toString(),
                                  row.at(3).toString().toLatin1(), row.at(4).toString()});
    }
    return shape;
}

int TreeShape::indexOf(const QString &name) const
{
    for (int i = 0; i < nodes.size(); ++i) {
        if (nodes.at(i).name == name)
            return i;
    }
    return -1;
}

FloorMachine::FloorMachine(const TreeShape &shape,
                           const std::function<QObject *(const QString &)> &senders)
    : m_machine(new QStateMachine)
{
    m_states.reserve(shape.nodes.size());
    m_states.push_back(m_machine);
    for (int i = 1; i < shape.nodes.size(); ++i) {
        const TreeShape::Node &node = shape.nodes.at(i);
        auto *parent = static_cast<QState *>(m_states.at(node.parent));
        auto *state = new QState(node.parallel ? QState::ParallelStates : QState::ExclusiveStates,
                                 parent);
        state->setObjectName(node.name);
        m_states.push_back(state);
    }
    for (int i = 0; i < shape.nodes.size(); ++i) {
        const int initial = shape.nodes.at(i).initial;
        if (initial >= 0)
            static_cast<QState *>(m_states.at(i))->setInitialState(m_states.at(initial));
    }
    for (const TreeShape::Transition &shaped : shape.transitions) {
        auto *source = static_cast<QState *>(m_states.at(shaped.source));
        QObject *sender = shaped.senderClass.isEmpty() ? nullptr : senders(shaped.senderClass);
        QAbstractTransition *transition = nullptr;
        if (sender && sender->metaObject()->indexOfSignal(shaped.signal.constData()) >= 0)
            transition = new QSignalTransition(sender, QByteArray('2' + shaped.signal), source);
        else
            transition = new NamedTransition(shaped.event, source);
        if (shaped.target >= 0)
            transition->setTargetState(m_states.at(shaped.target));
    }
    m_route = new RouteTransition;
    m_machine->addTransition(m_route);
}

FloorMachine::~FloorMachine()
{
    delete m_machine;
}

void FloorMachine::start()
{
    m_machine->start();
    for (int round = 0; round < 20; ++round) {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents(QEventLoop::AllEvents);
    }
}

void FloorMachine::goTo(QAbstractState *target)
{
    const QSet<QAbstractState *> configuration = m_machine->configuration();
    QState *domain = target->parentState();
    while (domain && domain != m_machine
           && (domain->childMode() != QState::ExclusiveStates || !configuration.contains(domain)))
        domain = domain->parentState();
    m_route->setTargetState(target);
    (domain ? domain : m_machine)->addTransition(m_route);
    m_machine->postEvent(new QEvent(RouteEventType), QStateMachine::HighPriority);
    QCoreApplication::sendPostedEvents();
}

void FloorMachine::back()
{
    if (m_backStack.size() < 2)
        return;
    m_backStack.pop_back();
    QAbstractState *target = m_backStack.back();
    m_backStack.pop_back();
    goTo(target);
}

void FloorMachine::trackViews(const QVector<int> &views)
{
    for (int index : views) {
        QAbstractState *view = m_states.at(index);
        QObject::connect(view, &QAbstractState::entered, m_machine,
                         [this, view] { m_backStack.push_back(view); });
    }
}

} // namespace Bench
