#include "scenariostep.h"

#include <QJsonDocument>
#include <QJsonParseError>

namespace Simulator {

namespace {

struct StepName
{
    const char *key;
    ScenarioStep::Kind kind;
};

// The key that names each kind of step; every step has exactly one of them.
constexpr StepName StepNames[] = {
        {"set", ScenarioStep::Set},
        {"emit", ScenarioStep::Emit},
        {"key", ScenarioStep::Key},
        {"call", ScenarioStep::Call},
        {"intent", ScenarioStep::Intent},
        {"post", ScenarioStep::Post},
        {"open", ScenarioStep::Open},
        {"back", ScenarioStep::Back},
        {"model", ScenarioStep::Model},
        {"advance", ScenarioStep::Advance},
        {"start", ScenarioStep::Start},
        {"expect", ScenarioStep::Expect},
        {"expect-not", ScenarioStep::ExpectNot},
};

QString checkShape(const ScenarioStep &step, const QJsonValue &named)
{
    const QJsonObject &o = step.object;
    switch (step.kind) {
    case ScenarioStep::Set:
        if (!o.value(QLatin1String("set")).isString() || !o.contains(QLatin1String("value")))
            return QStringLiteral("\"set\" needs a name and a \"value\"");
        break;
    case ScenarioStep::Emit:
    case ScenarioStep::Call:
    case ScenarioStep::Post:
    case ScenarioStep::Open:
        if (!named.isString())
            return QStringLiteral("the step needs a name");
        break;
    case ScenarioStep::Key:
        if (!o.value(QLatin1String("key")).isDouble() || !o.value(QLatin1String("kind")).isDouble())
            return QStringLiteral("\"key\" needs a key number and a \"kind\"");
        break;
    case ScenarioStep::Intent:
        if (!o.value(QLatin1String("intent")).isDouble())
            return QStringLiteral("\"intent\" needs an action number");
        break;
    case ScenarioStep::Advance:
        if (!o.value(QLatin1String("advance")).isDouble()
            || o.value(QLatin1String("advance")).toDouble() < 0)
            return QStringLiteral("\"advance\" needs a number of milliseconds");
        break;
    case ScenarioStep::Model:
        if (!o.value(QLatin1String("model")).isString()
            || (!o.value(QLatin1String("rows")).isArray()
                && !o.value(QLatin1String("length")).isDouble()))
            return QStringLiteral("\"model\" needs a name and \"rows\" or \"length\"");
        break;
    case ScenarioStep::Expect:
    case ScenarioStep::ExpectNot:
        if (!named.isObject())
            return QStringLiteral("an expectation is an object of checks");
        break;
    default:
        break;
    }
    for (const char *name : {"args", "rows"}) {
        if (o.contains(QLatin1String(name)) && !o.value(QLatin1String(name)).isArray())
            return QStringLiteral("\"%1\" must be an array").arg(QLatin1String(name));
    }
    return QString();
}

} // namespace

bool ScenarioStep::parse(const QString &text, int line, ScenarioStep *step)
{
    const QString trimmed = text.trimmed();
    if (trimmed.isEmpty() || trimmed.startsWith(QLatin1Char('#')))
        return false;

    *step = ScenarioStep();
    step->line = line;
    step->text = trimmed;
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(trimmed.toUtf8(), &error);
    if (error.error != QJsonParseError::NoError) {
        step->error = QStringLiteral("not JSON: %1 at column %2")
                              .arg(error.errorString())
                              .arg(error.offset + 1);
        return true;
    }
    if (!document.isObject()) {
        step->error = QStringLiteral("a step is a JSON object");
        return true;
    }
    step->object = document.object();

    int found = 0;
    QJsonValue named;
    for (const StepName &name : StepNames) {
        if (step->object.contains(QLatin1String(name.key))) {
            step->kind = name.kind;
            named = step->object.value(QLatin1String(name.key));
            ++found;
        }
    }
    if (found != 1) {
        step->kind = Invalid;
        step->error = found ? QStringLiteral("a step names one thing to do")
                            : QStringLiteral("unknown step");
        return true;
    }
    const QString shapeError = checkShape(*step, named);
    if (!shapeError.isEmpty()) {
        step->kind = Invalid;
        step->error = shapeError;
    }
    return true;
}

} // namespace Simulator
