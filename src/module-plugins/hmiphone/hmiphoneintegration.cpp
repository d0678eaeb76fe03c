#include "hmiphoneintegration.h"

#include "hmiphonecontroller.h"
#include "hmiphoneglobalstatehandler.h"
#include "hmiphoneintenthandler.h"
#include "hmiphonepopupmanager.h"
#include "hmiphonesettingshostedsubmodule.h"
#include "phone_cmp.h"
#include "phonemenustate.h"

#include <brisken/viewmanager.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/eaphonesource.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/projectionsource.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmisubmoduleprovider.h>

#include <QPointer>
#include <QQmlContext>
#include <QtQml>

namespace HmiPhone {

namespace {

const char QmlUri[] = "HmiPhone";

template<typename T> void registerUncreatable(const char *qmlName)
{
    qmlRegisterUncreatableType<T>(QmlUri, 1, 0, qmlName,
                                  QLatin1String(qmlName) + QLatin1String(" is not creatable"));
}

} // namespace

const Taldris::PellumCategory &hmiphone()
{
    static const Taldris::PellumCategory category("orvane.hmiphone", 1);
    return category;
}

HmiPhoneIntegration::HmiPhoneIntegration(QObject *parent)
    : Taldris::HmiModuleIntegration(1, parent)
    , m_controller(new HmiPhoneController(this))
    // Taking the shared instance here creates the popup manager before any phone state exists.
    , m_popupManager(HmiPhonePopupManager::instance())
    , m_globalStateHandler(nullptr)
    , m_intentHandler(new HmiPhoneIntentHandler(m_controller.data(), this))
{
    Taldris::HmiIntentManager::instance()->registerIntentHandler(m_intentHandler);
}

HmiPhoneIntegration::~HmiPhoneIntegration() = default;

QString HmiPhoneIntegration::moduleName() const
{
    return QStringLiteral("Phone");
}

int HmiPhoneIntegration::modulePriority() const
{
    return 30;
}

int HmiPhoneIntegration::moduleDomain() const
{
    return 2;
}

QString HmiPhoneIntegration::viewDescriptorFile() const
{
    return QStringLiteral("plugins/hmiphone/view-descriptor.json");
}

QString HmiPhoneIntegration::rootStateIdentifier() const
{
    return Brisken::ViewManager::viewIdentifier(moduleId(), QStringLiteral("Root"));
}

QUrl HmiPhoneIntegration::iconUrl() const
{
    return QUrl(QStringLiteral("menubar/icon_phone"), QUrl::TolerantMode);
}

Taldris::HmiModuleIntegration::RootHierarchyTransitions
HmiPhoneIntegration::moduleRootHierarchyTransitions() const
{
    if (!m_globalStateHandler)
        return {};
    return m_globalStateHandler->rootHierarchyTransitions();
}

Taldris::HmiModuleIntegration::RootHierarchyPopupStates
HmiPhoneIntegration::moduleRootHierarchyPopupStates() const
{
    if (!m_globalStateHandler)
        return {};
    return m_globalStateHandler->rootHierarchyPopups();
}

void HmiPhoneIntegration::registerTypes()
{
    qCDebug(hmiphone, "Registering the phone's QML types");
    registerUncreatable<HmiPhoneIntegration>("HmiPhoneIntegration");
    registerUncreatable<HmiPhoneController>("HmiPhoneController");
    registerUncreatable<Mavrosk::PhoneSource>("PhoneSource");
    registerUncreatable<Mavrosk::EAPhoneSource>("EAPhoneSource");
    registerUncreatable<Mavrosk::BluetoothSource>("BluetoothSource");
    registerUncreatable<Mavrosk::ProjectionSource>("ProjectionSource");
}

Quorvel::HmiState *HmiPhoneIntegration::createScreenStateSubTree(Quorvel::HmiState *parent)
{
    qCDebug(hmiphone, "Building the phone's screens and global popups");
    if (!m_controller) {
        qCWarning(hmiphone) << "HmiPhoneIntegration: the controller is gone, no phone states built";
        return nullptr;
    }
    const QString rootStateId = rootStateIdentifier();
    auto *rootComponent = new Phone_Cmp(this, m_controller, rootStateId, parent);
    // The phone menu's entry and exit reach the views through the controller.
    connect(rootComponent->phoneIdleState(), &QAbstractState::exited, m_controller,
            &HmiPhoneController::phoneMenuExited);
    connect(rootComponent->phoneIdleState(), &QAbstractState::entered, m_controller,
            &HmiPhoneController::phoneMenuEntered);
    m_globalStateHandler = new HmiPhoneGlobalStateHandler(m_controller, this);
    m_globalStateHandler->produceGlobalStateAndTransitions(rootComponent);
    if (rootComponent)
        Taldris::HmiSubmoduleProvider::instance()->requestSubmodule(0, rootComponent, moduleId(),
                                                                    2);
    // The phone's pages in the settings module.
    auto *settingsSubmodule = new HmiPhoneSettingsHostedSubmodule(m_controller, this);
    Taldris::HmiSubmoduleProvider::instance()->registerHostedSubmodule(3, settingsSubmodule);
    return rootComponent;
}

void HmiPhoneIntegration::exportObjects(QQmlContext *context)
{
    qCDebug(hmiphone, "Exporting _hmiphone and _hmiphoneController to QML");
    context->setContextProperty(QStringLiteral("_hmiphone"), this);
    context->setContextProperty(QStringLiteral("_hmiphoneController"), m_controller);
}

QString HmiPhoneIntegration::createViewIdentifier(const QString &viewName) const
{
    return Brisken::ViewManager::viewIdentifier(moduleId(), viewName);
}

} // namespace HmiPhone

Taldris::HmiModuleIntegration *HmiPhoneModule::createModuleIntegration(const QString &name,
                                                                       QObject *parent)
{
    if (name != QLatin1String("HmiPhone"))
        return nullptr;
    return new HmiPhone::HmiPhoneIntegration(parent);
}
