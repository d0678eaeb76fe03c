#include "hmisignaltransition.h"

#include <QHash>
#include <QLoggingCategory>
#include <QPair>

Q_DECLARE_LOGGING_CATEGORY(quorvelLog)

namespace Quorvel {

namespace {

// A module names its signals by the same few signatures many times (every key row names
// "keyEvent(int, int)"): each is normalized and looked up once per sender class.
QMetaMethod signalFor(const QObject *sender, const char *signal)
{
    if (!sender || !signal)
        return QMetaMethod();
    static QHash<QPair<const QMetaObject *, QByteArray>, int> known;
    const QMetaObject *meta = sender->metaObject();
    const QByteArray written = QByteArray::fromRawData(signal, int(qstrlen(signal)));
    auto found = known.constFind(qMakePair(meta, written));
    if (found == known.constEnd()) {
        QByteArray signature(written.constData(), written.size());
        if (signature.startsWith('2'))
            signature.remove(0, 1);
        signature = QMetaObject::normalizedSignature(signature.constData());
        found = known.insert(qMakePair(meta, QByteArray(signal)),
                             meta->indexOfSignal(signature.constData()));
    }
    return found.value() < 0 ? QMetaMethod() : meta->method(found.value());
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
        // Many transitions listen to the same signal: its signature and name are made once.
        static QHash<QPair<const QMetaObject *, int>, QPair<QByteArray, QString>> names;
        const auto key = qMakePair(signal.enclosingMetaObject(), signal.methodIndex());
        auto name = names.constFind(key);
        if (name == names.constEnd()) {
            const QByteArray signature = signal.methodSignature();
            name = names.insert(key, qMakePair(signature, QString::fromLatin1(signature)));
        }
        m_signal = name->first;
        setObjectName(name->second);
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
