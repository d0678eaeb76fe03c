#pragma once

class QAbstractState;

namespace Quorvel {

// Decides whether a back navigation may land on a state (see HmiViewState::addBackTargetFilter).
class HmiTargetFilter
{
public:
    virtual ~HmiTargetFilter();
    virtual bool acceptsTarget(const QAbstractState *state) const = 0;
};

} // namespace Quorvel
