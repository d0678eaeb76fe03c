#pragma once

#include <quorvel/guardedsignaltransition.h>

namespace Quorvel {

// Fires when the signal's int argument equals the value.
class IntSignalTransition : public GuardedSignalTransition
{
    Q_OBJECT
public:
    IntSignalTransition(const QObject *sender, const char *signal, int value,
                        QState *source = nullptr);
    IntSignalTransition(const QObject *sender, const QMetaMethod &signal, int value,
                        QState *source = nullptr);
    template<typename Func>
    IntSignalTransition(const typename QtPrivate::FunctionPointer<Func>::Object *sender,
                        Func signal, int value, QState *source = nullptr)
        : IntSignalTransition(sender, QMetaMethod::fromSignal(signal), value, source)
    { }
    ~IntSignalTransition() override;

    int value() const;

protected:
    bool testTrigger(const QVariantList &arguments) override;

private:
    int m_value;
};

} // namespace Quorvel
