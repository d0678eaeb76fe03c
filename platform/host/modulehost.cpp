#include "modulehost.h"

#include <brisken/hmiaction.h>
#include <brisken/modulecontroller.h>
#include <brisken/viewcontroller.h>
#include <journal/journal.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmihostedsubmodule.h>
#include <taldris/hmimoduleintegration.h>
#include <taldris/hmisubmoduleprovider.h>
#include <taldris/moduleinterface.h>

#include <QAbstractEventDispatcher>
#include <QCoreApplication>
#include <QFileInfo>
#include <QJsonObject>
#include <QLoggingCategory>
#include <QQmlContext>
#include <QQmlEngine>

namespace Host {

namespace {

Q_LOGGING_CATEGORY(hostLog, "orvane.host")

const QString SettingsView = QStringLiteral("HOST.Settings");
// The settings module as it names itself to the submodule provider, and the submodules it hosts.
const QString SettingsModuleId = QStringLiteral("SETTINGS");
const int PhoneSettingsSubmodule = 3;

} // namespace

bool processUntilIdle(int maxRounds)
{
    // The machine's own queues are drained by the posted events that wake it; events that
    // transitions post in turn wake it again. Idle is when nothing is pending any more.
    QAbstractEventDispatcher *dispatcher = QAbstractEventDispatcher::instance();
    for (int round = 0; round < maxRounds; ++round) {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents(QEventLoop::AllEvents);
        if (!dispatcher || !dispatcher->hasPendingEvents())
            return true;
    }
    qCCritical(hostLog,
               "processUntilIdle: events still pending after %d rounds: something keeps "
               "posting (a loop of transitions or popups?)",
               maxRounds);
    return false;
}

ModuleHost::ModuleHost(QObject *parent)
    : QObject(parent)
{ }

ModuleHost::~ModuleHost()
{
    // The module's states and transitions live in the machine's tree and listen to the module's
    // objects: the tree goes first, then the integration with the objects it owns.
    Quorvel::StateMachine::destroyInstance();
    delete m_integration;
}

bool ModuleHost::load(const QString &pluginFile)
{
    const QFileInfo file(pluginFile);
    if (!file.isFile()) {
        m_error = QStringLiteral("cannot load %1: no such file").arg(pluginFile);
        return false;
    }
    // QPluginLoader looks for a relative name in the library paths, not the working directory:
    // the file found here is the one loaded.
    m_loader.setFileName(file.absoluteFilePath());
    const QString iid = m_loader.metaData().value(QLatin1String("IID")).toString();
    if (iid.isEmpty()) {
        m_error = QStringLiteral("cannot load %1: not a Qt plug-in (%2)")
                          .arg(pluginFile, m_loader.errorString());
        return false;
    }
    if (iid != QLatin1String(Taldris_ModuleInterface_iid)) {
        m_error = QStringLiteral("cannot load %1: a plug-in for \"%2\", not a module plug-in "
                                 "(\"%3\")")
                          .arg(pluginFile, iid, QLatin1String(Taldris_ModuleInterface_iid));
        return false;
    }
    QObject *instance = m_loader.instance();
    m_module = qobject_cast<Taldris::ModuleInterface *>(instance);
    if (!m_module) {
        m_error = instance
                ? QStringLiteral("cannot load %1: it does not implement the module interface")
                          .arg(pluginFile)
                : QStringLiteral("cannot load %1: %2").arg(pluginFile, m_loader.errorString());
        return false;
    }
    return true;
}

void ModuleHost::use(Taldris::ModuleInterface *module)
{
    m_module = module;
}

bool ModuleHost::setUp(const QString &moduleName, QQmlEngine *engine)
{
    if (!m_module) {
        m_error = QStringLiteral("no module loaded");
        return false;
    }
    m_integration = m_module->createModuleIntegration(moduleName, this);
    if (!m_integration) {
        m_error = QStringLiteral("the plug-in has no module named \"%1\"").arg(moduleName);
        return false;
    }
    // The module's controller reaches the GUI framework's view controller through its base.
    for (auto *controller : m_integration->findChildren<Brisken::ModuleController *>())
        controller->setViewController(Brisken::ViewController::instance());

    if (engine) {
        m_integration->registerTypes();
        m_integration->exportObjects(engine->rootContext());
    }

    auto *machine = Quorvel::StateMachine::instance();
    Quorvel::HmiState *screens = machine->screensState();
    m_home = new Quorvel::HmiViewState(QStringLiteral("HOST.Home"), screens);
    m_moduleParent = new Quorvel::HmiState(QStringLiteral("HOST.Module"), screens);
    m_settings = new Quorvel::HmiState(SettingsView, screens);
    // The settings menu comes first: hosted submodules return to it.
    m_settingsMenu = new Quorvel::HmiViewState(SettingsView, QStringLiteral("HOST.SettingsMenu"),
                                               m_settings);
    m_settings->setInitialHmiState(m_settingsMenu);
    screens->setInitialHmiState(m_home);

    m_moduleRoot = m_integration->createScreenStateSubTree(m_moduleParent);
    machine->installRootHierarchy(m_integration->moduleRootHierarchyTransitions(),
                                  m_integration->moduleRootHierarchyPopupStates());
    hostSettingsSubmodule(PhoneSettingsSubmodule);
    return true;
}

void ModuleHost::hostSettingsSubmodule(int id)
{
    auto *provider = Taldris::HmiSubmoduleProvider::instance();
    // Only a submodule offered now: a request kept for later would outlive this host's states.
    Taldris::HmiHostedSubmodule *submodule = provider->hostedSubmodule(id);
    if (!submodule || !provider->requestSubmodule(id, m_settings, SettingsModuleId, 0))
        return;
    Brisken::HmiAction *entry = submodule->subModuleEntryAction();
    if (!entry)
        return;
    m_settingsEntries.append(entry);
    recordSettingsEntry(entry);
    connect(entry, &Brisken::HmiAction::enabledChanged, this,
            [this, entry] { recordSettingsEntry(entry); });
}

void ModuleHost::recordSettingsEntry(const Brisken::HmiAction *entry)
{
    Platform::Journal::instance()->append(QStringLiteral("menu-entry"),
                                          {{QStringLiteral("menu"), SettingsView},
                                           {QStringLiteral("name"), entry->text()},
                                           {QStringLiteral("enabled"), entry->isEnabled()}});
}

QList<Brisken::HmiAction *> ModuleHost::settingsEntries() const
{
    QList<Brisken::HmiAction *> entries;
    for (const QPointer<Brisken::HmiAction> &entry : m_settingsEntries) {
        if (entry)
            entries.append(entry);
    }
    return entries;
}

bool ModuleHost::chooseSettingsEntry(const QString &name)
{
    for (Brisken::HmiAction *entry : settingsEntries()) {
        if (entry->text() == name || entry->name() == name) {
            entry->trigger();
            return true;
        }
    }
    return false;
}

void ModuleHost::start()
{
    Quorvel::StateMachine::instance()->start();
    processUntilIdle();
}

void ModuleHost::openModule()
{
    if (m_moduleRoot)
        Quorvel::StateMachine::instance()->goToState(m_moduleRoot);
}

void ModuleHost::openHome()
{
    if (m_home)
        Quorvel::StateMachine::instance()->goToState(m_home);
}

void ModuleHost::openSettings()
{
    if (m_settings)
        Quorvel::StateMachine::instance()->goToState(m_settings);
}

} // namespace Host
