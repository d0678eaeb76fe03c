#include "hmistate.h"

#include "hmilayeredstate.h"

namespace Quorvel {

HmiState::HmiState(const QString &name, QState *parent)
    : NamedState(name, effectiveParent(parent))
{ }

HmiState::HmiState(const QString &name, QState::ChildMode childMode, QState *parent)
    : NamedState(name, childMode, effectiveParent(parent))
{ }

HmiState::~HmiState() = default;

void HmiState::setInitialHmiState(QAbstractState *state)
{
    setInitialState(state);
}

QAbstractState *HmiState::initialHmiState() const
{
    return initialState();
}

void HmiState::onEntry(QEvent *event)
{
    NamedState::onEntry(event);
}

void HmiState::onExit(QEvent *event)
{
    NamedState::onExit(event);
}

QState *HmiState::effectiveParent(QState *parent)
{
    auto *layered = qobject_cast<HmiLayeredState *>(parent);
    if (layered && layered->exclusiveState())
        return layered->exclusiveState();
    return parent;
}

} // namespace Quorvel
