#include "hmitransition.h"

namespace Quorvel {

HmiTransition::HmiTransition(const QString &eventName, QState *source)
    : GuardedTransition(eventName, source)
{ }

HmiTransition::~HmiTransition() = default;

} // namespace Quorvel
