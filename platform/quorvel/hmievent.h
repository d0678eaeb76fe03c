#pragma once

#include <QEvent>
#include <QString>
#include <QVariant>

namespace Quorvel {

// A named state-machine event with an optional value, posted by modules and matched by
// HmiTransition on its exact, case-sensitive name.
class HmiEvent : public QEvent
{
public:
    explicit HmiEvent(const QString &name, const QVariant &value = QVariant())
        : QEvent(eventType())
        , m_name(name)
        , m_value(value)
    { }

    static QEvent::Type eventType()
    {
        static const int type = QEvent::registerEventType();
        return static_cast<QEvent::Type>(type);
    }

    QString name() const { return m_name; }
    QVariant value() const { return m_value; }

private:
    QString m_name;
    QVariant m_value;
};

} // namespace Quorvel
