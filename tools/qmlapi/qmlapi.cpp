// hmiphone-qmlapi: the reference of the phone's QML interface, written from the code, so that it
// cannot drift from it. It loads the plug-in as the host does, reads the meta-objects of the
// objects the views are given and of the bridge behind them, the states the module built for
// its views and popups, and the tables of view and transient names and of the car's keys.
//
//   hmiphone-qmlapi                  writes the reference to standard output
//   hmiphone-qmlapi --output FILE    writes it to FILE
//   hmiphone-qmlapi --check FILE     exits 1 when FILE is not what it would write

#include "carkeys.h"

#include <brisken/viewmanager.h>
#include <hmiphoneviews.h>
#include <host/modulehost.h>
#include <mavrosk/bridge.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QFile>
#include <QLoggingCategory>
#include <QMetaMethod>
#include <QMetaProperty>
#include <QQmlContext>
#include <QQmlEngine>
#include <QSet>
#include <QTextStream>

#include <cstdio>

namespace {

const QString ModuleName = QStringLiteral("PHONE");

QString code(const QString &text)
{
    return QLatin1Char('`') + text + QLatin1Char('`');
}

QString typeName(const char *name)
{
    return QString::fromLatin1(name).replace(QLatin1String("Mavrosk::"), QString());
}

// The methods a view can call (public slots and invokables) or connect to (signals), from the
// class itself down to the first class that is not the bridge's or the module's.
QStringList methods(const QMetaObject *meta, QMetaMethod::MethodType type)
{
    QStringList rows;
    for (int i = QObject::staticMetaObject.methodCount(); i < meta->methodCount(); ++i) {
        const QMetaMethod method = meta->method(i);
        if (method.access() != QMetaMethod::Public || method.methodType() != type)
            continue;
        QStringList parameters;
        const QList<QByteArray> names = method.parameterNames();
        const QList<QByteArray> types = method.parameterTypes();
        for (int p = 0; p < types.size(); ++p)
            parameters.append(
                    (typeName(types.at(p)) + QLatin1Char(' ') + QString::fromLatin1(names.at(p)))
                            .trimmed());
        const QString returned = typeName(method.typeName());
        rows.append(QStringLiteral("- %1").arg(
                code((returned == QLatin1String("void") ? QString() : returned + QLatin1Char(' '))
                     + QString::fromLatin1(method.name()) + QLatin1Char('(')
                     + parameters.join(QStringLiteral(", ")) + QLatin1Char(')'))));
    }
    return rows;
}

QStringList properties(const QObject *object)
{
    const QMetaObject *meta = object->metaObject();
    QStringList rows{QStringLiteral("| Property | Type | Access | Changes with |"),
                     QStringLiteral("|---|---|---|---|")};
    for (int i = QObject::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i) {
        const QMetaProperty property = meta->property(i);
        const QString access = property.isConstant() ? QStringLiteral("constant")
                : property.isWritable()              ? QStringLiteral("read, write")
                                                     : QStringLiteral("read");
        rows.append(QStringLiteral("| %1 | %2 | %3 | %4 |")
                            .arg(code(QString::fromLatin1(property.name())),
                                 code(typeName(property.typeName())), access,
                                 property.hasNotifySignal() ? code(QString::fromLatin1(
                                         property.notifySignal().methodSignature()))
                                                            : QString()));
    }
    return rows;
}

QStringList section(const QString &title, const QStringList &rows)
{
    if (rows.isEmpty())
        return {};
    return QStringList{QString(), title, QString()} + rows;
}

QStringList describe(const QString &heading, const QObject *object, const QString &about)
{
    const QMetaObject *meta = object->metaObject();
    QStringList text{QString(), heading, QString(), about};
    text += section(QStringLiteral("Properties:"), properties(object));
    text += section(QStringLiteral("Signals:"), methods(meta, QMetaMethod::Signal));
    text += section(QStringLiteral("Slots a view calls:"),
                    methods(meta, QMetaMethod::Slot) + methods(meta, QMetaMethod::Method));
    return text;
}

// The bridge's list models of one source, with their roles.
QStringList models(const Mavrosk::DataSource *source)
{
    QStringList rows;
    for (const auto &model : Mavrosk::listModels()) {
        if (!model.first.startsWith(source->shortName() + QLatin1Char('.')))
            continue;
        QStringList roles;
        const QHash<int, QByteArray> names = model.second->roleNames();
        QList<int> keys = names.keys();
        std::sort(keys.begin(), keys.end());
        for (int key : qAsConst(keys))
            roles.append(code(QString::fromUtf8(names.value(key))));
        rows.append(
                QStringLiteral("- %1 (%2): %3")
                        .arg(code(model.first.section(QLatin1Char('.'), 1) + QStringLiteral("()")),
                             typeName(model.second->metaObject()->className()),
                             roles.join(QStringLiteral(", "))));
    }
    return rows;
}

QStringList reference(QQmlEngine *engine)
{
    QStringList text{
            QStringLiteral("# The phone's QML interface"), QString(),
            QStringLiteral(
                    "What the phone's views can bind to and call, written by `hmiphone-qmlapi` "
                    "from the code (do not edit: `cmake --build build --target qml-api` "
                    "writes it again, and the test `qml_api_up_to_date` fails while it "
                    "differs). The simulator's window draws each view with a QML file of "
                    "`tools/simulator/window/qml/` on exactly this interface."),
            QString(),
            QStringLiteral(
                    "Context properties: `_hmiphoneController` (the controller, below) and "
                    "`_hmiphone` (the module's integration). QML types, uncreatable, under "
                    "`import HmiPhone 1.0`: `HmiPhoneIntegration`, `HmiPhoneController`, "
                    "`PhoneSource`, `EAPhoneSource`, `BluetoothSource`, `ProjectionSource`.")};
    QObject *controller = engine->rootContext()
                                  ->contextProperty(QStringLiteral("_hmiphoneController"))
                                  .value<QObject *>();
    if (!controller)
        return {};
    text += describe(QStringLiteral("## `_hmiphoneController`"), controller,
                     QStringLiteral("Requests of the views become the module's events, intents or "
                                    "commands to the phone; the states decide what is shown."));

    text += QStringList{QString(), QStringLiteral("## The bridge behind the controller"), QString(),
                        QStringLiteral("The sources the controller's properties `phoneSource`, "
                                       "`bluetoothSource` and `eaPhoneSource` give. The phone "
                                       "changes their values; a view reads them and, for a few "
                                       "(such as `replyTextSelected`), writes them. The list "
                                       "models' rows are read by role, in a delegate or with "
                                       "`get(row, role)`.")};
    const char *const sources[] = {"phoneSource", "bluetoothSource", "eaPhoneSource"};
    for (const char *name : sources) {
        const auto *source = qobject_cast<const Mavrosk::DataSource *>(
                controller->property(name).value<QObject *>());
        if (!source)
            continue;
        text += QStringList{QString(),
                            QStringLiteral("### `%1` (%2)")
                                    .arg(QString::fromLatin1(name),
                                         typeName(source->metaObject()->className()))};
        text += section(QStringLiteral("Properties:"), properties(source));
        text += section(QStringLiteral("List models:"), models(source));
        text += section(QStringLiteral("Signals:"),
                        methods(source->metaObject(), QMetaMethod::Signal));
    }

    // Each view of the phone: what shows it (a view state is a screen, a popup state a popup).
    QHash<QString, QString> kinds;
    QObject *machine = Quorvel::StateMachine::instance();
    const auto screens = machine->findChildren<Quorvel::HmiViewState *>();
    for (const Quorvel::HmiViewState *state : screens)
        kinds.insert(state->targetView(), QStringLiteral("screen"));
    const auto popups = machine->findChildren<Quorvel::PopupState *>();
    for (const Quorvel::PopupState *state : popups)
        kinds.insert(state->viewId(), QStringLiteral("popup"));
#define HMIPHONE_VIEW_NAME_STRING(name) QStringLiteral(#name),
    const QStringList viewNames{HMIPHONE_VIEW_NAMES(HMIPHONE_VIEW_NAME_STRING)
                                        QStringLiteral("PhoneStatusAlerts")};
    const QStringList transients{HMIPHONE_TRANSIENT_NAMES(HMIPHONE_VIEW_NAME_STRING)};
#undef HMIPHONE_VIEW_NAME_STRING
    text += QStringList{QString(),
                        QStringLiteral("## Views"),
                        QString(),
                        QStringLiteral("Every view identifier of the phone, in the module's order, "
                                       "and what the module shows it as: a screen (a view state "
                                       "enters it), a popup (a popup state opens it), or a name "
                                       "that no state shows."),
                        QString(),
                        QStringLiteral("| View identifier | Shown as |"),
                        QStringLiteral("|---|---|")};
    for (const QString &name : viewNames) {
        const QString id = Brisken::ViewManager::viewIdentifier(ModuleName, name);
        text.append(QStringLiteral("| %1 | %2 |")
                            .arg(code(id), kinds.value(id, QStringLiteral("no state"))));
    }
    text += QStringList{QString(), QStringLiteral("## Status-bar transient messages"), QString(),
                        QStringLiteral("Names the status bar is given (not view identifiers):"),
                        QString()};
    for (const QString &name : transients)
        text.append(QStringLiteral("- ") + code(name));

    text += QStringList{QString(),
                        QStringLiteral("## Keys"),
                        QString(),
                        QStringLiteral("The car's keys, as the key source's `keyEvent(key, kind)` "
                                       "sends them:"),
                        QString(),
                        QStringLiteral("| Key | Meaning |"),
                        QStringLiteral("|---:|---|")};
    for (const Simulator::CarKey &key : Simulator::CarKeys)
        text.append(QStringLiteral("| %1 | %2 |").arg(key.code).arg(QLatin1String(key.meaning)));
    QStringList keyKinds;
    for (const char *name : Simulator::KeyKinds)
        keyKinds.append(QStringLiteral("%1 %2").arg(keyKinds.size() + 1).arg(QLatin1String(name)));
    text += QStringList{QString(),
                        QStringLiteral("Kinds: ") + keyKinds.join(QStringLiteral(", "))
                                + QLatin1Char('.')};
    return text;
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    // The reference alone on the output: not the module's own lines.
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false\n*.info=false"));
    QCommandLineParser parser;
    parser.setApplicationDescription(
            QStringLiteral("Writes the reference of the phone's QML interface (docs/qml-api.md)."));
    parser.addHelpOption();
    const QCommandLineOption outputOption(QStringLiteral("output"),
                                          QStringLiteral("Write the reference to this file."),
                                          QStringLiteral("file"));
    const QCommandLineOption checkOption(
            QStringLiteral("check"),
            QStringLiteral("Exit 1 when this file is not the reference written now."),
            QStringLiteral("file"));
    parser.addOptions({outputOption, checkOption});
    parser.process(app);

    Mavrosk::createAll();
    Host::ModuleHost host;
    QQmlEngine engine;
    if (!host.load(QStringLiteral(HMIPHONE_PLUGIN_FILE))
        || !host.setUp(QStringLiteral("HmiPhone"), &engine)) {
        std::fprintf(stderr, "hmiphone-qmlapi: %s\n", qPrintable(host.errorString()));
        return 2;
    }
    const QByteArray written = reference(&engine).join(QLatin1Char('\n')).toUtf8() + '\n';

    if (parser.isSet(checkOption)) {
        QFile file(parser.value(checkOption));
        if (file.open(QIODevice::ReadOnly) && file.readAll() == written)
            return 0;
        std::fprintf(stderr,
                     "hmiphone-qmlapi: %s is not the reference of the code today: "
                     "cmake --build build --target qml-api writes it again\n",
                     qPrintable(parser.value(checkOption)));
        return 1;
    }
    QFile file;
    const bool opened = parser.isSet(outputOption)
            ? (file.setFileName(parser.value(outputOption)), file.open(QIODevice::WriteOnly))
            : file.open(stdout, QIODevice::WriteOnly);
    if (!opened || file.write(written) != written.size()) {
        std::fprintf(stderr, "hmiphone-qmlapi: cannot write %s\n",
                     qPrintable(parser.value(outputOption)));
        return 2;
    }
    return 0;
}
