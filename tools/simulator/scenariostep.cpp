#include "scenariostep.h"

#include "carkeys.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonParseError>
#include <QTextCodec>

#include <climits>
#include <cmath>

namespace Simulator {

namespace {

struct StepName
{
    const char *key;
    ScenarioStep::Kind kind;
    // The other fields a step of this kind may have.
    const char *fields[3];
};

// The key that names each kind of step; every step has exactly one of them.
const StepName StepNames[] = {
        {"set", ScenarioStep::Set, {"value"}},
        {"emit", ScenarioStep::Emit, {"args"}},
        {"key", ScenarioStep::Key, {"kind"}},
        {"call", ScenarioStep::Call, {"args"}},
        {"answer", ScenarioStep::Answer, {"call", "args"}},
        {"intent", ScenarioStep::Intent, {"args"}},
        {"post", ScenarioStep::Post, {"value"}},
        {"open", ScenarioStep::Open, {}},
        {"back", ScenarioStep::Back, {}},
        {"model", ScenarioStep::Model, {"rows", "length"}},
        {"advance", ScenarioStep::Advance, {}},
        {"start", ScenarioStep::Start, {}},
        {"expect", ScenarioStep::Expect, {}},
        {"expect-not", ScenarioStep::ExpectNot, {}},
};

// Empty when `value` is a whole number from `minimum` to `maximum`.
QString checkWhole(const QJsonValue &value, const char *field, double minimum, double maximum)
{
    const QString name = QString::fromLatin1(field);
    if (!value.isDouble())
        return QStringLiteral("\"%1\" must be a number").arg(name);
    const double number = value.toDouble();
    if (!std::isfinite(number) || std::trunc(number) != number)
        return QStringLiteral("\"%1\" must be a whole number").arg(name);
    if (number < minimum || number > maximum)
        return QStringLiteral("\"%1\" must be from %2 to %3")
                .arg(name, QString::number(qint64(minimum)), QString::number(qint64(maximum)));
    return QString();
}

QString checkString(const QJsonValue &value, const char *field)
{
    if (!value.isString() || value.toString().isEmpty())
        return QStringLiteral("\"%1\" must be a non-empty string").arg(QLatin1String(field));
    return QString();
}

QString checkFields(const ScenarioStep &step, const char *key)
{
    const QJsonObject &o = step.object;
    const auto has = [&o](const char *field) { return o.contains(QLatin1String(field)); };
    switch (step.kind) {
    case ScenarioStep::Set:
        if (!has("value"))
            return QStringLiteral("\"set\" needs a \"value\"");
        return checkString(o.value(QLatin1String("set")), "set");
    case ScenarioStep::Emit:
    case ScenarioStep::Call:
    case ScenarioStep::Post:
        return checkString(o.value(QLatin1String(key)), key);
    case ScenarioStep::Answer: {
        const QString error = checkString(o.value(QLatin1String(key)), key);
        if (!error.isEmpty() || !has("call"))
            return error;
        return checkString(o.value(QLatin1String("call")), "call");
    }
    case ScenarioStep::Key: {
        if (!has("kind"))
            return QStringLiteral("\"key\" needs a \"kind\"");
        QString error = checkWhole(o.value(QLatin1String("key")), "key", INT_MIN, INT_MAX);
        if (error.isEmpty())
            error = checkWhole(o.value(QLatin1String("kind")), "kind", INT_MIN, INT_MAX);
        return error.isEmpty() ? carKeyError(o.value(QLatin1String("key")).toInt(),
                                             o.value(QLatin1String("kind")).toInt())
                               : error;
    }
    case ScenarioStep::Intent:
        return checkWhole(o.value(QLatin1String("intent")), "intent", INT_MIN, INT_MAX);
    case ScenarioStep::Open: {
        const QString what = o.value(QLatin1String("open")).toString();
        if (what != QLatin1String("phone") && what != QLatin1String("module")
            && what != QLatin1String("home") && what != QLatin1String("settings")
            && !(what.startsWith(QLatin1String("settings/")) && what.size() > 9))
            return QStringLiteral("the menu bar opens phone, home, settings or settings/<entry>");
        return QString();
    }
    case ScenarioStep::Back:
        return checkWhole(o.value(QLatin1String("back")), "back", 1, ScenarioStep::MaximumBack);
    case ScenarioStep::Model: {
        const QString error = checkString(o.value(QLatin1String("model")), "model");
        if (!error.isEmpty())
            return error;
        if (!has("rows") && !has("length"))
            return QStringLiteral("\"model\" needs \"rows\" or \"length\"");
        if (has("length")) {
            const QString lengthError
                    = checkWhole(o.value(QLatin1String("length")), "length", 0, INT_MAX);
            if (!lengthError.isEmpty())
                return lengthError;
        }
        for (const QJsonValue &row : o.value(QLatin1String("rows")).toArray()) {
            if (!row.isObject())
                return QStringLiteral("every row of \"rows\" is an object of roles");
        }
        return QString();
    }
    case ScenarioStep::Advance:
        return checkWhole(o.value(QLatin1String("advance")), "advance", 0,
                          double(ScenarioStep::MaximumAdvance));
    case ScenarioStep::Start:
        if (!o.value(QLatin1String("start")).isBool())
            return QStringLiteral("\"start\" must be true or false");
        return QString();
    case ScenarioStep::Expect:
    case ScenarioStep::ExpectNot: {
        const QJsonValue checks = o.value(QLatin1String(key));
        if (!checks.isObject() || checks.toObject().isEmpty())
            return QStringLiteral("an expectation is a non-empty object of checks");
        return QString();
    }
    default:
        return QString();
    }
}

// Empty when the bytes are text: UTF-8 without NUL bytes.
QString checkText(const QByteArray &line)
{
    const int nul = line.indexOf('\0');
    if (nul >= 0)
        return QStringLiteral("a NUL byte at column %1").arg(nul + 1);
    QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
    QTextCodec::codecForMib(106)->toUnicode(line.constData(), line.size(), &state);
    if (state.invalidChars > 0 || state.remainingChars > 0)
        return QStringLiteral("not UTF-8 text");
    return QString();
}

} // namespace

QString ScenarioStep::name() const
{
    for (const StepName &step : StepNames) {
        if (step.kind == kind)
            return object.value(QLatin1String(step.key)).toString();
    }
    return QString();
}

ScenarioStep ScenarioStep::parse(const QByteArray &line, int lineNumber)
{
    ScenarioStep step;
    step.line = lineNumber;
    const QString textError = checkText(line);
    if (!textError.isEmpty()) {
        step.error = textError;
        return step;
    }
    step.text = QString::fromUtf8(line).trimmed();
    if (step.text.isEmpty() || step.text.startsWith(QLatin1Char('#'))) {
        step.kind = Comment;
        return step;
    }

    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(step.text.toUtf8(), &error);
    if (error.error != QJsonParseError::NoError) {
        step.error = QStringLiteral("not JSON: %1 at column %2")
                             .arg(error.errorString())
                             .arg(error.offset + 1);
        return step;
    }
    if (!document.isObject()) {
        step.error = QStringLiteral("a step is a JSON object");
        return step;
    }
    step.object = document.object();

    // A step's own fields may carry another step's name ("answer" has a "call").
    const auto isFieldOf = [](const StepName *step, const char *key) {
        for (const char *field : step->fields) {
            if (field && qstrcmp(field, key) == 0)
                return true;
        }
        return false;
    };
    const StepName *found = nullptr;
    for (const StepName &name : StepNames) {
        if (!step.object.contains(QLatin1String(name.key)))
            continue;
        if (!found) {
            found = &name;
        } else if (isFieldOf(&name, found->key)) {
            found = &name;
        } else if (!isFieldOf(found, name.key)) {
            step.error = QStringLiteral("a step names one thing to do, not \"%1\" and \"%2\"")
                                 .arg(QLatin1String(found->key), QLatin1String(name.key));
            return step;
        }
    }
    if (!found) {
        step.error = QStringLiteral("unknown step");
        return step;
    }
    for (auto it = step.object.constBegin(); it != step.object.constEnd(); ++it) {
        bool known = it.key() == QLatin1String(found->key);
        for (const char *field : found->fields)
            known = known || (field && it.key() == QLatin1String(field));
        if (!known) {
            step.error = QStringLiteral("\"%1\" takes no field \"%2\"")
                                 .arg(QLatin1String(found->key), it.key());
            return step;
        }
    }
    if (step.object.contains(QLatin1String("args"))
        && !step.object.value(QLatin1String("args")).isArray()) {
        step.error = QStringLiteral("\"args\" must be an array");
        return step;
    }
    if (step.object.contains(QLatin1String("rows"))
        && !step.object.value(QLatin1String("rows")).isArray()) {
        step.error = QStringLiteral("\"rows\" must be an array");
        return step;
    }
    step.kind = found->kind;
    step.error = checkFields(step, found->key);
    if (!step.error.isEmpty())
        step.kind = Invalid;
    return step;
}

} // namespace Simulator
