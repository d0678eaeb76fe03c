#include "scenariorunner.h"

#include "expectationjudge.h"
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
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmiintentmanager.h>

#include <QEventLoop>
#include <QJsonArray>
#include <QJsonDocument>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQmlExpression>
#include <QTimer>

#include <limits>

namespace Simulator {

namespace {

const QString ControllerProperty = QStringLiteral("_hmiphoneController");
const QString StatusBarSetting = QStringLiteral("host.statusBar");

// Steps that touch neither the module nor the machine: the host's choices before set-up may
// still follow them.
bool leavesModuleAlone(const ScenarioStep &step)
{
    switch (step.kind) {
    case ScenarioStep::Comment:
    case ScenarioStep::Model:
    case ScenarioStep::Advance:
        return true;
    case ScenarioStep::Set:
        return !step.name().startsWith(QLatin1String("controller."));
    default:
        return false;
    }
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

QList<ScenarioError> ScenarioRunner::prepare(const QList<ScenarioStep> &steps)
{
    QList<ScenarioError> errors;
    bool beforeModule = true;
    for (const ScenarioStep &step : steps) {
        if (step.kind == ScenarioStep::Start)
            m_startDeferred = true;
        if (step.kind == ScenarioStep::Set && step.name() == StatusBarSetting) {
            if (beforeModule && step.value("value").isBool())
                m_withoutStatusBar = !step.value("value").toBool();
            else if (!beforeModule)
                errors.append({step.line,
                               QStringLiteral("host.statusBar is chosen before the module runs")});
        }
        beforeModule = beforeModule && leavesModuleAlone(step);
    }
    if (!ensureSetUp())
        return errors;
    errors.append(ScenarioReader::errors(steps, controller()));
    std::sort(errors.begin(), errors.end(),
              [](const ScenarioError &a, const ScenarioError &b) { return a.line < b.line; });
    return errors;
}

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
    // Held here: QML may delete it, and the context property would then point at nothing.
    if (m_engine)
        m_controller
                = m_engine->rootContext()->contextProperty(ControllerProperty).value<QObject *>();
    emit moduleSetUp();
    return true;
}

QObject *ScenarioRunner::controller() const
{
    return m_controller;
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

void ScenarioRunner::play(const ScenarioStep &step)
{
    switch (step.kind) {
    case ScenarioStep::Comment:
        if (!step.text.isEmpty())
            m_output->note(step.text);
        return;
    case ScenarioStep::Invalid:
        ++m_stepErrors;
        report(step.line, step.error);
        return;
    case ScenarioStep::Expect:
    case ScenarioStep::ExpectNot: {
        if (!m_started && !m_startDeferred)
            start();
        const ExpectationJudge::Verdict verdict
                = ExpectationJudge::judge(step, m_output->outputsOfLastInput(), controller());
        m_checks += verdict.checks;
        m_failures += verdict.failures.size();
        for (const QString &failure : verdict.failures)
            report(step.line, failure);
        emit stepPlayed(step);
        return;
    }
    default:
        break;
    }

    const bool holdsStart = step.kind == ScenarioStep::Start && !step.value("start").toBool();
    if (holdsStart && !m_started) {
        m_startDeferred = true;
        return;
    }
    const bool beforeStart = !m_started && (m_startDeferred || step.kind == ScenarioStep::Start);
    if (!beforeStart)
        start();
    m_output->echoStep(step.line, step.text);
    m_output->beginInput();
    if (step.kind == ScenarioStep::Start) {
        start();
    } else {
        const QString error = apply(step);
        if (!error.isEmpty()) {
            ++m_stepErrors;
            report(step.line, error);
        }
        m_clock->runUntilIdle();
    }
    emit stepPlayed(step);
}

QString ScenarioRunner::writeValue(const QString &name, const QJsonValue &json)
{
    if (name == StatusBarSetting)
        return m_setUp && json.toBool() == m_withoutStatusBar
                ? QStringLiteral("host.statusBar is chosen before the module runs")
                : QString();
    if (name == QLatin1String("host.displayContext")) {
        if (auto *viewManager
            = Brisken::DataStore::get<Brisken::ViewManager>(QStringLiteral("ViewManager")))
            viewManager->setDisplayContext(json.toInt());
        return QString();
    }
    if (name == QLatin1String("host.statusBarVisible")) {
        if (auto *statusBar = Brisken::DataStore::get<Brisken::StatusBarController>(
                    QStringLiteral("StatusBarController")))
            statusBar->setStatusBarVisible(json.toBool());
        return QString();
    }
    const NamedValue target = ScenarioReader::resolve(name, controller());
    if (!target.isValid())
        return target.error;
    QString error;
    const QVariant value = ScenarioReader::exactValue(json, target.property.userType(), &error);
    if (!error.isEmpty())
        return name + QStringLiteral(": ") + error;
    if (auto *source = qobject_cast<Mavrosk::DataSource *>(target.object)) {
        if (!source->setBridgeValue(QString::fromLatin1(target.property.name()), value))
            return QStringLiteral("%1 cannot be written").arg(name);
    } else if (!target.property.write(target.object, value)) {
        return QStringLiteral("%1 cannot be written").arg(name);
    }
    return QString();
}

QString ScenarioRunner::apply(const ScenarioStep &step)
{
    const QVariantList args = step.value("args").toArray().toVariantList();
    const bool needsModule = step.kind != ScenarioStep::Set && step.kind != ScenarioStep::Model
            && step.kind != ScenarioStep::Advance;
    if (needsModule && !ensureSetUp())
        return m_setUpError;
    QString error;
    switch (step.kind) {
    case ScenarioStep::Set:
        return writeValue(step.name(), step.value("value"));
    case ScenarioStep::Emit: {
        const QString prefix = step.name().section(QLatin1Char('.'), 0, 0);
        QObject *source = nullptr;
        for (Mavrosk::DataSource *candidate : Mavrosk::DataSource::sources()) {
            if (candidate->shortName() == prefix)
                source = candidate;
        }
        invokeByName(source, step.name().section(QLatin1Char('.'), 1), args, QMetaMethod::Signal,
                     &error);
        return error;
    }
    case ScenarioStep::Key:
        Mavrosk::KeySource::instance()->sendKeyEvent(step.value("key").toInt(),
                                                     step.value("kind").toInt());
        return QString();
    case ScenarioStep::Call:
        if (!controller())
            return QStringLiteral("the module exports no %1").arg(ControllerProperty);
        return callAsQml(step.name(), step.value("args").toArray());
    case ScenarioStep::Answer:
        return answer(step);
    case ScenarioStep::Intent: {
        const int action = step.value("intent").toInt();
        m_output->skipNextJournalEntry(QStringLiteral("intent"));
        const bool result = Taldris::HmiIntentManager::instance()->requestAction(action, args);
        m_output->skipNextJournalEntry(QString());
        m_output->write(QStringLiteral("intent-result"),
                        {{QStringLiteral("action"), action}, {QStringLiteral("result"), result}});
        return QString();
    }
    case ScenarioStep::Post:
        Quorvel::StateMachine::instance()->postEvent(
                new Quorvel::HmiEvent(step.name(), step.value("value").toVariant()));
        return QString();
    case ScenarioStep::Open: {
        const QString what = step.name();
        if (what == QLatin1String("phone") || what == QLatin1String("module"))
            m_host->openModule();
        else if (what == QLatin1String("home"))
            m_host->openHome();
        else if (what.startsWith(QLatin1String("settings/")))
            return chooseSettingsEntry(what.section(QLatin1Char('/'), 1));
        else
            m_host->openSettings();
        return QString();
    }
    case ScenarioStep::Back:
        Quorvel::StateMachine::instance()->back(step.value("back").toInt());
        return QString();
    case ScenarioStep::Model: {
        Mavrosk::MultiDPListModel *model = Mavrosk::listModel(step.name());
        if (step.object.contains(QLatin1String("rows")))
            model->setRows(step.value("rows").toArray().toVariantList());
        // The contact list is a kind of row list that also has a length of its own.
        if (step.object.contains(QLatin1String("length")))
            qobject_cast<Mavrosk::InfiniteListModel *>(model)->setListLength(
                    step.value("length").toInt());
        return QString();
    }
    case ScenarioStep::Advance: {
        const qint64 milliseconds = qint64(step.value("advance").toDouble());
        if (!m_waitsInRealTime) {
            m_clock->advance(milliseconds);
            return QString();
        }
        QEventLoop wait;
        QTimer::singleShot(int(qMin<qint64>(milliseconds, std::numeric_limits<int>::max())), &wait,
                           &QEventLoop::quit);
        wait.exec();
        return QString();
    }
    default:
        return QString();
    }
}

QString ScenarioRunner::callAsQml(const QString &slot, const QJsonArray &args)
{
    // A view's call, made by the engine the module exported its controller to: the controller
    // found by its context name, the overload and the argument conversions QML's own.
    const QString name
            = QString::fromUtf8(QJsonDocument(QJsonArray{slot}).toJson(QJsonDocument::Compact));
    QQmlExpression call(
            m_engine->rootContext(), nullptr,
            QStringLiteral("%1[%2].apply(%1, %3)")
                    .arg(ControllerProperty, name.mid(1, name.size() - 2),
                         QString::fromUtf8(QJsonDocument(args).toJson(QJsonDocument::Compact))));
    call.evaluate();
    return call.hasError() ? QStringLiteral("%1: %2").arg(slot, call.error().description())
                           : QString();
}

// The driver taps a button of an open popup (on top or covered): the answer is traced, the
// button's controller call made, and once its events have been handled the framework closes the
// popup if the module leaves that to it.
QString ScenarioRunner::answer(const ScenarioStep &step)
{
    const QString wanted = step.name();
    QString id;
    for (const QString &open : Brisken::ViewController::instance()->openPopups()) {
        if (open == wanted || open.endsWith(QLatin1Char('.') + wanted))
            id = open;
    }
    if (id.isEmpty())
        return QStringLiteral("popup %1 is not open: nobody can answer it").arg(wanted);
    QVariantMap fields{{QStringLiteral("id"), id}};
    const QString call = step.value("call").toString();
    if (!call.isEmpty()) {
        fields.insert(QStringLiteral("call"), call);
        fields.insert(QStringLiteral("args"), step.value("args").toArray().toVariantList());
    }
    m_output->write(QStringLiteral("answer"), fields);
    if (!call.isEmpty()) {
        if (!controller())
            return QStringLiteral("the module exports no %1").arg(ControllerProperty);
        const QString error = callAsQml(call, step.value("args").toArray());
        if (!error.isEmpty())
            return error;
    }
    Brisken::ViewController::instance()->popupAnswered(id);
    return QString();
}

QString ScenarioRunner::chooseSettingsEntry(const QString &entry)
{
    // The driver opens the settings menu (unless it is on screen) and taps the entry.
    if (Brisken::ViewController::instance()->activeView() != m_host->settingsMenu()->targetView()) {
        m_host->openSettings();
        m_clock->runUntilIdle();
    }
    if (!m_host->chooseSettingsEntry(entry))
        return QStringLiteral("the settings menu has no entry %1").arg(entry);
    return QString();
}

void ScenarioRunner::report(int line, const QString &message)
{
    if (!m_failedLines.contains(line))
        m_failedLines.append(line);
    m_output->write(QStringLiteral("check"),
                    {{QStringLiteral("line"), line}, {QStringLiteral("msg"), message}});
}

} // namespace Simulator
