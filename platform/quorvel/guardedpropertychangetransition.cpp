#include "guardedpropertychangetransition.h"

namespace Quorvel {

GuardedPropertyChangeTransition::GuardedPropertyChangeTransition(const QObject *sender,
                                                                 const char *property,
                                                                 const QVariantList &fromValues,
                                                                 const QVariant &toValue,
                                                                 QState *source)
    : GuardedPropertyTransition(sender, property, source)
    , m_fromValues(fromValues)
    , m_toValue(toValue)
    , m_lastValue(currentValue())
{ }

GuardedPropertyChangeTransition::GuardedPropertyChangeTransition(const QObject *sender,
                                                                 const QString &property,
                                                                 const QVariantList &fromValues,
                                                                 const QVariant &toValue,
                                                                 QState *source)
    : GuardedPropertyChangeTransition(sender, property.toLatin1().constData(), fromValues, toValue,
                                      source)
{ }

GuardedPropertyChangeTransition::~GuardedPropertyChangeTransition() = default;

QVariantList GuardedPropertyChangeTransition::fromValues() const
{
    return m_fromValues;
}

QVariant GuardedPropertyChangeTransition::toValue() const
{
    return m_toValue;
}

QVariant GuardedPropertyChangeTransition::lastValue() const
{
    return m_lastValue;
}

bool GuardedPropertyChangeTransition::testTrigger(const QVariantList &arguments)
{
    Q_UNUSED(arguments)
    const QVariant previous = m_lastValue;
    const QVariant value = currentValue();
    m_lastValue = value;
    if (value == previous)
        return false;
    if (!m_fromValues.isEmpty() && !m_fromValues.contains(previous))
        return false;
    if (m_toValue.isValid() && value != m_toValue)
        return false;
    setTransitionData(value);
    return true;
}

} // namespace Quorvel
