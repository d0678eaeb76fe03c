#include "floortree.h"

#include <quorvel/guardedtransition.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmistate.h>
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

void captureState(QState *state, int parentIndex, TreeShape &shape,
                  QHash<const QAbstractState *, int> &indexes,
                  QVector<QPair<QAbstractTransition *, int>> &transitions)
{
    const int index = shape.nodes.size();
    TreeShape::Node node;
    node.parent = parentIndex;
    node.parallel = state && state->childMode() == QState::ParallelStates;
    node.name = state ? state->objectName() : QString();
    shape.nodes.append(node);
    indexes.insert(state, index);
    if (!state)
        return;
    for (QObject *child : state->children()) {
        if (auto *transition = qobject_cast<QAbstractTransition *>(child))
            transitions.append({transition, index});
        else if (auto *childState = qobject_cast<QState *>(child))
            captureState(childState, index, shape, indexes, transitions);
        else if (qobject_cast<QAbstractState *>(child))
            captureState(nullptr, index, shape, indexes, transitions);
    }
}

} // namespace

TreeShape TreeShape::capture(QStateMachine *machine)
{
    TreeShape shape;
    QHash<const QAbstractState *, int> indexes;
    QVector<QPair<QAbstractTransition *, int>> transitions;
    captureState(machine, -1, shape, indexes, transitions);
    for (auto it = indexes.constBegin(); it != indexes.constEnd(); ++it) {
        if (auto *state = qobject_cast<const QState *>(it.key()))
            shape.nodes[it.value()].initial = indexes.value(state->initialState(), -1);
    }
    auto *hmiMachine = qobject_cast<Quorvel::StateMachine *>(machine);
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
