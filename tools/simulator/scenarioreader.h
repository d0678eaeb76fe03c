#pragma once

#include "scenariostep.h"

#include <QJsonValue>
#include <QList>
#include <QMetaProperty>
#include <QString>
#include <QVariant>

class QObject;

namespace Simulator {

// A line of a scenario that cannot be run, and why.
struct ScenarioError
{
    int line = 0;
    QString message;
};

// A value that a scenario names ("phone.status", "controller.longPressInterval",
// "host.displayContext"): the object and property behind it, or why there is none.
struct NamedValue
{
    QObject *object = nullptr;
    QMetaProperty property;
    QString error;
    bool isValid() const { return error.isEmpty(); }
};

// Reads a scenario and checks it whole before anything runs. Two passes:
//   read():  every line on its own (text, JSON, kind of step, shape and types of its fields);
//   check(): every name against the bridge and the hosted module (sources, properties, signals,
//            controller slots, list models, checks) and every value against the type it is
//            written to. Values are never converted: a property declared int takes a whole
//            number in range, a bool takes true or false. Arguments of a "call" are the one
//            exception: they reach the slot as QML would pass them, converted by Qt.
class ScenarioReader
{
public:
    // One step per line, comments and blank lines included (kind Comment), in line order. A
    // UTF-8 byte-order mark at the start is skipped.
    static QList<ScenarioStep> read(const QByteArray &text);

    // Why `step` cannot run against the bridge and `controller` (null: the controller's names
    // are not checked); empty when it can.
    static QString check(const ScenarioStep &step, const QObject *controller);

    // Every error of the scenario, in line order: the lines that read() refused and those that
    // check() refuses.
    static QList<ScenarioError> errors(const QList<ScenarioStep> &steps, const QObject *controller);

    // The object and property behind a value name; `controller` answers "controller.*".
    static NamedValue resolve(const QString &name, QObject *controller);

    // `value` as exactly the meta-type `type` (int, bool, QString, a list or any QVariant), or
    // an invalid QVariant with `error` set when the JSON value is not of that type.
    static QVariant exactValue(const QJsonValue &value, int type, QString *error);
};

} // namespace Simulator
