#include "keysignaltransition.h"

namespace Quorvel {

KeySignalTransition::KeySignalTransition(const QObject *sender, const char *signal, int key,
                                         int kind, QState *source)
    : GuardedSignalTransition(sender, signal, source)
    , m_key(key)
    , m_kind(kind)
{ }

KeySignalTransition::KeySignalTransition(const QObject *sender, const QMetaMethod &signal, int key,
                                         int kind, QState *source)
    : GuardedSignalTransition(sender, signal, source)
    , m_key(key)
    , m_kind(kind)
{ }

KeySignalTransition::~KeySignalTransition() = default;

int KeySignalTransition::key() const
{
    return m_key;
}

int KeySignalTransition::kind() const
{
    return m_kind;
}

bool KeySignalTransition::testTrigger(const QVariantList &arguments)
{
    bool keyOk = false;
    bool kindOk = false;
    const int key = arguments.value(0).toInt(&keyOk);
    const int kind = arguments.value(1).toInt(&kindOk);
    if (!keyOk || !kindOk || key != m_key || kind != m_kind)
        return false;
    return GuardedSignalTransition::testTrigger(arguments);
}

} // namespace Quorvel
