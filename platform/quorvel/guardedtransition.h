#pragma once

#include <quorvel/hmiabstracttransition.h>

namespace Quorvel {

// An event transition with a guard: fires on the HmiEvent of its name (exact, case-sensitive)
// and hands the event's value out through transitionData().
class GuardedTransition : public HmiAbstractTransition
{
    Q_OBJECT
public:
    explicit GuardedTransition(const QString &eventName, QState *source = nullptr);
    ~GuardedTransition() override;

    QString eventName() const;

protected:
    bool testTrigger(const QVariantList &arguments) override;

private:
    QString m_eventName;
};

} // namespace Quorvel
