#include "scenarioreader.h"

#include "expectationjudge.h"

#include <brisken/datastore.h>
#include <mavrosk/bridge.h>
#include <mavrosk/datasource.h>
#include <mavrosk/infinitelistmodel.h>

#include <QJsonArray>
#include <QJsonObject>
#include <QMetaMethod>
#include <QMetaObject>

#include <climits>
#include <cmath>

namespace Simulator {

namespace {

const QString ControllerPrefix = QStringLiteral("controller");

// The host's own settings: written with "set" before or while the module runs.
struct HostSetting
{
    const char *name;
    int type;
};
constexpr HostSetting HostSettings[] = {
        {"displayContext", QMetaType::Int},
        {"statusBarVisible", QMetaType::Bool},
        {"statusBar", QMetaType::Bool},
};

Mavrosk::DataSource *sourceNamed(const QString &shortName)
{
    for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources()) {
        if (source->shortName() == shortName)
            return source;
    }
    return nullptr;
}

// The properties a scenario may name on a source: its own, not those of its base classes.
int firstOwnProperty(const QObject *object)
{
    return qobject_cast<const Mavrosk::DataSource *>(object)
            ? Mavrosk::DataSource::staticMetaObject.propertyCount()
            : QObject::staticMetaObject.propertyCount();
}

QString typeName(int type)
{
    switch (type) {
    case QMetaType::Int:
        return QStringLiteral("a whole number");
    case QMetaType::Bool:
        return QStringLiteral("true or false");
    case QMetaType::QString:
        return QStringLiteral("a string");
    case QMetaType::QVariantList:
    case QMetaType::QStringList:
        return QStringLiteral("an array");
    default:
        return QString::fromLatin1(QMetaType::typeName(type));
    }
}

QString checkSet(const ScenarioStep &step, QObject *controller)
{
    const QString name = step.name();
    const QString prefix = name.section(QLatin1Char('.'), 0, 0);
    const QString member = name.section(QLatin1Char('.'), 1);
    const QJsonValue value = step.value("value");
    QString error;
    if (prefix == QLatin1String("host")) {
        for (const HostSetting &setting : HostSettings) {
            if (member == QLatin1String(setting.name)) {
                ScenarioReader::exactValue(value, setting.type, &error);
                return error.isEmpty() ? QString() : name + QStringLiteral(": ") + error;
            }
        }
        return QStringLiteral("unknown host setting %1").arg(member);
    }
    if (prefix == ControllerPrefix && !controller)
        return QString();
    const NamedValue target = ScenarioReader::resolve(name, controller);
    if (!target.isValid())
        return target.error;
    if (!target.property.isWritable())
        return QStringLiteral("%1 cannot be written").arg(name);
    ScenarioReader::exactValue(value, target.property.userType(), &error);
    return error.isEmpty() ? QString() : name + QStringLiteral(": ") + error;
}

QString checkEmit(const ScenarioStep &step)
{
    const QString name = step.name();
    const QString prefix = name.section(QLatin1Char('.'), 0, 0);
    const QByteArray member = name.section(QLatin1Char('.'), 1).toLatin1();
    Mavrosk::DataSource *source = sourceNamed(prefix);
    if (!source)
        return QStringLiteral("unknown source %1").arg(prefix);
    const QJsonArray args = step.value("args").toArray();
    const QMetaObject *meta = source->metaObject();
    bool named = false;
    for (int i = 0; i < meta->methodCount(); ++i) {
        const QMetaMethod method = meta->method(i);
        if (method.methodType() != QMetaMethod::Signal || method.name() != member)
            continue;
        named = true;
        if (method.parameterCount() != args.size())
            continue;
        for (int p = 0; p < args.size(); ++p) {
            QString error;
            ScenarioReader::exactValue(args.at(p), method.parameterType(p), &error);
            if (!error.isEmpty())
                return QStringLiteral("argument %1 of %2: %3").arg(p + 1).arg(name, error);
        }
        return QString();
    }
    return named ? QStringLiteral("signal %1 takes no %2 argument(s)").arg(name).arg(args.size())
                 : QStringLiteral("%1 has no signal %2").arg(prefix, QString::fromLatin1(member));
}

QString checkCall(const ScenarioStep &step, const QObject *controller)
{
    if (!controller
        || (step.kind == ScenarioStep::Answer && !step.object.contains(QLatin1String("call"))))
        return QString();
    const QByteArray name
            = (step.kind == ScenarioStep::Answer ? step.value("call").toString() : step.name())
                      .toLatin1();
    const int count = step.value("args").toArray().size();
    // The engine calls what QML can; it hides deleteLater() from QML.
    if (name == "deleteLater")
        return QStringLiteral("QML cannot call deleteLater");
    const QMetaObject *meta = controller->metaObject();
    bool named = false;
    for (int i = 0; i < meta->methodCount(); ++i) {
        const QMetaMethod method = meta->method(i);
        if (method.name() != name || method.access() != QMetaMethod::Public
            || (method.methodType() != QMetaMethod::Slot
                && method.methodType() != QMetaMethod::Method))
            continue;
        named = true;
        if (method.parameterCount() == count)
            return QString();
    }
    return named ? QStringLiteral("slot %1 takes no %2 argument(s)")
                           .arg(QString::fromLatin1(name))
                           .arg(count)
                 : QStringLiteral("the controller has no slot %1").arg(QString::fromLatin1(name));
}

QString checkModel(const ScenarioStep &step)
{
    const QString name = step.name();
    Mavrosk::MultiDPListModel *model = Mavrosk::listModel(name);
    if (!model)
        return QStringLiteral("unknown list model %1").arg(name);
    // Only the contact list has a length beyond its rows.
    if (step.object.contains(QLatin1String("length"))
        && !qobject_cast<Mavrosk::InfiniteListModel *>(model))
        return QStringLiteral("%1 has rows only, no \"length\"").arg(name);
    return QString();
}

} // namespace

QList<ScenarioStep> ScenarioReader::read(const QByteArray &text)
{
    QList<ScenarioStep> steps;
    QByteArray data = text;
    if (data.startsWith("\xEF\xBB\xBF"))
        data.remove(0, 3);
    const QList<QByteArray> lines = data.split('\n');
    // A final newline ends the last line; it does not start another.
    const int count = lines.size() - (data.endsWith('\n') ? 1 : 0);
    for (int i = 0; i < count; ++i)
        steps.append(ScenarioStep::parse(lines.at(i), i + 1));
    return steps;
}

QString ScenarioReader::check(const ScenarioStep &step, const QObject *controller)
{
    if (step.kind == ScenarioStep::Invalid)
        return step.error;
    auto *writable = const_cast<QObject *>(controller);
    switch (step.kind) {
    case ScenarioStep::Set:
        return checkSet(step, writable);
    case ScenarioStep::Emit:
        return checkEmit(step);
    case ScenarioStep::Call:
    case ScenarioStep::Answer:
        return checkCall(step, controller);
    case ScenarioStep::Model:
        return checkModel(step);
    case ScenarioStep::Expect:
    case ScenarioStep::ExpectNot:
        return ExpectationJudge::checkNames(
                step.value(step.kind == ScenarioStep::Expect ? "expect" : "expect-not").toObject(),
                writable);
    default:
        return QString();
    }
}

QList<ScenarioError> ScenarioReader::errors(const QList<ScenarioStep> &steps,
                                            const QObject *controller)
{
    QList<ScenarioError> found;
    for (const ScenarioStep &step : steps) {
        const QString error = check(step, controller);
        if (!error.isEmpty())
            found.append({step.line, error});
    }
    return found;
}

NamedValue ScenarioReader::resolve(const QString &name, QObject *controller)
{
    NamedValue named;
    const QString prefix = name.section(QLatin1Char('.'), 0, 0);
    const QByteArray member = name.section(QLatin1Char('.'), 1).toLatin1();
    if (prefix == QLatin1String("host")) {
        if (member == "displayContext")
            named.object = Brisken::DataStore::get(QStringLiteral("ViewManager"));
        else if (member == "statusBarVisible")
            named.object = Brisken::DataStore::get(QStringLiteral("StatusBarController"));
    } else if (prefix == ControllerPrefix) {
        named.object = controller;
    } else {
        named.object = sourceNamed(prefix);
    }
    if (!named.object) {
        named.error = QStringLiteral("unknown value %1").arg(name);
        return named;
    }
    const QMetaObject *meta = named.object->metaObject();
    const int index = meta->indexOfProperty(member.constData());
    if (index < firstOwnProperty(named.object)) {
        named.error
                = QStringLiteral("%1 has no property %2").arg(prefix, QString::fromLatin1(member));
        return named;
    }
    named.property = meta->property(index);
    return named;
}

QVariant ScenarioReader::exactValue(const QJsonValue &value, int type, QString *error)
{
    switch (type) {
    case QMetaType::Int:
        if (value.isDouble()) {
            const double number = value.toDouble();
            if (std::trunc(number) == number && number >= INT_MIN && number <= INT_MAX)
                return QVariant(int(number));
        }
        break;
    case QMetaType::Bool:
        if (value.isBool())
            return QVariant(value.toBool());
        break;
    case QMetaType::QString:
        if (value.isString())
            return QVariant(value.toString());
        break;
    case QMetaType::QVariantList:
        if (value.isArray())
            return QVariant(value.toArray().toVariantList());
        break;
    case QMetaType::QStringList:
        if (value.isArray()) {
            QStringList strings;
            for (const QJsonValue &item : value.toArray()) {
                if (!item.isString())
                    break;
                strings.append(item.toString());
            }
            if (strings.size() == value.toArray().size())
                return QVariant(strings);
        }
        break;
    case QMetaType::QVariant:
        return value.toVariant();
    default:
        *error = QStringLiteral("values of type %1 cannot be written")
                         .arg(QString::fromLatin1(QMetaType::typeName(type)));
        return QVariant();
    }
    *error = QStringLiteral("must be %1").arg(typeName(type));
    return QVariant();
}

} // namespace Simulator
