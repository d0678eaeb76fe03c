#include "guardedsignaltransition.h"

namespace Quorvel {

GuardedSignalTransition::GuardedSignalTransition(const QObject *sender, const char *signal,
                                                 QState *source)
    : HmiSignalTransition(sender, signal, source)
{ }

GuardedSignalTransition::GuardedSignalTransition(const QObject *sender, const QMetaMethod &signal,
                                                 QState *source)
    : HmiSignalTransition(sender, signal, source)
{ }

GuardedSignalTransition::~GuardedSignalTransition() = default;

} // namespace Quorvel
