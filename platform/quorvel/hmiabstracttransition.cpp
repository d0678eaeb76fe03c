#include "hmiabstracttransition.h"
#include "statemachine_p.h"

#include <QMetaMethod>

namespace Quorvel {

HmiAbstractTransition::HmiAbstractTransition(QState *source)
    : QAbstractTransition(source)
{ }

HmiAbstractTransition::~HmiAbstractTransition()
{
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->forget(this);
}

void HmiAbstractTransition::setAllowTransition(bool allow)
{
    m_allow = allow;
}

bool HmiAbstractTransition::allowTransition() const
{
    return m_allow;
}

void HmiAbstractTransition::setAllowTransitionDefault(bool allow)
{
    m_allowDefault = allow;
}

bool HmiAbstractTransition::allowTransitionDefault() const
{
    return m_allowDefault;
}

QVariant HmiAbstractTransition::transitionData() const
{
    return m_data;
}

void HmiAbstractTransition::makeParallelExclusive(int group)
{
    m_parallelExclusive = group;
}

int HmiAbstractTransition::parallelExclusiveGroup() const
{
    return m_parallelExclusive;
}

void HmiAbstractTransition::setIsVREventTransition(bool isVREvent, const QVariant &data)
{
    m_vrEvent = isVREvent;
    m_vrData = data;
}

bool HmiAbstractTransition::isVREventTransition() const
{
    return m_vrEvent;
}

QVariant HmiAbstractTransition::vrEventData() const
{
    return m_vrData;
}

bool HmiAbstractTransition::isAdopted() const
{
    return m_adopted;
}

StateLevel HmiAbstractTransition::adoptedLevel() const
{
    return m_level;
}

void HmiAbstractTransition::listenToEvent(const QString &eventName)
{
    StateMachinePrivate::get()->listenToEvent(this, eventName);
}

bool HmiAbstractTransition::listenToSignal(const QObject *sender, int signalIndex)
{
    return StateMachinePrivate::get()->listenToSignal(this, sender, signalIndex);
}

bool HmiAbstractTransition::testTrigger(const QVariantList &arguments)
{
    Q_UNUSED(arguments)
    return true;
}

void HmiAbstractTransition::setTransitionData(const QVariant &data)
{
    m_data = data;
}

bool HmiAbstractTransition::eventTest(QEvent *event)
{
    return event && event->type() == FireEvent::eventType()
            && static_cast<FireEvent *>(event)->transition == this;
}

void HmiAbstractTransition::onTransition(QEvent *event)
{
    if (event && event->type() == FireEvent::eventType())
        m_data = static_cast<FireEvent *>(event)->data;
}

bool HmiAbstractTransition::runGuard(QEvent *event)
{
    static const QMetaMethod test = QMetaMethod::fromSignal(&HmiAbstractTransition::transitionTest);
    if (!isSignalConnected(test))
        return true;
    m_allow = m_allowDefault;
    emit transitionTest(event);
    return m_allow;
}

} // namespace Quorvel
