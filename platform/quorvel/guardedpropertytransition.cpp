#include "guardedpropertytransition.h"

#include <QLoggingCategory>
#include <QMetaProperty>

Q_DECLARE_LOGGING_CATEGORY(quorvelLog)

namespace Quorvel {

namespace {

QMetaMethod notifySignal(const QObject *sender, const QByteArray &property)
{
    if (!sender)
        return QMetaMethod();
    const int index = sender->metaObject()->indexOfProperty(property.constData());
    if (index < 0)
        return QMetaMethod();
    return sender->metaObject()->property(index).notifySignal();
}

} // namespace

GuardedPropertyTransition::GuardedPropertyTransition(const QObject *sender, const char *property,
                                                     QState *source)
    : GuardedSignalTransition(sender, notifySignal(sender, QByteArray(property)), source)
    , m_property(property)
{
    if (signal().isEmpty())
        qCCritical(quorvelLog) << "GuardedPropertyTransition: no notifying property" << property
                               << "on" << sender;
    else
        setObjectName(QString::fromLatin1(m_property));
}

GuardedPropertyTransition::GuardedPropertyTransition(const QObject *sender, const QString &property,
                                                     QState *source)
    : GuardedPropertyTransition(sender, property.toLatin1().constData(), source)
{ }

GuardedPropertyTransition::~GuardedPropertyTransition() = default;

QByteArray GuardedPropertyTransition::propertyName() const
{
    return m_property;
}

QVariant GuardedPropertyTransition::currentValue() const
{
    const QObject *sender = senderObject();
    return sender ? sender->property(m_property.constData()) : QVariant();
}

bool GuardedPropertyTransition::testTrigger(const QVariantList &arguments)
{
    Q_UNUSED(arguments)
    setTransitionData(currentValue());
    return true;
}

} // namespace Quorvel
