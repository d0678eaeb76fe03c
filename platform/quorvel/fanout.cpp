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

// The local index of QAbstractTransition::triggered(), for emitting it on a transition's behalf.
const int TriggeredSignal = QMetaMethod::fromSignal(&QAbstractTransition::triggered).methodIndex()
        - QAbstractTransition::staticMetaObject.methodOffset();

} // namespace

// The framework's event types, registered once when the library is loaded: telling an event's
// type is one comparison.
const QEvent::Type FireEvent::s_type = registeredType();
const QEvent::Type RouteEvent::s_type = registeredType();
const QEvent::Type PopupSyncEvent::s_type = registeredType();
const QEvent::Type PopupAnsweredEvent::s_type = registeredType();
const QEvent::Type WakeEvent::s_type = registeredType();

WakeEvent::WakeEvent()
    : QEvent(eventType())
{ }

FireEvent::FireEvent(const FireTurn &turn, quint64 batch, bool last)
    : QEvent(eventType())
    , turn(turn)
    , batch(batch)
    , last(last)
{ }

RouteEvent::RouteEvent(QAbstractState *target, QEvent::Type type)
    : QEvent(type == QEvent::None ? eventType() : type)
    , target(target)
{ }

PopupAnsweredEvent::PopupAnsweredEvent(const QString &viewId)
    : QEvent(eventType())
    , viewId(viewId)
{ }

PopupSyncEvent::PopupSyncEvent(PopupRegion *region)
    : QEvent(eventType())
    , region(region)
{ }

FanOutTransition::FanOutTransition(StateMachinePrivate *d, QState *source)
    : QAbstractTransition(source)
    , d(d)
{
    setObjectName(QStringLiteral("FrameworkFanOut"));
}

void FanOutTransition::arm(QEvent *event, const FireTurn &turn)
{
    m_armed = event;
    m_turn = turn;
}

// Only the test: the turn runs in the step that follows the selection.
void FanOutTransition::disarm()
{
    m_armed = nullptr;
}

void FanOutTransition::onTransition(QEvent *)
{
    const FireTurn turn = std::move(m_turn);
    m_turn.clear();
    d->fireTargetless(turn);
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
        // One watch per sender: its relays go with it.
        if (!watchedSenders.contains(sender)) {
            watchedSenders.insert(sender);
            QObject::connect(sender, &QObject::destroyed, &senderWatch, [this, sender] {
                watchedSenders.remove(sender);
                for (auto it = relays.begin(); it != relays.end();) {
                    if (it.key().first == sender) {
                        delete it.value();
                        it = relays.erase(it);
                    } else {
                        ++it;
                    }
                }
            });
        }
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
// source is active and whether its guard allows; then queue the enabled ones, in that order, in
// turns. `current` is the event that the machine is taking, when the notification is one.
void StateMachinePrivate::notify(const QVector<HmiAbstractTransition *> &listeners,
                                 const QVariantList &arguments, QEvent *testEvent, QEvent *current)
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

    // The turns: a run of targetless transitions next to each other fires as one (Qt takes one
    // transition selection for them all, and they emit triggered() in creation order); a targeted
    // one fires alone, after the turns before it, so that it leaves and enters states as it
    // would have in creation order.
    QVector<FireTurn> turns;
    bool runsOn = false;
    for (int i = 0; i < enabled.size(); ++i) {
        const bool targetless = !enabled.at(i)->targetState();
        if (!targetless || !runsOn)
            turns.append(FireTurn());
        turns.last().append({enabled.at(i), data.at(i)});
        runsOn = targetless;
    }
    const quint64 batch = ++m_batch;
    int posted = 0;
    if (current) {
        // The notification is the event the machine is taking: its first turn goes with it. The
        // machine would take that turn next anyway: its internal queue, where the turns wait, is
        // empty whenever it takes a posted event.
        currentBatch = batch;
        lastTurn = turns.size() == 1;
        turnSteps = takeTurn(turns.first(), current);
        posted = 1;
    }
    for (int i = posted; i < turns.size(); ++i)
        queueWork({turns.at(i), batch, i == turns.size() - 1, nullptr});
}

void StateMachinePrivate::queueWork(const PendingWork &work)
{
    if (queuedInQt > 0) {
        // Behind what already waits in Qt's queue.
        if (work.sync)
            postInternal(new PopupSyncEvent(work.sync));
        else
            postInternal(new FireEvent(work.turn, work.batch, work.last));
        return;
    }
    pending.append(work);
    if (!inLoop && !wakePending) {
        wakePending = true;
        q->QStateMachine::postEvent(new WakeEvent, QStateMachine::HighPriority);
    }
}

void StateMachinePrivate::postInternal(QEvent *event)
{
    if (!q->isRunning()) {
        delete event;
        return;
    }
    ++queuedInQt;
    q->QStateMachine::postEvent(event, QStateMachine::HighPriority);
}

// Takes the first pending work that makes the machine step for `event`; work that no longer has
// anything to do (its transitions' sources left, its region already in line) is passed over.
// Returns whether the machine steps.
bool StateMachinePrivate::takePending(QEvent *event)
{
    while (!pending.isEmpty()) {
        const PendingWork work = pending.takeFirst();
        if (work.sync || !work.batch) {
            if (work.sync) {
                currentBatch = 0;
                syncRegion(work.sync, event);
                if (!armedMovers.isEmpty())
                    return true;
            }
            continue;
        }
        currentBatch = work.batch;
        lastTurn = work.last;
        turnSteps = takeTurn(work.turn, event);
        if (turnSteps)
            return true;
        if (lastTurn)
            finishBatch();
    }
    return false;
}

// Arms the turn's transitions for `event`: a targeted one itself (placed for its turn), a run of
// targetless ones through the fan-out transition. Returns whether the machine will take a step.
bool StateMachinePrivate::takeTurn(const FireTurn &turn, QEvent *event)
{
    parkMovedTransition();
    HmiAbstractTransition *first = turn.first().transition;
    if (first && first->targetState()) {
        const bool steps = first->m_adopted || isActive(first->sourceState());
        first->m_data = turn.first().data;
        first->m_armed = event;
        armedTransition = first;
        placeForTurn(first, event);
        return steps;
    }
    for (const FireEntry &entry : turn) {
        HmiAbstractTransition *transition = entry.transition;
        if (transition && (transition->m_adopted || isActive(transition->sourceState()))) {
            fanOut->arm(event, turn);
            return true;
        }
    }
    return false;
}

// A run of targetless transitions, in creation order; one whose source is no longer active is
// dropped, as Qt would drop it.
void StateMachinePrivate::fireTargetless(const FireTurn &turn)
{
    for (const FireEntry &entry : turn) {
        HmiAbstractTransition *transition = entry.transition;
        if (!transition || (!transition->m_adopted && !isActive(transition->sourceState())))
            continue;
        transition->m_data = entry.data;
        QMetaObject::activate(transition, &QAbstractTransition::staticMetaObject, TriggeredSignal,
                              nullptr);
    }
}

// The popup requests and dismissals made by a notification's transitions take effect when its
// last turn is over: right after its step, or at once when its transition is no longer armed.
// No event of its own closes a notification: the last turn knows it is the last.
void StateMachinePrivate::finishBatch()
{
    lastTurn = false;
    const QList<PopupOp> ops = batchOps.take(currentBatch);
    currentBatch = 0;
    for (const PopupOp &op : ops)
        perform(op);
}

// How the machine handles what it is given, in order:
//
// 1. A notification: a posted HmiEvent when the machine takes it from its queue, or a signal or
//    property change of a watched sender at once, when it is emitted (SignalRelay). notify()
//    asks every listener in creation order: its trigger (asked even while its source is
//    inactive, so that property transitions can follow values), then whether its source is
//    active (adopted transitions always are), then its guard. It splits the enabled ones, in
//    that order, into turns (a targeted transition alone, a run of targetless ones together)
//    and queues them as pending work; an HmiEvent takes its first turn itself.
// 2. Pending work runs before anything else waiting, in the order queued: Qt's loop asks for
//    eventless transitions before it takes any event, and that selection takes the next piece
//    of work (takePending), so a turn costs the machine one selection, not two. Work queued
//    while the machine is not running its loop posts a WakeEvent, which takes what is left.
//    Work queued while a framework event (a route) still waits in Qt's queue is posted after
//    it instead (a FireEvent or a PopupSyncEvent), so the order stays the order of queueing.
// 3. A turn (takeTurn): Qt takes the turn's transition for that event only, if its source is
//    still active (otherwise it is dropped; placeForTurn moves a targeted one where it must
//    fire from). Popup requests and dismissals made while it runs are kept for the batch.
// 4. When the last turn is over, the batch's popup requests and dismissals apply in the order
//    made (finishBatch); each changes a region's stack and queues that region's sync.
// 5. A sync opens and closes the region's popups as its stack says, all in one step
//    (syncRegion); which popup is on top is reported when the step ends, and the popups that
//    closed are parked (settlePopups).
// 6. A RouteEvent (or a back event) moves to a state through the router transition placed on
//    the target's domain; it keeps an event of its own, whose type tells back navigation.
// 7. A PopupAnsweredEvent, posted at normal priority when the driver answered a popup, closes
//    the popup if the module leaves its closing to the framework and it is still open.
// Popup requests and dismissals made while the machine enters or leaves states outside a batch
// (entry and exit slots, steps 5 and 6) take effect when that step ends (endMicrostep).
void StateMachinePrivate::beginSelect(QEvent *event)
{
    // A last turn that took no step (unexpected) still closes its batch.
    if (lastTurn)
        finishBatch();
    turnSteps = false;
    inLoop = true;
    const QEvent::Type type = event->type();
    if (type == QEvent::None) {
        if (!pending.isEmpty())
            takePending(event);
        return;
    }
    // Whatever was armed or moved for the previous event was taken by its step and put back.
    Q_ASSERT(!router->isArmed());
    Q_ASSERT(armedMovers.isEmpty());
    Q_ASSERT(!armedTransition);

    if (type == WakeEvent::eventType()) {
        wakePending = false;
        takePending(event);
        return;
    }
    if (type == FireEvent::eventType()) {
        --queuedInQt;
        auto *fire = static_cast<FireEvent *>(event);
        currentBatch = fire->batch;
        lastTurn = fire->last;
        turnSteps = takeTurn(fire->turn, event);
        return;
    }

    currentBatch = 0;
    if (type == HmiEvent::eventType()) {
        auto *hmiEvent = static_cast<HmiEvent *>(event);
        notify(eventListeners.value(hmiEvent->name()), QVariantList{hmiEvent->value()}, event,
               event);
    } else if (type == PopupSyncEvent::eventType()) {
        --queuedInQt;
        if (PopupRegion *region = static_cast<PopupSyncEvent *>(event)->region)
            syncRegion(region, event);
    } else if (type == PopupAnsweredEvent::eventType()) {
        closeAnsweredPopup(static_cast<PopupAnsweredEvent *>(event)->viewId);
    } else if (auto *routeEvent = dynamic_cast<RouteEvent *>(event)) {
        // Either type: a back event posted by someone else is no route.
        --queuedInQt;
        route(event, routeEvent->target);
    }
}

// Armed transitions answer for one event only, and the machine asks nothing more once it has
// selected.
void StateMachinePrivate::endSelect()
{
    const bool steps
            = armedTransition || fanOut->isArmed() || router->isArmed() || !armedMovers.isEmpty();
    inLoop = steps;
    // Work left waiting with no step to come: the machine must come back for it.
    if (!steps && !pending.isEmpty() && !wakePending) {
        wakePending = true;
        q->QStateMachine::postEvent(new WakeEvent, QStateMachine::HighPriority);
    }
    if (armedTransition) {
        armedTransition->m_armed = nullptr;
        armedTransition = nullptr;
    }
    fanOut->disarm();
    if (lastTurn && !turnSteps)
        finishBatch();
}

void StateMachinePrivate::endMicrostep()
{
    inMicrostep = false;
    inLoop = true;
    parkMovedTransition();
    if (router->isArmed()) {
        router->disarm();
        q->addTransition(router);
    }
    for (ArmedTransition *mover : qAsConst(armedMovers))
        mover->disarm();
    armedMovers.clear();
    settlePopups();
    reportTops();
    if (!currentBatch && !microstepOps.isEmpty()) {
        const QList<PopupOp> ops = microstepOps;
        microstepOps.clear();
        for (const PopupOp &op : ops)
            perform(op);
    }
    if (lastTurn)
        finishBatch();
    inLoop = false;
}

} // namespace Quorvel
