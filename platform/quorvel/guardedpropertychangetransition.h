#pragma once

#include <quorvel/guardedpropertytransition.h>

#include <QVariantList>

namespace Quorvel {

// Fires on a real change of the property: from one of `fromValues` (any value when the list is
// empty) to `toValue` (any other value when it is a null QVariant). It keeps the last value it
// saw (read at construction, then at every notification, whatever is active), so the previous
// value is always known.
class GuardedPropertyChangeTransition : public GuardedPropertyTransition
{
    Q_OBJECT
public:
    GuardedPropertyChangeTransition(const QObject *sender, const char *property,
                                    const QVariantList &fromValues, const QVariant &toValue,
                                    QState *source = nullptr);
    GuardedPropertyChangeTransition(const QObject *sender, const QString &property,
                                    const QVariantList &fromValues, const QVariant &toValue,
                                    QState *source = nullptr);
    ~GuardedPropertyChangeTransition() override;

    QVariantList fromValues() const;
    QVariant toValue() const;
    QVariant lastValue() const;

protected:
    bool testTrigger(const QVariantList &arguments) override;

private:
    QVariantList m_fromValues;
    QVariant m_toValue;
    QVariant m_lastValue;
};

} // namespace Quorvel
