#include "modulehost.h"

#include <brisken/modulecontroller.h>
#include <brisken/viewcontroller.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmimoduleintegration.h>
#include <taldris/moduleinterface.h>

#include <QCoreApplication>
#include <QJsonObject>
#include <QQmlContext>
#include <QQmlEngine>

namespace Host {

void processUntilIdle()
{
    // The machine's own queues are drained by the posted events that wake it: a few rounds let
    // the events that transitions post in turn be handled too.
    for (int round = 0; round < 20; ++round) {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents(QEventLoop::AllEvents);
    }
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
    m_loader.setFileName(pluginFile);
    const QString iid = m_loader.metaData().value(QLatin1String("IID")).toString();
    if (iid != QLatin1String(Taldris_ModuleInterface_iid)) {
        m_error = m_loader.errorString().isEmpty() || iid.isEmpty()
                ? QStringLiteral("%1 is not a module plug-in (interface \"%2\")")
                          .arg(pluginFile, iid)
                : m_loader.errorString();
        return false;
    }
    QObject *instance = m_loader.instance();
    m_module = qobject_cast<Taldris::ModuleInterface *>(instance);
    if (!m_module) {
        m_error = instance
                ? QStringLiteral("%1 does not implement the module interface").arg(pluginFile)
                : m_loader.errorString();
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
    m_settings = new Quorvel::HmiState(QStringLiteral("HOST.Settings"), screens);
    screens->setInitialHmiState(m_home);

    m_moduleRoot = m_integration->createScreenStateSubTree(m_moduleParent);
    machine->installRootHierarchy(m_integration->moduleRootHierarchyTransitions(),
                                  m_integration->moduleRootHierarchyPopupStates());
    return true;
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

} // namespace Host
