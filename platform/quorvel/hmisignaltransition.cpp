#include "hmisignaltransition.h"

#include <QLoggingCategory>

Q_DECLARE_LOGGING_CATEGORY(quorvelLog)

namespace Quorvel {

namespace {

QMetaMethod signalFor(const QObject *sender, const char *signal)
{
    if (!sender || !signal)
        return QMetaMethod();
    QByteArray signature(signal);
    if (signature.startsWith('2'))
        signature.remove(0, 1);
    signature = QMetaObject::normalizedSignature(signature.constData());
    const int index = sender->metaObject()->indexOfSignal(signature.constData());
    return index < 0 ? QMetaMethod() : sender->metaObject()->method(index);
}

} // namespace

HmiSignalTransition::HmiSignalTransition(const QObject *sender, const char *signal, QState *source)
    : HmiSignalTransition(sender, signalFor(sender, signal), source)
{
    if (m_signal.isEmpty())
        qCCritical(quorvelLog) << "HmiSignalTransition: no signal" << signal << "on" << sender;
}

HmiSignalTransition::HmiSignalTransition(const QObject *sender, const QMetaMethod &signal,
                                         QState *source)
    : HmiAbstractTransition(source)
    , m_sender(sender)
{
    if (signal.isValid() && signal.methodType() == QMetaMethod::Signal && sender
        && listenToSignal(sender, signal.methodIndex())) {
        m_signal = signal.methodSignature();
        setObjectName(QString::fromLatin1(m_signal));
    }
}

HmiSignalTransition::~HmiSignalTransition() = default;

const QObject *HmiSignalTransition::senderObject() const
{
    return m_sender;
}

QByteArray HmiSignalTransition::signal() const
{
    return m_signal;
}

bool HmiSignalTransition::testTrigger(const QVariantList &arguments)
{
    if (arguments.isEmpty())
        setTransitionData(QVariant());
    else if (arguments.size() == 1)
        setTransitionData(arguments.first());
    else
        setTransitionData(arguments);
    return true;
}

} // namespace Quorvel
