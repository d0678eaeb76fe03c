#pragma once

#include <quorvel/guardedtransition.h>

namespace Quorvel {

// The module's event transition: fires on the HmiEvent of its name (guarded when a slot is
// connected to transitionTest).
class HmiTransition : public GuardedTransition
{
    Q_OBJECT
public:
    explicit HmiTransition(const QString &eventName, QState *source = nullptr);
    ~HmiTransition() override;
};

} // namespace Quorvel
