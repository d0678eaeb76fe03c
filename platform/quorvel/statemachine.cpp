#include "statemachine.h"
#include "statemachine_p.h"

#include "hmiabstracttransition.h"
#include "hmievent.h"
#include "hmiviewstate.h"
#include "namedstate.h"
#include "popupstate.h"

#include <journal/journal.h>

#include <QLoggingCategory>

#include <algorithm>

// The machine's core: its root hierarchy, posting, names and the public interface. The inner
// workings live by concern in fanout.cpp (notifications), adoption.cpp (the turn of each fired
// transition), popupregions.cpp (popups) and backstack.cpp (views and back navigation).

Q_LOGGING_CATEGORY(quorvelLog, "orvane.quorvel")

namespace Quorvel {

namespace {
StateMachine *s_instance = nullptr;
} // namespace

StateMachinePrivate::StateMachinePrivate(StateMachine *machine)
    : q(machine)
{ }

StateMachinePrivate::~StateMachinePrivate()
{
    qDeleteAll(relays);
    qDeleteAll(held);
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
    // On the outermost level, which is always active (the machine takes no transition from its
    // root state).
    fanOut = new FanOutTransition(this, levels[0]);
    router = new ArmedTransition(QStringLiteral("FrameworkRoute"), q);
    adoptedHolder = new QState(q);
    adoptedHolder->setObjectName(QStringLiteral("AdoptedTransitions"));
    popupParking = new QState(q);
    popupParking->setObjectName(QStringLiteral("ClosedPopups"));
}

bool StateMachinePrivate::isActive(const QAbstractState *state) const
{
    return state && q->isRunning()
            && q->configuration().contains(const_cast<QAbstractState *>(state));
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

// --- posting ---

void StateMachinePrivate::post(QEvent *event, QStateMachine::EventPriority priority)
{
    if (!event) {
        qCWarning(quorvelLog, "postEvent: cannot post a null event");
        return;
    }
    if (event->type() == HmiEvent::eventType()) {
        const auto *hmiEvent = static_cast<const HmiEvent *>(event);
        Platform::Journal::instance()->append(QStringLiteral("event"),
                                              {{QStringLiteral("name"), hmiEvent->name()},
                                               {QStringLiteral("value"), hmiEvent->value()}});
    }
    if (q->isRunning())
        q->QStateMachine::postEvent(event, priority);
    else
        held.append(event);
}

void StateMachinePrivate::postHeld()
{
    const QList<QEvent *> events = held;
    held.clear();
    for (QEvent *event : events)
        q->QStateMachine::postEvent(event);
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

// --- StateMachine ---

StateMachine::StateMachine(QObject *parent)
    : QStateMachine(parent)
    , d(new StateMachinePrivate(this))
{
    s_instance = this;
    setObjectName(QStringLiteral("HmiStateMachine"));
    d->build();
    connect(this, &QStateMachine::started, this, [this] { d->postHeld(); });
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
        if (popup && !popup->parent())
            d->setHomeRegion(popup, d->popups);
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
    for (PopupRegion *region : qAsConst(d->regions)) {
        if (region->shown && d->isActive(region->shown))
            shown.append(region->shown->viewId());
    }
    return shown;
}

QStringList StateMachine::openPopups() const
{
    return d->openPopups();
}

QStringList StateMachine::popupStack(const QString &viewId) const
{
    QStringList ids;
    if (PopupRegion *region = d->regionOf(d->popupFor(viewId))) {
        for (const QPointer<PopupState> &each : qAsConst(region->stack)) {
            if (each)
                ids.append(each->viewId());
        }
    }
    return ids;
}

void StateMachine::popupAnswered(const QString &viewId)
{
    if (!isRunning() || !d->popupsById.contains(viewId)) {
        qCWarning(quorvelLog).noquote() << "popupAnswered: no popup" << viewId << "to answer";
        return;
    }
    QStateMachine::postEvent(new PopupAnsweredEvent(viewId));
}

QList<QState *> StateMachine::popupRegions() const
{
    QList<QState *> regions;
    for (PopupRegion *region : qAsConst(d->regions))
        regions.append(region);
    return regions;
}

QList<PopupState *> StateMachine::regionPopups(const QState *region) const
{
    QList<PopupState *> popups;
    for (const QVector<PopupState *> &popupsOfView : qAsConst(d->popupsById)) {
        for (PopupState *popup : popupsOfView) {
            if (popup->m_home == region)
                popups.append(popup);
        }
    }
    std::sort(popups.begin(), popups.end(),
              [](const PopupState *a, const PopupState *b) { return a->viewId() < b->viewId(); });
    return popups;
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

void StateMachine::endSelectTransitions(QEvent *event)
{
    Q_UNUSED(event)
    d->endSelect();
}

void StateMachine::beginMicrostep(QEvent *event)
{
    Q_UNUSED(event)
    d->inMicrostep = true;
}

void StateMachine::endMicrostep(QEvent *event)
{
    Q_UNUSED(event)
    d->endMicrostep();
}

void StateMachine::postEvent(QEvent *event, EventPriority priority)
{
    d->post(event, priority);
}

} // namespace Quorvel
