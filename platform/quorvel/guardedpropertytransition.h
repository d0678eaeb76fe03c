#pragma once

#include <quorvel/guardedsignaltransition.h>

#include <QByteArray>

namespace Quorvel {

// Fires on the change notification (the NOTIFY signal) of a property of `sender`; the
// property's new value is the transition data. A property without a notify signal is reported
// at critical level and the transition never fires.
class GuardedPropertyTransition : public GuardedSignalTransition
{
    Q_OBJECT
public:
    GuardedPropertyTransition(const QObject *sender, const char *property,
                              QState *source = nullptr);
    GuardedPropertyTransition(const QObject *sender, const QString &property,
                              QState *source = nullptr);
    ~GuardedPropertyTransition() override;

    QByteArray propertyName() const;
    // The property's value now.
    QVariant currentValue() const;

protected:
    bool testTrigger(const QVariantList &arguments) override;

private:
    QByteArray m_property;
};

} // namespace Quorvel
