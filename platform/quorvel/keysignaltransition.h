#pragma once

#include <quorvel/guardedsignaltransition.h>

namespace Quorvel {

// Fires when the key signal (sender, "2keyEvent(int, int)") carries this key and this kind.
class KeySignalTransition : public GuardedSignalTransition
{
    Q_OBJECT
public:
    KeySignalTransition(const QObject *sender, const char *signal, int key, int kind,
                        QState *source = nullptr);
    KeySignalTransition(const QObject *sender, const QMetaMethod &signal, int key, int kind,
                        QState *source = nullptr);
    template<typename Func>
    KeySignalTransition(const typename QtPrivate::FunctionPointer<Func>::Object *sender,
                        Func signal, int key, int kind, QState *source = nullptr)
        : KeySignalTransition(sender, QMetaMethod::fromSignal(signal), key, kind, source)
    { }
    ~KeySignalTransition() override;

    int key() const;
    int kind() const;

protected:
    bool testTrigger(const QVariantList &arguments) override;

private:
    int m_key;
    int m_kind;
};

} // namespace Quorvel
