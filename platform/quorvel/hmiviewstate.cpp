#include "hmiviewstate.h"
#include "statemachine_p.h"

#include "hmitargetfilter.h"

namespace Quorvel {

HmiViewState::HmiViewState(const QString &viewId, const QString &name, QState *parent)
    : HmiState(name, parent)
    , m_viewId(viewId)
{ }

HmiViewState::HmiViewState(const QString &viewId, QState *parent)
    : HmiViewState(viewId, viewId, parent)
{ }

HmiViewState::~HmiViewState()
{
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->viewExited(this);
}

HmiViewState *HmiViewState::createDummyViewState(const QString &name, QState *parent, int viewIndex,
                                                 bool hasBackStackPresence)
{
    auto *state = new HmiViewState(QString(), name, parent);
    state->m_dummy = true;
    state->m_viewIndex = viewIndex;
    state->m_hasBackStackPresence = hasBackStackPresence;
    return state;
}

QString HmiViewState::targetView() const
{
    return m_viewId;
}

bool HmiViewState::isDummy() const
{
    return m_dummy;
}

HmiViewState *HmiViewState::activeViewState()
{
    StateMachinePrivate *d = StateMachinePrivate::existing();
    return d ? d->activeView.data() : nullptr;
}

QString HmiViewState::lastKnownViewState()
{
    StateMachinePrivate *d = StateMachinePrivate::existing();
    return d ? d->lastKnownView : QString();
}

void HmiViewState::setHandlesBackEvent(bool handles)
{
    m_handlesBackEvent = handles;
}

bool HmiViewState::handlesBackEvent() const
{
    return m_handlesBackEvent;
}

void HmiViewState::setBackStackStateId(const QString &stateId, bool unique)
{
    m_backStackStateId = stateId;
    m_backStackEntryUnique = unique;
}

QString HmiViewState::backStackStateId() const
{
    return m_backStackStateId;
}

bool HmiViewState::backStackEntryUnique() const
{
    return m_backStackEntryUnique;
}

void HmiViewState::setHasBackStackPresence(bool presence)
{
    m_hasBackStackPresence = presence;
}

bool HmiViewState::hasBackStackPresence() const
{
    return m_hasBackStackPresence;
}

void HmiViewState::setBackTargetProviderState(QAbstractState *state)
{
    m_backTargetProvider = state;
}

QAbstractState *HmiViewState::backTargetProviderState() const
{
    return m_backTargetProvider;
}

void HmiViewState::createDirectBackTransition(QAbstractState *target)
{
    m_directBackTarget = target;
}

QAbstractState *HmiViewState::directBackTarget() const
{
    return m_directBackTarget;
}

void HmiViewState::addBackTargetFilter(const QSharedPointer<HmiTargetFilter> &filter)
{
    if (filter)
        m_filters.append(filter);
}

QList<QSharedPointer<HmiTargetFilter>> HmiViewState::backTargetFilters() const
{
    return m_filters;
}

void HmiViewState::onEntry(QEvent *event)
{
    HmiState::onEntry(event);
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->viewEntered(this);
}

void HmiViewState::onExit(QEvent *event)
{
    HmiState::onExit(event);
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->viewExited(this);
}

} // namespace Quorvel
