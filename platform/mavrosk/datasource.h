#pragma once

#include <QObject>
#include <QString>
#include <QVariant>
#include <QVariantList>
#include <QVariantMap>

namespace Mavrosk {

// Common base of the bridge's sources. Each source is a process-wide object reached through its
// static instance(); values are Qt properties, commands are slots that report themselves to the
// platform journal.
//
// Two sides write the values:
//   - the module, through the public setters; a setter the module calls as part of its behaviour
//     (setCallNumberEntered, setHearItPressed, ...) is journaled as a bridge command;
//   - the phone's side (tests, simulator), through setBridgeValue(name, value), which writes the
//     property through its meta-property without journaling. Setters the module never calls
//     do not journal either, so for them writing the property directly is the same.
class DataSource : public QObject
{
    Q_OBJECT
public:
    // Short name used in journal entries ("phone", "bluetooth", ...).
    QString shortName() const { return m_shortName; }

    // Bridge side: writes the named property as the phone would, without a journal entry.
    // Returns false for an unknown property or a value that does not convert.
    Q_INVOKABLE bool setBridgeValue(const QString &name, const QVariant &value);

    // Back to the values of a head unit with no phone; notifies every value that changes.
    Q_INVOKABLE void reset();

    // Every source created so far, in creation order.
    static QList<DataSource *> sources();

protected:
    explicit DataSource(const QString &shortName);

    // Registers a freshly built source: remembers its initial values for reset().
    template<typename Source> static Source *adopt(Source *source)
    {
        source->registerSource();
        return source;
    }

    // Assigns and notifies only on a real change.
    template<typename Source, typename T, typename Arg>
    void update(T &field, const T &value, void (Source::*notify)(Arg))
    {
        if (field == value)
            return;
        field = value;
        emit(static_cast<Source *>(this)->*notify)(field);
    }

    void journalCall(const QString &member, const QVariantList &args = {}) const;
    // A setter the module calls: journaled unless the bridge side is writing.
    void journalSetter(const QString &member, const QVariant &value) const;

    // Lists and models held by the source go back to empty.
    virtual void resetModels() { }

private:
    void registerSource();

    QString m_shortName;
    QVariantMap m_initialValues;
    int m_bridgeWrites = 0;
};

} // namespace Mavrosk
