#include "statemachine_p.h"

#include "hmitargetfilter.h"
#include "hmiviewstate.h"
#include "namedstate.h"

#include <journal/journal.h>

// Views shown, the back stack and navigation to a state.

namespace Quorvel {

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
            // The oldest views drop off: a car runs for hours.
            while (backStack.size() > StateMachine::BackStackDepth)
                backStack.removeFirst();
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
    // The entries below `end` are the ones left; the stack is cut there only when there is
    // somewhere to go back to.
    backStack.removeAll(nullptr);
    int end = backStack.size();
    HmiViewState *current = activeView;
    if (current && end > 0 && backStack.at(end - 1) == current)
        --end;

    QAbstractState *target = nullptr;
    int remaining = steps;
    // A view without a back-stack presence whose back target comes from a provider view goes
    // back as that view would (its entry, direct back target and filters); a provider that is
    // no view state is the target itself.
    if (current && !current->directBackTarget() && !current->hasBackStackPresence()
        && current->backTargetProviderState()) {
        if (auto *provider = qobject_cast<HmiViewState *>(current->backTargetProviderState())) {
            current = provider;
            if (end > 0 && backStack.at(end - 1) == current)
                --end;
        } else {
            target = current->backTargetProviderState();
            --remaining;
        }
    }
    if (!target && current && current->directBackTarget()) {
        target = current->directBackTarget();
        --remaining;
    }
    while (remaining > 0 && end > 0) {
        HmiViewState *entry = backStack.at(--end);
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
    backStack.erase(backStack.begin() + end, backStack.end());
    // Going back to a view that names a back-stack state enters that state instead, so that
    // the component can choose its screen again.
    if (auto *view = qobject_cast<HmiViewState *>(target)) {
        if (!view->backStackStateId().isEmpty()) {
            if (NamedState *named = stateForName(view->backStackStateId()))
                target = named;
        }
    }
    goToState(target, StateMachine::BackEventType);
    return true;
}

void StateMachinePrivate::goToState(QAbstractState *target, QEvent::Type type)
{
    if (!target || !q->isRunning())
        return;
    // A route keeps an event of its own: the states it enters tell back navigation by its type.
    postInternal(new RouteEvent(target, type));
}

// The router is armed for the route's event on the target's domain: it leaves only what lies
// below that state and enters the target.
void StateMachinePrivate::route(QEvent *event, QAbstractState *target)
{
    QState *domain = target ? domainFor(target) : nullptr;
    if (!domain)
        return;
    Q_ASSERT(!router->isArmed());
    domain->addTransition(router);
    router->arm(event, target);
}

} // namespace Quorvel
