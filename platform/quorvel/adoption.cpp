#include "statemachine_p.h"

#include "hmiabstracttransition.h"
#include "popupstate.h"

// The turn of one fired transition. Most transitions fire where they are. Two kinds are moved,
// for their own turn only, to the state from which they must fire:
// - an adopted (source-less) transition: to its level, or, when it has a target, to the
//   deepest active exclusive ancestor of the target as an internal transition, so that it
//   leaves only what lies below that state and no popup closes;
// - a transition that leaves an open popup (its source is the popup or one of the popup's
//   states, its target lies outside the popup), or enters a closed one: to its target's domain
//   in the same way, while the left popup's holder closes it in the same step. Under Qt's own
//   rules its domain would be the whole root layer, and every popup and screen would close.

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
    if (!target || (!transition->m_adopted && !isActive(transition->sourceState())))
        return;
    // A target inside a closed popup: the popup is put where it opens, as a request would put it,
    // and the transition enters it there.
    PopupState *opening = enclosingPopup(target);
    if (opening && !isActive(opening)) {
        PopupRegion *region = regionOf(opening);
        if (!region || !isActive(region))
            return;
        placePopup(opening, region, nullptr);
    } else {
        opening = nullptr;
    }
    if (transition->m_adopted) {
        QState *domain = domainFor(target);
        if (domain)
            transition->setTransitionType(QAbstractTransition::InternalTransition);
        else
            domain = levels[transition->m_level - 1];
        moveForTurn(transition, domain);
        return;
    }
    PopupState *leaving = enclosingPopup(transition->sourceState());
    if (leaving && isWithin(target, leaving))
        leaving = nullptr;
    if (!leaving && !opening)
        return;
    QState *domain = domainFor(target);
    if (!domain)
        return;
    moveForTurn(transition, domain);
    transition->setTransitionType(QAbstractTransition::InternalTransition);
    // A domain above the popup left leaves it anyway.
    if (leaving && !isWithin(leaving->m_holder, domain))
        closeInStep(leaving, fire);
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
