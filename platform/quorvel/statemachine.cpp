#include "statemachine.h"
#include "statemachine_p.h"

#include "hmiabstracttransition.h"
#include "hmievent.h"
#include "hmilayeredstate.h"
#include "hmitargetfilter.h"
#include "hmiviewstate.h"
#include "popupstate.h"

#include <journal/journal.h>

#include <QAbstractTransition>
#include <QLoggingCategory>
#include <QMetaMethod>

Q_LOGGING_CATEGORY(quorvelLog, "orvane.quorvel")

namespace Quorvel {

namespace {

StateMachine *s_instance = nullptr;

QEvent::Type registeredType()
{
    return static_cast<QEvent::Type>(QEvent::registerEventType());
}

// Closes the fan-out of one notification: the popup requests and dismissals that its
// transitions made take effect now.
class BatchEndEvent : public QEvent
{
public:
    explicit BatchEndEvent(quint64 batch)
        : QEvent(eventType())
        , batch(batch)
    { }
    static QEvent::Type eventType()
    {
        static const QEvent::Type type = registeredType();
        return type;
    }
    quint64 batch;
};

// Moves the machine to a state (navigation), or brings a popup region to the top of its stack.
class RouteEvent : public QEvent
{
public:
    explicit RouteEvent(QAbstractState *target)
        : QEvent(eventType())
        , target(target)
    { }
    explicit RouteEvent(PopupRegion *region)
        : QEvent(eventType())
        , region(region)
    { }
    static QEvent::Type eventType()
    {
        static const QEvent::Type type = registeredType();
        return type;
    }
    QPointer<QAbstractState> target;
    QPointer<QState> region;
};

// The framework's own transition for routes: armed for one event, placed on the route's domain.
class RouterTransition : public QAbstractTransition
{
public:
    explicit RouterTransition(QState *source)
        : QAbstractTransition(source)
    {
        setObjectName(QStringLiteral("FrameworkRoute"));
        setTransitionType(QAbstractTransition::InternalTransition);
    }
    QEvent *armed = nullptr;

protected:
    bool eventTest(QEvent *event) override { return armed && event == armed; }
    void onTransition(QEvent *) override { }
};

int insertionIndex(const QList<QPointer<PopupState>> &stack, const PopupState *popup)
{
    // Higher priorities lie above; among equals the newest is on top.
    int index = stack.size();
    while (index > 0 && stack.at(index - 1) && stack.at(index - 1)->priority() > popup->priority())
        --index;
    return index;
}

} // namespace

// --- events and helper objects ---

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

PopupRegion::PopupRegion(const QString &name, QState *parent)
    : QState(parent)
    , m_idle(new QState(this))
{
    setObjectName(name);
    m_idle->setObjectName(name + QStringLiteral("Idle"));
    setInitialState(m_idle);
}

void PopupRegion::onExit(QEvent *event)
{
    QState::onExit(event);
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->regionExited(this);
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

// --- StateMachinePrivate ---

StateMachinePrivate::StateMachinePrivate(StateMachine *machine)
    : q(machine)
{ }

StateMachinePrivate::~StateMachinePrivate()
{
    qDeleteAll(relays);
}

StateMachinePrivate *StateMachinePrivate::get()
{
    return StateMachine::instance()->d;
}

StateMachinePrivate *StateMachinePrivate::existing()
{
    return s_instance ? s_instance->d : nullptr;
}

void StateMachinePrivate::build()
{
    levels[0] = new HmiState(QStringLiteral("StateLevel1"), q);
    levels[1] = new HmiState(QStringLiteral("StateLevel2"), levels[0]);
    levels[2] = new HmiState(QStringLiteral("StateLevel3"), levels[1]);
    auto *layers = new QState(QState::ParallelStates, levels[2]);
    layers->setObjectName(QStringLiteral("RootLayers"));
    screens = new HmiState(QStringLiteral("Screens"), layers);
    auto *screensIdle = new QState(screens);
    screensIdle->setObjectName(QStringLiteral("ScreensIdle"));
    screens->setInitialState(screensIdle);
    popups = createPopupRegion(QStringLiteral("Popups"), layers);
    levels[1]->setInitialState(levels[2]);
    levels[0]->setInitialState(levels[1]);
    levels[2]->setInitialState(layers);
    q->setInitialState(levels[0]);
    router = new RouterTransition(q);
    adoptedHolder = new QState(q);
    adoptedHolder->setObjectName(QStringLiteral("AdoptedTransitions"));
}

PopupRegion *StateMachinePrivate::createPopupRegion(const QString &name, QState *parent)
{
    auto *region = new PopupRegion(name, parent);
    regions.append(region);
    QObject::connect(region, &QObject::destroyed, q, [this, region] {
        regions.removeAll(region);
        stacks.remove(region);
        syncPending.remove(region);
    });
    return region;
}

bool StateMachinePrivate::isActive(const QAbstractState *state) const
{
    return state && q->isRunning()
            && q->configuration().contains(const_cast<QAbstractState *>(state));
}

// --- trigger index and fan-out ---

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
        q->postEvent(new FireEvent(enabled.at(i), batch, data.at(i)), QStateMachine::HighPriority);
    q->postEvent(new BatchEndEvent(batch), QStateMachine::HighPriority);
}

QState *StateMachinePrivate::domainFor(QAbstractState *target) const
{
    const QSet<QAbstractState *> configuration = q->configuration();
    for (QState *state = target ? target->parentState() : nullptr; state;
         state = state->parentState()) {
        if (state->childMode() == QState::ExclusiveStates
            && (state == q || configuration.contains(state)))
            return state;
    }
    return nullptr;
}

void StateMachinePrivate::beginSelect(QEvent *event)
{
    const QEvent::Type type = event->type();
    if (type == QEvent::None)
        return;

    if (type == FireEvent::eventType()) {
        auto *fire = static_cast<FireEvent *>(event);
        currentBatch = fire->batch;
        HmiAbstractTransition *transition = fire->transition;
        if (!transition)
            return;
        transition->m_data = fire->data;
        parkMovedTransition();
        // An adopted transition fires from its level; one with a target leaves only what lies
        // below the deepest active proper ancestor of its target: it fires from there as an
        // internal transition.
        if (transition->m_adopted) {
            QState *domain
                    = transition->targetState() ? domainFor(transition->targetState()) : nullptr;
            if (domain)
                transition->setTransitionType(QAbstractTransition::InternalTransition);
            else
                domain = levels[transition->m_level - 1];
            domain->addTransition(transition);
            movedTransition = transition;
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
    } else if (type == RouteEvent::eventType()) {
        auto *route = static_cast<RouteEvent *>(event);
        QAbstractState *target = route->target;
        PopupRegion *region = static_cast<PopupRegion *>(route->region.data());
        if (region) {
            syncPending.remove(region);
            if (!isActive(region))
                return;
            QList<QPointer<PopupState>> &stack = stacks[region];
            stack.removeAll(nullptr);
            target = stack.isEmpty() ? region->idleState() : stack.last().data();
            if (isActive(target))
                return;
            syncingRegion = region;
        }
        QState *domain = target ? domainFor(target) : nullptr;
        if (!domain) {
            syncingRegion = nullptr;
            return;
        }
        auto *routerTransition = static_cast<RouterTransition *>(router);
        routerTransition->setTargetState(target);
        domain->addTransition(routerTransition);
        routerTransition->armed = event;
    }
}

void StateMachinePrivate::endMicrostep(QEvent *)
{
    inMicrostep = false;
    parkMovedTransition();
    auto *routerTransition = static_cast<RouterTransition *>(router);
    if (routerTransition->armed) {
        routerTransition->armed = nullptr;
        q->addTransition(routerTransition);
    }
    syncingRegion = nullptr;
    if (!currentBatch && !microstepOps.isEmpty()) {
        const QList<PopupOp> ops = microstepOps;
        microstepOps.clear();
        for (const PopupOp &op : ops)
            perform(op);
    }
}

void StateMachinePrivate::parkMovedTransition()
{
    if (HmiAbstractTransition *transition = movedTransition) {
        movedTransition = nullptr;
        adoptedHolder->addTransition(transition);
    }
}

// --- names ---

void StateMachinePrivate::registerName(NamedState *state, const QString &name)
{
    names[name].append(state);
}

void StateMachinePrivate::forgetName(NamedState *state)
{
    auto it = names.find(state->objectName());
    if (it != names.end() && it.value().removeAll(state)) {
        if (it.value().isEmpty())
            names.erase(it);
        return;
    }
    for (auto each = names.begin(); each != names.end(); ++each)
        each.value().removeAll(state);
}

NamedState *StateMachinePrivate::stateForName(const QString &name) const
{
    const QVector<NamedState *> states = names.value(name);
    return states.isEmpty() ? nullptr : states.first();
}

// --- views and back stack ---

void StateMachinePrivate::viewEntered(HmiViewState *view)
{
    if (activeView && activeView != view)
        lastKnownView = activeView->name();
    activeView = view;
    if (!view->isDummy())
        Platform::Journal::instance()->append(QStringLiteral("view"),
                                              {{QStringLiteral("id"), view->targetView()}});
    if (view->hasBackStackPresence()) {
        backStack.removeAll(nullptr);
        if (backStack.isEmpty() || backStack.last() != view) {
            if (view->backStackEntryUnique())
                backStack.removeAll(view);
            backStack.append(view);
        }
    }
    emit q->viewStateEntered(view);
}

void StateMachinePrivate::viewExited(HmiViewState *view)
{
    if (activeView == view) {
        lastKnownView = view->name();
        activeView = nullptr;
    }
}

bool StateMachinePrivate::back(int steps)
{
    if (steps < 1)
        return false;
    // Worked on a copy: nothing changes when there is nothing to go back to.
    QList<QPointer<HmiViewState>> stack = backStack;
    stack.removeAll(nullptr);
    HmiViewState *current = activeView;
    if (current && !stack.isEmpty() && stack.last() == current)
        stack.removeLast();

    QAbstractState *target = nullptr;
    int remaining = steps;
    // A view without a back-stack presence whose back target comes from a provider view goes
    // back as that view would (its entry, direct back target and filters); a provider that is
    // no view state is the target itself.
    if (current && !current->directBackTarget() && !current->hasBackStackPresence()
        && current->backTargetProviderState()) {
        if (auto *provider = qobject_cast<HmiViewState *>(current->backTargetProviderState())) {
            current = provider;
            if (!stack.isEmpty() && stack.last() == current)
                stack.removeLast();
        } else {
            target = current->backTargetProviderState();
            --remaining;
        }
    }
    if (!target && current && current->directBackTarget()) {
        target = current->directBackTarget();
        --remaining;
    }
    while (remaining > 0 && !stack.isEmpty()) {
        HmiViewState *entry = stack.takeLast();
        bool accepted = true;
        if (current) {
            for (const QSharedPointer<HmiTargetFilter> &filter : current->backTargetFilters())
                accepted = accepted && (!filter || filter->acceptsTarget(entry));
        }
        if (!accepted)
            continue;
        target = entry;
        --remaining;
    }
    if (!target)
        return false;
    backStack = stack;
    // Going back to a view that names a back-stack state enters that state instead, so that
    // the component can choose its screen again.
    if (auto *view = qobject_cast<HmiViewState *>(target)) {
        if (!view->backStackStateId().isEmpty()) {
            if (NamedState *named = stateForName(view->backStackStateId()))
                target = named;
        }
    }
    goToState(target);
    return true;
}

void StateMachinePrivate::goToState(QAbstractState *target)
{
    if (!target || !q->isRunning())
        return;
    q->postEvent(new RouteEvent(target), QStateMachine::HighPriority);
}

// --- popups ---

void StateMachinePrivate::registerPopup(PopupState *popup)
{
    popupsById[popup->viewId()].append(popup);
}

void StateMachinePrivate::forgetPopup(PopupState *popup)
{
    auto it = popupsById.find(popup->viewId());
    if (it != popupsById.end()) {
        it.value().removeAll(popup);
        if (it.value().isEmpty())
            popupsById.erase(it);
    }
}

PopupState *StateMachinePrivate::popupFor(const QString &viewId) const
{
    const QVector<PopupState *> candidates = popupsById.value(viewId);
    for (PopupState *popup : candidates) {
        if (isActive(popup->parentState()))
            return popup;
    }
    return candidates.isEmpty() ? nullptr : candidates.first();
}

bool StateMachinePrivate::requestPopup(const QString &viewId, const QVariant &data)
{
    const bool known = popupsById.contains(viewId);
    if (known)
        queueOrPerform({true, viewId, data});
    return known;
}

void StateMachinePrivate::dismissPopup(const QString &viewId)
{
    if (popupsById.contains(viewId))
        queueOrPerform({false, viewId, QVariant()});
}

// Requests and dismissals made while the transitions of one notification run take effect when
// all of them have run; those made while the machine enters or leaves states take effect when
// the step is complete (so a state entering can ask for a popup of its own layer).
void StateMachinePrivate::queueOrPerform(const PopupOp &op)
{
    if (currentBatch)
        batchOps[currentBatch].append(op);
    else if (inMicrostep)
        microstepOps.append(op);
    else
        perform(op);
}

void StateMachinePrivate::perform(const PopupOp &op)
{
    if (!op.request) {
        for (PopupState *popup : popupsById.value(op.viewId))
            dismissPopupNow(popup);
        return;
    }
    PopupState *popup = popupFor(op.viewId);
    auto *region = popup ? dynamic_cast<PopupRegion *>(popup->parentState()) : nullptr;
    if (!region || !isActive(region))
        return;
    popup->m_data = op.data;
    QList<QPointer<PopupState>> &stack = stacks[region];
    stack.removeAll(nullptr);
    stack.removeAll(popup);
    stack.insert(insertionIndex(stack, popup), popup);
    scheduleSync(region);
}

void StateMachinePrivate::dismissPopupNow(PopupState *popup)
{
    auto *region = popup ? dynamic_cast<PopupRegion *>(popup->parentState()) : nullptr;
    if (!region)
        return;
    if (stacks[region].removeAll(popup) > 0 || isActive(popup))
        scheduleSync(region);
}

void StateMachinePrivate::scheduleSync(PopupRegion *region)
{
    if (!q->isRunning() || syncPending.contains(region))
        return;
    syncPending.insert(region);
    q->postEvent(new RouteEvent(region), QStateMachine::HighPriority);
}

void StateMachinePrivate::popupEntered(PopupState *popup)
{
    Platform::Journal::instance()->append(QStringLiteral("popup-shown"),
                                          {{QStringLiteral("id"), popup->viewId()}});
    if (auto *region = dynamic_cast<PopupRegion *>(popup->parentState())) {
        QList<QPointer<PopupState>> &stack = stacks[region];
        if (!stack.contains(popup)) {
            // Entered by a module transition rather than by a request: it is on top now.
            stack.insert(insertionIndex(stack, popup), popup);
            scheduleSync(region);
        }
    }
    for (const QPointer<PopupState> &dismissed : qAsConst(popup->m_dismissesWhenShown)) {
        if (dismissed)
            dismissPopupNow(dismissed);
    }
    emit q->popupShown(popup);
}

void StateMachinePrivate::popupExited(PopupState *popup)
{
    Platform::Journal::instance()->append(QStringLiteral("popup-hidden"),
                                          {{QStringLiteral("id"), popup->viewId()}});
    auto *region = dynamic_cast<PopupRegion *>(popup->parentState());
    // Left by a module transition (not covered or dismissed by the framework): no longer
    // requested.
    if (region && region != syncingRegion) {
        stacks[region].removeAll(popup);
        scheduleSync(region);
    }
    emit q->popupHidden(popup);
}

void StateMachinePrivate::regionExited(PopupRegion *region)
{
    // A layer that is left closes its popups.
    stacks.remove(region);
}

// --- StateMachine ---

StateMachine::StateMachine(QObject *parent)
    : QStateMachine(parent)
    , d(new StateMachinePrivate(this))
{
    s_instance = this;
    setObjectName(QStringLiteral("HmiStateMachine"));
    d->build();
}

StateMachine::~StateMachine()
{
    if (s_instance == this)
        s_instance = nullptr;
    // The states and transitions are deleted after this body; they find no instance then and
    // leave the indexes alone.
    delete d;
    d = nullptr;
}

StateMachine *StateMachine::instance()
{
    if (!s_instance)
        new StateMachine();
    return s_instance;
}

StateMachine *StateMachine::existingInstance()
{
    return s_instance;
}

void StateMachine::destroyInstance()
{
    delete s_instance;
}

HmiState *StateMachine::levelState(StateLevel level) const
{
    const int index = static_cast<int>(level) - 1;
    return index >= 0 && index < 3 ? d->levels[index] : nullptr;
}

HmiState *StateMachine::screensState() const
{
    return d->screens;
}

QState *StateMachine::popupRegion() const
{
    return d->popups;
}

void StateMachine::installRootHierarchy(const RootHierarchyTransitions &transitions,
                                        const RootHierarchyPopupStates &popups)
{
    for (const auto &entry : popups) {
        PopupState *popup = entry.second;
        if (!popup)
            continue;
        if (!popup->parentState())
            popup->setParent(d->popups);
    }
    for (const auto &entry : transitions) {
        QAbstractTransition *transition = entry.second;
        if (!transition || transition->sourceState())
            continue;
        HmiState *level = levelState(entry.first);
        if (!level) {
            qCCritical(quorvelLog)
                    << "installRootHierarchy: no state level" << entry.first << "for" << transition;
            level = d->levels[2];
        }
        if (auto *hmiTransition = qobject_cast<HmiAbstractTransition *>(transition)) {
            hmiTransition->m_adopted = true;
            hmiTransition->m_level = levelState(entry.first) ? entry.first : StateLevel3;
            d->adoptedHolder->addTransition(transition);
        } else {
            level->addTransition(transition);
        }
    }
}

bool StateMachine::requestPopup(const QString &viewId, const QVariant &data)
{
    return d->requestPopup(viewId, data);
}

void StateMachine::dismissPopup(const QString &viewId)
{
    d->dismissPopup(viewId);
}

PopupState *StateMachine::popupState(const QString &viewId) const
{
    return d->popupFor(viewId);
}

QStringList StateMachine::shownPopups() const
{
    QStringList shown;
    const QSet<QAbstractState *> configuration = this->configuration();
    for (PopupRegion *region : qAsConst(d->regions)) {
        for (QObject *child : region->children()) {
            auto *popup = qobject_cast<PopupState *>(child);
            if (popup && configuration.contains(popup))
                shown.append(popup->viewId());
        }
    }
    return shown;
}

QStringList StateMachine::popupStack(const QString &viewId) const
{
    QStringList ids;
    PopupState *popup = d->popupFor(viewId);
    auto *region = popup ? dynamic_cast<PopupRegion *>(popup->parentState()) : nullptr;
    if (region) {
        for (const QPointer<PopupState> &each : d->stacks.value(region)) {
            if (each)
                ids.append(each->viewId());
        }
    }
    return ids;
}

void StateMachine::goToState(QAbstractState *target)
{
    d->goToState(target);
}

bool StateMachine::back(int steps)
{
    return d->back(steps);
}

QStringList StateMachine::backStack() const
{
    QStringList names;
    for (const QPointer<HmiViewState> &view : qAsConst(d->backStack)) {
        if (view)
            names.append(view->name());
    }
    return names;
}

QAbstractState *StateMachine::findViewTarget(const QString &nameOrViewId) const
{
    // A view request names a view: the view state showing it wins over a state of that name
    // (the one named after its view first, as most are). Asked for by the name of another state
    // (a component, a module's settings state), it enters that state, so that the state's
    // initial state decides what is shown.
    NamedState *named = d->stateForName(nameOrViewId);
    auto shows = [&nameOrViewId](NamedState *state) {
        auto *view = qobject_cast<HmiViewState *>(state);
        return view && view->targetView() == nameOrViewId;
    };
    if (shows(named))
        return named;
    for (const QVector<NamedState *> &states : qAsConst(d->names)) {
        for (NamedState *state : states) {
            if (shows(state))
                return state;
        }
    }
    return named;
}

void StateMachine::beginSelectTransitions(QEvent *event)
{
    d->beginSelect(event);
}

void StateMachine::beginMicrostep(QEvent *event)
{
    Q_UNUSED(event)
    d->inMicrostep = true;
}

void StateMachine::endMicrostep(QEvent *event)
{
    d->endMicrostep(event);
}

} // namespace Quorvel
