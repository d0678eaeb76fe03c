#pragma once

#include <quorvel/hmisignaltransition.h>

namespace Quorvel {

// A signal transition with a guard (see HmiAbstractTransition).
class GuardedSignalTransition : public HmiSignalTransition
{
    Q_OBJECT
public:
    GuardedSignalTransition(const QObject *sender, const char *signal, QState *source = nullptr);
    GuardedSignalTransition(const QObject *sender, const QMetaMethod &signal,
                            QState *source = nullptr);
    template<typename Func>
    GuardedSignalTransition(const typename QtPrivate::FunctionPointer<Func>::Object *sender,
                            Func signal, QState *source = nullptr)
        : GuardedSignalTransition(sender, QMetaMethod::fromSignal(signal), source)
    { }
    ~GuardedSignalTransition() override;
};

} // namespace Quorvel
