#include "metainvoke.h"

#include <QMetaObject>
#include <QObject>

#include <array>

namespace Simulator {

namespace {

constexpr int MaximumArguments = 10;

bool matchesType(const QMetaMethod &method, QMetaMethod::MethodType type)
{
    if (type == QMetaMethod::Signal)
        return method.methodType() == QMetaMethod::Signal;
    return (method.methodType() == QMetaMethod::Slot || method.methodType() == QMetaMethod::Method)
            && method.access() == QMetaMethod::Public;
}

// Converts the arguments to the method's parameter types; false when one does not convert.
bool convertArguments(const QMetaMethod &method, const QVariantList &args,
                      std::array<QVariant, MaximumArguments> *converted)
{
    for (int i = 0; i < args.size(); ++i) {
        const int type = method.parameterType(i);
        QVariant value = args.at(i);
        if (type != QMetaType::QVariant && (type == QMetaType::UnknownType || !value.convert(type)))
            return false;
        (*converted)[i] = value;
    }
    return true;
}

} // namespace

bool invokeByName(QObject *object, const QString &name, const QVariantList &args,
                  QMetaMethod::MethodType type, QString *error, QVariant *result)
{
    const QString what
            = type == QMetaMethod::Signal ? QStringLiteral("signal") : QStringLiteral("slot");
    if (!object) {
        *error = QStringLiteral("no object to call %1 on").arg(name);
        return false;
    }
    if (args.size() > MaximumArguments) {
        *error = QStringLiteral("too many arguments for %1").arg(name);
        return false;
    }
    const QMetaObject *metaObject = object->metaObject();
    const QByteArray methodName = name.toLatin1();
    bool nameFound = false;
    // The last-declared overload whose parameters the arguments convert to.
    for (int index = metaObject->methodCount() - 1; index >= 0; --index) {
        const QMetaMethod method = metaObject->method(index);
        if (method.name() != methodName || !matchesType(method, type))
            continue;
        nameFound = true;
        if (method.parameterCount() != args.size())
            continue;
        std::array<QVariant, MaximumArguments> converted;
        if (!convertArguments(method, args, &converted))
            continue;

        std::array<QGenericArgument, MaximumArguments> arguments;
        for (int i = 0; i < args.size(); ++i) {
            const bool isVariant = method.parameterType(i) == QMetaType::QVariant;
            arguments[i] = QGenericArgument(isVariant ? "QVariant" : converted[i].typeName(),
                                            isVariant ? static_cast<const void *>(&converted[i])
                                                      : converted[i].constData());
        }
        QVariant returned;
        QGenericReturnArgument returnArgument;
        const int returnType = method.returnType();
        if (result && returnType != QMetaType::Void && returnType != QMetaType::UnknownType) {
            returned = QVariant(returnType, nullptr);
            returnArgument = QGenericReturnArgument(method.typeName(), returned.data());
        }
        const bool invoked = method.invoke(object, Qt::DirectConnection, returnArgument,
                                           arguments[0], arguments[1], arguments[2], arguments[3],
                                           arguments[4], arguments[5], arguments[6], arguments[7],
                                           arguments[8], arguments[9]);
        if (!invoked) {
            *error = QStringLiteral("%1 %2 could not be called").arg(what, name);
            return false;
        }
        if (result)
            *result = returned;
        return true;
    }
    *error = nameFound ? QStringLiteral("%1 %2 takes no %3 argument(s) of these types")
                                 .arg(what, name)
                                 .arg(args.size())
                       : QStringLiteral("%1 has no %2 %3")
                                 .arg(QString::fromLatin1(metaObject->className()), what, name);
    return false;
}

} // namespace Simulator
