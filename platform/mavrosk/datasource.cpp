#include "datasource.h"

#include <journal/journal.h>

#include <QMetaProperty>

namespace Mavrosk {

namespace {

QList<DataSource *> &registry()
{
    static QList<DataSource *> list;
    return list;
}

// Properties declared by the concrete source (not those of QObject or DataSource).
template<typename Visit> void forEachSourceProperty(const QObject *object, Visit visit)
{
    const QMetaObject *meta = object->metaObject();
    for (int i = DataSource::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i)
        visit(meta->property(i));
}

} // namespace

DataSource::DataSource(const QString &shortName)
    : m_shortName(shortName)
{
    setObjectName(shortName);
}

QList<DataSource *> DataSource::sources()
{
    return registry();
}

void DataSource::registerSource()
{
    forEachSourceProperty(this, [this](const QMetaProperty &property) {
        m_initialValues.insert(QString::fromLatin1(property.name()), property.read(this));
    });
    registry().append(this);
}

bool DataSource::setBridgeValue(const QString &name, const QVariant &value)
{
    const QMetaObject *meta = metaObject();
    const int index = meta->indexOfProperty(name.toLatin1().constData());
    if (index < DataSource::staticMetaObject.propertyCount())
        return false;
    QVariant converted = value;
    const QMetaProperty property = meta->property(index);
    if (!converted.convert(property.userType()))
        return false;
    ++m_bridgeWrites;
    const bool written = property.write(this, converted);
    --m_bridgeWrites;
    return written;
}

void DataSource::reset()
{
    for (auto it = m_initialValues.cbegin(); it != m_initialValues.cend(); ++it)
        setBridgeValue(it.key(), it.value());
    resetModels();
}

void DataSource::journalCall(const QString &member, const QVariantList &args) const
{
    Platform::Journal::instance()->append(
            QStringLiteral("bridge"),
            {{QStringLiteral("call"), QString(m_shortName + QLatin1Char('.') + member)},
             {QStringLiteral("args"), args}});
}

void DataSource::journalSetter(const QString &member, const QVariant &value) const
{
    if (m_bridgeWrites == 0)
        journalCall(member, {value});
}

} // namespace Mavrosk
