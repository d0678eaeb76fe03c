#include "scenariorunner.h"

#include "metainvoke.h"
#include "outputwriter.h"
#include "virtualeventdispatcher.h"

#include <brisken/datastore.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewcontroller.h>
#include <brisken/viewmanager.h>
#include <host/modulehost.h>
#include <mavrosk/bridge.h>
#include <mavrosk/infinitelistmodel.h>
#include <mavrosk/multidplistmodel.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmistate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmimoduleintegration.h>

#include <QAbstractState>
#include <QJsonArray>
#include <QJsonDocument>
#include <QMetaProperty>
#include <QQmlContext>
#include <QQmlEngine>

namespace Simulator {

namespace {

const QString ControllerProperty = QStringLiteral("_hmiphoneController");

QString compact(const QJsonObject &object)
{
    return QString::fromUtf8(QJsonDocument(object).toJson(QJsonDocument::Compact));
}

QString compact(const QJsonValue &value)
{
    const QString wrapped
            = QString::fromUtf8(QJsonDocument(QJsonArray{value}).toJson(QJsonDocument::Compact));
    return wrapped.mid(1, wrapped.size() - 2);
}

// An identifier written in a scenario matches the platform's full one ("IncomingCall" matches
// "PHONE.IncomingCall", "acceptIncomingCall" matches "phone.acceptIncomingCall").
bool namesMatch(const QString &actual, const QString &expected)
{
    return !expected.isEmpty()
            && (actual == expected || actual.endsWith(QLatin1Char('.') + expected));
}

bool valuesMatch(const QJsonValue &actual, const QJsonValue &expected)
{
    if (actual.isString() && expected.isString())
        return namesMatch(actual.toString(), expected.toString());
    return actual == expected;
}

// "popup"/"nopopup": open, on top or covered; "top": shown on top of its region.
QStringList popupsFor(const QString &key)
{
    Brisken::ViewController *views = Brisken::ViewController::instance();
    return key == QLatin1String("top") ? views->shownPopups() : views->openPopups();
}

} // namespace

ScenarioRunner::ScenarioRunner(Host::ModuleHost *host, QQmlEngine *engine,
                               const QString &moduleName, OutputWriter *output,
                               VirtualEventDispatcher *clock, QObject *parent)
    : QObject(parent)
    , m_host(host)
    , m_engine(engine)
    , m_moduleName(moduleName)
    , m_output(output)
    , m_clock(clock)
{ }

ScenarioRunner::~ScenarioRunner() = default;

bool ScenarioRunner::ensureSetUp()
{
    if (m_setUp)
        return m_setUpError.isEmpty();
    m_setUp = true;
    if (m_withoutStatusBar)
        Brisken::DataStore::remove(QStringLiteral("StatusBarController"));
    if (!m_host->setUp(m_moduleName, m_engine)) {
        m_setUpError = m_host->errorString();
        return false;
    }
    emit moduleSetUp();
    return true;
}

void ScenarioRunner::start()
{
    if (m_started || !ensureSetUp())
        return;
    m_started = true;
    m_host->start();
    m_clock->runUntilIdle();
}

void ScenarioRunner::finish()
{
    start();
}

void ScenarioRunner::playLine(const QString &text, int line)
{
    ScenarioStep step;
    if (!ScenarioStep::parse(text, line, &step)) {
        if (text.trimmed().startsWith(QLatin1Char('#')))
            m_output->note(text.trimmed());
        return;
    }
    play(step);
}

void ScenarioRunner::play(const ScenarioStep &step)
{
    if (step.kind == ScenarioStep::Invalid) {
        ++m_checks;
        fail(step.line, step.error);
        return;
    }
    if (step.kind == ScenarioStep::Expect || step.kind == ScenarioStep::ExpectNot) {
        if (!m_started && !m_startDeferred)
            start();
        check(step, step.kind == ScenarioStep::ExpectNot);
        return;
    }

    const bool holdsStart = step.kind == ScenarioStep::Start
            && !step.object.value(QLatin1String("start")).toBool(true);
    if (holdsStart && !m_started) {
        m_startDeferred = true;
        return;
    }
    const bool beforeStart = !m_started && (m_startDeferred || step.kind == ScenarioStep::Start);
    if (!beforeStart)
        start();
    m_output->note(QStringLiteral("%1  > %2")
                           .arg(QString::number(double(m_clock->now()) / 1000.0, 'f', 3), 9)
                           .arg(step.text));
    m_output->beginInput();
    if (step.kind == ScenarioStep::Start) {
        start();
        return;
    }
    apply(step);
    m_clock->runUntilIdle();
}

QObject *ScenarioRunner::objectFor(const QString &prefix) const
{
    if (prefix == QLatin1String("host.viewManager"))
        return Brisken::DataStore::get(QStringLiteral("ViewManager"));
    if (prefix == QLatin1String("controller")) {
        if (!m_engine)
            return nullptr;
        return m_engine->rootContext()->contextProperty(ControllerProperty).value<QObject *>();
    }
    for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources()) {
        if (source->shortName() == prefix)
            return source;
    }
    return nullptr;
}

bool ScenarioRunner::writeValue(const QString &name, const QVariant &value, QString *error)
{
    const QString prefix = name.section(QLatin1Char('.'), 0, 0);
    const QString member = name.section(QLatin1Char('.'), 1);
    if (prefix == QLatin1String("host")) {
        if (member == QLatin1String("displayContext")) {
            auto *viewManager
                    = Brisken::DataStore::get<Brisken::ViewManager>(QStringLiteral("ViewManager"));
            if (viewManager)
                viewManager->setDisplayContext(value.toInt());
            return true;
        }
        if (member == QLatin1String("statusBarVisible")) {
            auto *statusBar = Brisken::DataStore::get<Brisken::StatusBarController>(
                    QStringLiteral("StatusBarController"));
            if (statusBar)
                statusBar->setStatusBarVisible(value.toBool());
            return true;
        }
        if (member == QLatin1String("statusBar")) {
            if (m_setUp) {
                *error = QStringLiteral("host.statusBar is chosen before the module is set up");
                return false;
            }
            m_withoutStatusBar = !value.toBool();
            return true;
        }
        *error = QStringLiteral("unknown host setting %1").arg(member);
        return false;
    }
    if (prefix == QLatin1String("controller")) {
        if (!ensureSetUp()) {
            *error = m_setUpError;
            return false;
        }
        QObject *controller = objectFor(prefix);
        if (!controller || !controller->setProperty(member.toLatin1().constData(), value)) {
            *error = QStringLiteral("the controller has no writable property %1").arg(member);
            return false;
        }
        return true;
    }
    auto *source = qobject_cast<Mavrosk::DataSource *>(objectFor(prefix));
    if (!source) {
        *error = QStringLiteral("unknown source %1").arg(prefix);
        return false;
    }
    if (!source->setBridgeValue(member, value)) {
        *error = QStringLiteral("%1 has no property %2 taking %3")
                         .arg(prefix, member, value.toString());
        return false;
    }
    return true;
}

bool ScenarioRunner::readValue(const QString &name, QVariant *value, QString *error) const
{
    const QString prefix = name.section(QLatin1Char('.'), 0, 0);
    const QString member = name.section(QLatin1Char('.'), 1);
    QObject *object = nullptr;
    if (prefix == QLatin1String("host")) {
        if (member == QLatin1String("displayContext")) {
            object = Brisken::DataStore::get(QStringLiteral("ViewManager"));
        } else if (member == QLatin1String("statusBarVisible")) {
            object = Brisken::DataStore::get(QStringLiteral("StatusBarController"));
            if (!object) {
                *error = QStringLiteral("the host runs without a status bar");
                return false;
            }
        } else if (member == QLatin1String("transients")) {
            auto *statusBar = Brisken::DataStore::get<Brisken::StatusBarController>(
                    QStringLiteral("StatusBarController"));
            *value = statusBar ? statusBar->transientWidgets() : QStringList();
            return true;
        }
    } else {
        object = objectFor(prefix);
    }
    if (!object) {
        *error = QStringLiteral("unknown value %1").arg(name);
        return false;
    }
    const int index = object->metaObject()->indexOfProperty(member.toLatin1().constData());
    if (index < 0) {
        *error = QStringLiteral("%1 has no property %2").arg(prefix, member);
        return false;
    }
    *value = object->metaObject()->property(index).read(object);
    return true;
}

void ScenarioRunner::apply(const ScenarioStep &step)
{
    const QJsonObject &o = step.object;
    const QVariantList args = o.value(QLatin1String("args")).toArray().toVariantList();
    QString error;
    const bool needsModule = step.kind != ScenarioStep::Set && step.kind != ScenarioStep::Model
            && step.kind != ScenarioStep::Advance;
    if (needsModule && !ensureSetUp()) {
        fail(step.line, m_setUpError);
        return;
    }
    switch (step.kind) {
    case ScenarioStep::Set:
        if (!writeValue(o.value(QLatin1String("set")).toString(),
                        o.value(QLatin1String("value")).toVariant(), &error))
            fail(step.line, error);
        break;
    case ScenarioStep::Emit: {
        const QString name = o.value(QLatin1String("emit")).toString();
        QObject *source = objectFor(name.section(QLatin1Char('.'), 0, 0));
        if (!source)
            error = QStringLiteral("unknown source %1").arg(name.section(QLatin1Char('.'), 0, 0));
        if (!source
            || !invokeByName(source, name.section(QLatin1Char('.'), 1), args, QMetaMethod::Signal,
                             &error))
            fail(step.line, error);
        break;
    }
    case ScenarioStep::Key:
        Mavrosk::KeySource::instance()->sendKeyEvent(o.value(QLatin1String("key")).toInt(),
                                                     o.value(QLatin1String("kind")).toInt());
        break;
    case ScenarioStep::Call: {
        QObject *controller = objectFor(QStringLiteral("controller"));
        if (!controller)
            error = QStringLiteral("the module exports no %1").arg(ControllerProperty);
        if (!controller
            || !invokeByName(controller, o.value(QLatin1String("call")).toString(), args,
                             QMetaMethod::Slot, &error))
            fail(step.line, error);
        break;
    }
    case ScenarioStep::Intent: {
        const int action = o.value(QLatin1String("intent")).toInt();
        m_output->skipNextJournalEntry(QStringLiteral("intent"));
        const bool result = Taldris::HmiIntentManager::instance()->requestAction(action, args);
        m_output->skipNextJournalEntry(QString());
        m_output->write(QStringLiteral("intent-result"),
                        {{QStringLiteral("action"), action}, {QStringLiteral("result"), result}});
        break;
    }
    case ScenarioStep::Post:
        Quorvel::StateMachine::instance()->postEvent(
                new Quorvel::HmiEvent(o.value(QLatin1String("post")).toString(),
                                      o.value(QLatin1String("value")).toVariant()));
        break;
    case ScenarioStep::Open: {
        const QString what = o.value(QLatin1String("open")).toString();
        if (what == QLatin1String("phone") || what == QLatin1String("module"))
            m_host->openModule();
        else if (what == QLatin1String("home"))
            m_host->openHome();
        else if (what == QLatin1String("settings") && m_host->settings())
            Quorvel::StateMachine::instance()->goToState(m_host->settings());
        else
            fail(step.line, QStringLiteral("the menu bar opens phone, home or settings"));
        break;
    }
    case ScenarioStep::Back:
        Quorvel::StateMachine::instance()->back(qMax(1, o.value(QLatin1String("back")).toInt(1)));
        break;
    case ScenarioStep::Model: {
        const QString name = o.value(QLatin1String("model")).toString();
        auto *phone = Mavrosk::PhoneSource::instance();
        QObject *model = nullptr;
        if (name == QLatin1String("phone.AlphabetIndexModel"))
            model = phone->AlphabetIndexModel();
        else if (name == QLatin1String("phone.phoneBook"))
            model = phone->phoneBook();
        if (!model) {
            fail(step.line, QStringLiteral("unknown list model %1").arg(name));
            break;
        }
        const QVariantList rows = o.value(QLatin1String("rows")).toArray().toVariantList();
        // The contact list is a kind of row list that also has a length of its own.
        if (auto *infinite = qobject_cast<Mavrosk::InfiniteListModel *>(model)) {
            if (o.contains(QLatin1String("rows")))
                infinite->setRows(rows);
            if (o.contains(QLatin1String("length")))
                infinite->setListLength(o.value(QLatin1String("length")).toInt());
        } else if (auto *list = qobject_cast<Mavrosk::MultiDPListModel *>(model)) {
            list->setRows(rows);
        }
        break;
    }
    case ScenarioStep::Advance:
        m_clock->advance(qint64(o.value(QLatin1String("advance")).toDouble()));
        break;
    default:
        break;
    }
}

void ScenarioRunner::check(const ScenarioStep &step, bool negated)
{
    const QJsonObject checks
            = step.object.value(QLatin1String(negated ? "expect-not" : "expect")).toObject();
    if (checks.contains(QLatin1String("out"))) {
        ++m_checks;
        const QString message = checkOutput(checks, negated);
        if (!message.isEmpty())
            fail(step.line, message);
        return;
    }
    for (auto it = checks.constBegin(); it != checks.constEnd(); ++it) {
        ++m_checks;
        const QString message = checkOne(it.key(), it.value(), negated);
        if (!message.isEmpty())
            fail(step.line, message);
    }
}

QString ScenarioRunner::checkOne(const QString &key, const QJsonValue &expected, bool negated) const
{
    const QString wanted = expected.toString();
    const QString no = negated ? QStringLiteral("no ") : QString();
    if (key == QLatin1String("view")) {
        const QString active = Brisken::ViewController::instance()->activeView();
        if (namesMatch(active, wanted) != negated)
            return QString();
        return QStringLiteral("expected %1view %2, on screen: %3")
                .arg(no, wanted, active.isEmpty() ? QStringLiteral("none") : active);
    }
    if (key == QLatin1String("popup") || key == QLatin1String("nopopup")
        || key == QLatin1String("top")) {
        const QStringList popups = popupsFor(key);
        bool found = false;
        for (const QString &popup : popups)
            found = found || namesMatch(popup, wanted);
        const bool wanting = (key != QLatin1String("nopopup")) != negated;
        if (found == wanting)
            return QString();
        const bool top = key == QLatin1String("top");
        return QStringLiteral("expected %1%2 %3, %4: %5")
                .arg(wanting ? QString() : QStringLiteral("no "),
                     top ? QStringLiteral("popup on top") : QStringLiteral("open popup"), wanted,
                     top ? QStringLiteral("on top") : QStringLiteral("open"),
                     popups.isEmpty() ? QStringLiteral("none") : popups.join(QStringLiteral(", ")));
    }
    if (key == QLatin1String("state")) {
        QStringList active;
        bool found = false;
        if (auto *machine = Quorvel::StateMachine::existingInstance()) {
            for (QAbstractState *state : machine->findChildren<QAbstractState *>()) {
                if (!state->active())
                    continue;
                if (state->objectName() == wanted)
                    found = true;
                bool activeChild = false;
                for (QAbstractState *child :
                     state->findChildren<QAbstractState *>(QString(), Qt::FindDirectChildrenOnly))
                    activeChild = activeChild || child->active();
                if (!activeChild)
                    active.append(state->objectName());
            }
        }
        if (found != negated)
            return QString();
        return QStringLiteral("expected %1active state %2, active leaves: %3")
                .arg(no, wanted, active.join(QStringLiteral(", ")));
    }
    QVariant value;
    QString error;
    if (!readValue(key, &value, &error))
        return error;
    const QJsonValue actual = QJsonValue::fromVariant(value);
    if ((actual == expected) != negated)
        return QString();
    return QStringLiteral("expected %1 %2%3, is %4")
            .arg(key, negated ? QStringLiteral("not ") : QString(), compact(expected),
                 compact(actual));
}

QString ScenarioRunner::checkOutput(const QJsonObject &expected, bool negated) const
{
    const QString kind = expected.value(QLatin1String("out")).toString();
    QStringList seen;
    bool found = false;
    for (const Output &output : m_output->outputsOfLastInput()) {
        if (output.kind != kind)
            continue;
        seen.append(OutputWriter::details(output));
        bool matches = true;
        for (auto it = expected.constBegin(); it != expected.constEnd() && matches; ++it) {
            if (it.key() == QLatin1String("out"))
                continue;
            matches = valuesMatch(QJsonValue::fromVariant(output.fields.value(it.key())),
                                  it.value());
        }
        found = found || matches;
    }
    if (found != negated)
        return QString();
    QJsonObject fields = expected;
    fields.remove(QLatin1String("out"));
    return QStringLiteral("expected %1%2 output %3 since the last input; %4")
            .arg(negated ? QStringLiteral("no ") : QString(), kind, compact(fields),
                 seen.isEmpty() ? QStringLiteral("there was none of its kind")
                                : QStringLiteral("written: ") + seen.join(QStringLiteral("; ")));
}

void ScenarioRunner::fail(int line, const QString &message)
{
    ++m_failures;
    if (!m_failedLines.contains(line))
        m_failedLines.append(line);
    m_output->write(QStringLiteral("check"),
                    {{QStringLiteral("line"), line}, {QStringLiteral("msg"), message}});
}

} // namespace Simulator
