#pragma once

#include <QMetaMethod>
#include <QString>
#include <QVariant>
#include <QVariantList>

class QObject;

namespace Simulator {

// Calls a slot, an invokable method or a signal of `object` by name: the method of that name and
// number of parameters whose parameters the arguments convert to (QVariant::convert). Returns
// false and sets `error` when there is none. `result` receives a value the method returns. The
// bridge's signals are emitted so; a view's calls go through the QML engine instead
// (ScenarioRunner), with QML's own conversions.
bool invokeByName(QObject *object, const QString &name, const QVariantList &args,
                  QMetaMethod::MethodType type, QString *error, QVariant *result = nullptr);

} // namespace Simulator
