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

    // Registered once, when the framework's library is loaded: the framework and every module
    // read the same value, and a test of an event's type is one comparison.
    static QEvent::Type eventType() { return s_type; }

    QString name() const { return m_name; }
    QVariant value() const { return m_value; }

private:
    static const QEvent::Type s_type;

    QString m_name;
    QVariant m_value;
};

} // namespace Quorvel
