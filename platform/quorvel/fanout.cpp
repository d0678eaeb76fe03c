#include "statemachine_p.h"

#include "hmiabstracttransition.h"
#include "hmievent.h"

#include <QMetaMethod>

// Notifications and their fan-out: the trigger index of the framework's transitions, and the
// selection code that the machine runs for each event it takes.

namespace Quorvel {

namespace {

QEvent::Type registeredType()
{
    return static_cast<QEvent::Type>(QEvent::registerEventType());
}

} // namespace

FireEvent::FireEvent(HmiAbstractTransition *transition, quint64 batch, const QVariant &data)
    : QEvent(eventType())
    , transition(transition)
    , batch(batch)
    , data(data)
{ }

QEvent::Type FireEvent::eventType()
{
    static const QEvent::Type type = registeredType();
    return type;
}

BatchEndEvent::BatchEndEvent(quint64 batch)
    : QEvent(eventType())
    , batch(batch)
{ }

QEvent::Type BatchEndEvent::eventType()
{
    static const QEvent::Type type = registeredType();
    return type;
}

RouteEvent::RouteEvent(QAbstractState *target, QEvent::Type type)
    : QEvent(type == QEvent::None ? eventType() : type)
    , target(target)
{ }

QEvent::Type RouteEvent::eventType()
{
    static const QEvent::Type type = registeredType();
    return type;
}

PopupSyncEvent::PopupSyncEvent(PopupRegion *region)
    : QEvent(eventType())
    , region(region)
{ }

QEvent::Type PopupSyncEvent::eventType()
{
    static const QEvent::Type type = registeredType();
    return type;
}

SignalRelay::SignalRelay(StateMachinePrivate *d, const QObject *sender, int signalIndex)
    : d(d)
    , sender(sender)
    , signalIndex(signalIndex)
{
    const QMetaMethod method = sender->metaObject()->method(signalIndex);
    for (int i = 0; i < method.parameterCount(); ++i)
        parameterTypes.append(method.parameterType(i));
}

int SignalRelay::qt_metacall(QMetaObject::Call call, int id, void **argv)
{
    id = QObject::qt_metacall(call, id, argv);
    if (id < 0)
        return id;
    if (call == QMetaObject::InvokeMetaMethod) {
        if (id == 0)
            d->dispatchSignal(this, argv);
        --id;
    }
    return id;
}

void StateMachinePrivate::listenToEvent(HmiAbstractTransition *transition, const QString &eventName)
{
    eventListeners[eventName].append(transition);
}

bool StateMachinePrivate::listenToSignal(HmiAbstractTransition *transition, const QObject *sender,
                                         int signalIndex)
{
    if (!sender || signalIndex < 0
        || sender->metaObject()->method(signalIndex).methodType() != QMetaMethod::Signal)
        return false;
    const auto key = qMakePair(sender, signalIndex);
    SignalRelay *relay = relays.value(key);
    if (!relay) {
        relay = new SignalRelay(this, sender, signalIndex);
        relays.insert(key, relay);
        QMetaObject::connect(sender, signalIndex, relay, QObject::staticMetaObject.methodCount(),
                             Qt::DirectConnection, nullptr);
        QObject::connect(sender, &QObject::destroyed, relay,
                         [this, key] { delete relays.take(key); });
    }
    relay->listeners.append(transition);
    return true;
}

void StateMachinePrivate::forget(HmiAbstractTransition *transition)
{
    for (auto it = eventListeners.begin(); it != eventListeners.end(); ++it)
        it.value().removeAll(transition);
    for (SignalRelay *relay : qAsConst(relays))
        relay->listeners.removeAll(transition);
}

void StateMachinePrivate::dispatchSignal(SignalRelay *relay, void **argv)
{
    QVariantList arguments;
    for (int i = 0; i < relay->parameterTypes.size(); ++i) {
        const int type = relay->parameterTypes.at(i);
        if (type == QMetaType::QVariant)
            arguments.append(*reinterpret_cast<QVariant *>(argv[i + 1]));
        else if (type != QMetaType::UnknownType)
            arguments.append(QVariant(type, argv[i + 1]));
        else
            arguments.append(QVariant());
    }
    QStateMachine::SignalEvent event(const_cast<QObject *>(relay->sender), relay->signalIndex,
                                     arguments);
    notify(relay->listeners, arguments, &event);
}

// One notification: ask every listener, in creation order, whether it matches, whether its
// source is active and whether its guard allows; then queue the enabled ones, in that order,
// followed by the end of the fan-out.
void StateMachinePrivate::notify(const QVector<HmiAbstractTransition *> &listeners,
                                 const QVariantList &arguments, QEvent *testEvent)
{
    if (listeners.isEmpty())
        return;
    QVector<QPointer<HmiAbstractTransition>> snapshot;
    snapshot.reserve(listeners.size());
    for (HmiAbstractTransition *transition : listeners)
        snapshot.append(transition);

    const bool running = q->isRunning();
    const QSet<QAbstractState *> configuration
            = running ? q->configuration() : QSet<QAbstractState *>();
    QVector<QPointer<HmiAbstractTransition>> enabled;
    QVariantList data;
    for (const QPointer<HmiAbstractTransition> &transition : qAsConst(snapshot)) {
        if (!transition || !transition->testTrigger(arguments))
            continue;
        if (!running)
            continue;
        if (!transition->m_adopted && !configuration.contains(transition->sourceState()))
            continue;
        if (!transition->runGuard(testEvent))
            continue;
        if (transition) {
            enabled.append(transition);
            data.append(transition->m_data);
        }
    }
    if (enabled.isEmpty())
        return;
    const quint64 batch = ++m_batch;
    for (int i = 0; i < enabled.size(); ++i)
        q->QStateMachine::postEvent(new FireEvent(enabled.at(i), batch, data.at(i)),
                                    QStateMachine::HighPriority);
    q->QStateMachine::postEvent(new BatchEndEvent(batch), QStateMachine::HighPriority);
}

// How the machine handles what it is given, in order:
//
// 1. A notification: a posted HmiEvent when the machine takes it from its queue, or a signal or
//    property change of a watched sender at once, when it is emitted (SignalRelay). notify()
//    asks every listener in creation order: its trigger (asked even while its source is
//    inactive, so that property transitions can follow values), then whether its source is
//    active (adopted transitions always are), then its guard. It posts one FireEvent per enabled
//    transition, in that order, and a BatchEndEvent after them. All framework events are posted
//    at high priority: they run before any module event still waiting, in posting order.
// 2. A FireEvent is one transition's turn (placeForTurn): Qt takes the transition for that event
//    only, if its source is still active (otherwise it is dropped). Popup requests and
//    dismissals made while it runs are kept for the batch.
// 3. The BatchEndEvent applies the batch's popup requests and dismissals in the order made;
//    each changes a region's stack and asks for that region's PopupSyncEvent.
// 4. A PopupSyncEvent opens and closes the region's popups as its stack says, all in one step
//    (syncRegion); which popup is on top is reported when the step ends.
// 5. A RouteEvent (or a back event) moves to a state through the router transition placed on
//    the target's domain.
// Popup requests and dismissals made while the machine enters or leaves states outside a batch
// (entry and exit slots, steps 4 and 5) take effect when that step ends (endMicrostep).
void StateMachinePrivate::beginSelect(QEvent *event)
{
    const QEvent::Type type = event->type();
    if (type == QEvent::None)
        return;
    // Whatever was armed or moved for the previous event was taken by its step and put back.
    Q_ASSERT(!router->isArmed());
    Q_ASSERT(armedSlots.isEmpty());

    if (type == FireEvent::eventType()) {
        auto *fire = static_cast<FireEvent *>(event);
        currentBatch = fire->batch;
        if (HmiAbstractTransition *transition = fire->transition) {
            transition->m_data = fire->data;
            placeForTurn(transition, event);
        }
        return;
    }

    currentBatch = 0;
    if (type == HmiEvent::eventType()) {
        auto *hmiEvent = static_cast<HmiEvent *>(event);
        notify(eventListeners.value(hmiEvent->name()), QVariantList{hmiEvent->value()}, event);
    } else if (type == BatchEndEvent::eventType()) {
        const QList<PopupOp> ops = batchOps.take(static_cast<BatchEndEvent *>(event)->batch);
        for (const PopupOp &op : ops)
            perform(op);
    } else if (type == PopupSyncEvent::eventType()) {
        if (PopupRegion *region = static_cast<PopupSyncEvent *>(event)->region)
            syncRegion(region, event);
    } else if (auto *routeEvent = dynamic_cast<RouteEvent *>(event)) {
        // Either type: a back event posted by someone else is no route.
        route(event, routeEvent->target);
    }
}

void StateMachinePrivate::endMicrostep()
{
    inMicrostep = false;
    parkMovedTransition();
    if (router->isArmed()) {
        router->disarm();
        q->addTransition(router);
    }
    for (PopupSlot *slot : qAsConst(armedSlots))
        slot->mover()->disarm();
    armedSlots.clear();
    reportTops();
    if (!currentBatch && !microstepOps.isEmpty()) {
        const QList<PopupOp> ops = microstepOps;
        microstepOps.clear();
        for (const PopupOp &op : ops)
            perform(op);
    }
}

} // namespace Quorvel
