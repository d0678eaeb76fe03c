#include "intsignaltransition.h"

namespace Quorvel {

IntSignalTransition::IntSignalTransition(const QObject *sender, const char *signal, int value,
                                         QState *source)
    : GuardedSignalTransition(sender, signal, source)
    , m_value(value)
{ }

IntSignalTransition::IntSignalTransition(const QObject *sender, const QMetaMethod &signal,
                                         int value, QState *source)
    : GuardedSignalTransition(sender, signal, source)
    , m_value(value)
{ }

IntSignalTransition::~IntSignalTransition() = default;

int IntSignalTransition::value() const
{
    return m_value;
}

bool IntSignalTransition::testTrigger(const QVariantList &arguments)
{
    bool ok = false;
    const int argument = arguments.value(0).toInt(&ok);
    if (!ok || argument != m_value)
        return false;
    return GuardedSignalTransition::testTrigger(arguments);
}

} // namespace Quorvel
