#pragma once

#include <quorvel/hmiabstracttransition.h>

#include <QByteArray>
#include <QMetaMethod>
#include <QPointer>

namespace Quorvel {

// Fires when `sender` emits the signal. The signal is given as a signature, with or without the
// SIGNAL() prefix ("2keyEvent(int, int)", "textMessageDetailsReady()"), or as a pointer to the
// signal member. A signature that the sender does not have is reported at critical level and
// the transition never fires.
class HmiSignalTransition : public HmiAbstractTransition
{
    Q_OBJECT
public:
    HmiSignalTransition(const QObject *sender, const char *signal, QState *source = nullptr);
    HmiSignalTransition(const QObject *sender, const QMetaMethod &signal, QState *source = nullptr);
    template<typename Func>
    HmiSignalTransition(const typename QtPrivate::FunctionPointer<Func>::Object *sender,
                        Func signal, QState *source = nullptr)
        : HmiSignalTransition(sender, QMetaMethod::fromSignal(signal), source)
    { }
    ~HmiSignalTransition() override;

    const QObject *senderObject() const;
    // The normalised signature of the signal, without prefix.
    QByteArray signal() const;

protected:
    bool testTrigger(const QVariantList &arguments) override;

private:
    QPointer<const QObject> m_sender;
    QByteArray m_signal;
};

} // namespace Quorvel
