#include "namedstate.h"
#include "statemachine_p.h"

namespace Quorvel {

NamedState::NamedState(const QString &name, QState *parent)
    : QState(parent)
{
    setObjectName(name);
    StateMachinePrivate::get()->registerName(this, name);
}

NamedState::NamedState(const QString &name, QState::ChildMode childMode, QState *parent)
    : QState(childMode, parent)
{
    setObjectName(name);
    StateMachinePrivate::get()->registerName(this, name);
}

NamedState::~NamedState()
{
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->forgetName(this);
}

QString NamedState::name() const
{
    return objectName();
}

bool NamedState::isActive() const
{
    StateMachinePrivate *d = StateMachinePrivate::existing();
    return d && d->isActive(this);
}

NamedState *NamedState::stateForName(const QString &name)
{
    StateMachinePrivate *d = StateMachinePrivate::existing();
    return d ? d->stateForName(name) : nullptr;
}

} // namespace Quorvel
