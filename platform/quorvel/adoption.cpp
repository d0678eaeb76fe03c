#include "statemachine_p.h"

#include "hmiabstracttransition.h"
#include "popupstate.h"

// The turn of one fired transition. Most transitions fire where they are. Two kinds are moved,
// for their own turn only, to the state from which they must fire:
// - an adopted (source-less) transition: to its level, or, when it has a target, to the
//   deepest active exclusive ancestor of the target as an internal transition, so that it
//   leaves only what lies below that state and no popup closes;
// - a transition that leaves an open popup (its source is the popup or one of the popup's
//   states, its target lies outside the popup): to its target's domain in the same way, while
//   the popup's slot closes the popup in the same step. Under Qt's own rules its domain would
//   be the whole root layer, and every popup and screen would close.

namespace Quorvel {

namespace {

PopupState *enclosingPopup(QObject *state)
{
    for (QObject *each = state; each; each = each->parent()) {
        if (auto *popup = qobject_cast<PopupState *>(each))
            return popup;
    }
    return nullptr;
}

bool isWithin(const QObject *object, const QObject *ancestor)
{
    for (const QObject *each = object; each; each = each->parent()) {
        if (each == ancestor)
            return true;
    }
    return false;
}

} // namespace

void StateMachinePrivate::placeForTurn(HmiAbstractTransition *transition, QEvent *fire)
{
    parkMovedTransition();
    QAbstractState *target = transition->targetState();
    if (transition->m_adopted) {
        QState *domain = target ? domainFor(target) : nullptr;
        if (domain)
            transition->setTransitionType(QAbstractTransition::InternalTransition);
        else
            domain = levels[transition->m_level - 1];
        moveForTurn(transition, domain);
        return;
    }
    PopupState *popup = target ? enclosingPopup(transition->sourceState()) : nullptr;
    if (!popup || isWithin(target, popup) || !isActive(transition->sourceState()))
        return;
    QState *domain = domainFor(target);
    PopupSlot *slot = slotOf(popup);
    if (!domain || !slot)
        return;
    moveForTurn(transition, domain);
    transition->setTransitionType(QAbstractTransition::InternalTransition);
    // A domain above the popup leaves it anyway.
    if (!isWithin(slot, domain)) {
        slot->mover()->arm(fire, slot->closedState());
        armedSlots.append(slot);
    }
}

void StateMachinePrivate::moveForTurn(HmiAbstractTransition *transition, QState *domain)
{
    Q_ASSERT(!movedTransition);
    movedFrom = transition->sourceState();
    movedType = transition->transitionType();
    domain->addTransition(transition);
    movedTransition = transition;
}

void StateMachinePrivate::parkMovedTransition()
{
    HmiAbstractTransition *transition = movedTransition;
    movedTransition = nullptr;
    if (!transition)
        return;
    if (transition->m_adopted) {
        adoptedHolder->addTransition(transition);
    } else if (movedFrom) {
        movedFrom->addTransition(transition);
        transition->setTransitionType(movedType);
    }
}

} // namespace Quorvel
