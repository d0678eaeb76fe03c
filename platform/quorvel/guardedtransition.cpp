#include "guardedtransition.h"

namespace Quorvel {

GuardedTransition::GuardedTransition(const QString &eventName, QState *source)
    : HmiAbstractTransition(source)
    , m_eventName(eventName)
{
    setObjectName(eventName);
    listenToEvent(eventName);
}

GuardedTransition::~GuardedTransition() = default;

QString GuardedTransition::eventName() const
{
    return m_eventName;
}

bool GuardedTransition::testTrigger(const QVariantList &arguments)
{
    setTransitionData(arguments.value(0));
    return true;
}

} // namespace Quorvel
