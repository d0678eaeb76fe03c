#include "hmilayeredstate.h"
#include "statemachine_p.h"

namespace Quorvel {

HmiLayeredState::HmiLayeredState(const QString &name, QState *parent)
    : HmiState(name, QState::ParallelStates, parent)
{
    m_exclusive = new HmiState(name + QStringLiteral("Exclusive"), this);
    m_layer = StateMachinePrivate::get()->createPopupRegion(name + QStringLiteral("Layer"), this);
}

HmiLayeredState::~HmiLayeredState() = default;

HmiState *HmiLayeredState::exclusiveState() const
{
    return m_exclusive;
}

QState *HmiLayeredState::layerState() const
{
    return m_layer;
}

void HmiLayeredState::setInitialHmiState(QAbstractState *state)
{
    m_exclusive->setInitialState(state);
}

QAbstractState *HmiLayeredState::initialHmiState() const
{
    return m_exclusive->initialState();
}

} // namespace Quorvel
