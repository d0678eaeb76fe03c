#pragma once

#include <taldris/hmimoduleintegration.h>
#include <taldris/moduleinterface.h>
#include <taldris/pellumcategory.h>

#include <QObject>
#include <QPointer>

namespace HmiPhone {

class HmiPhoneController;
class HmiPhoneGlobalStateHandler;
class HmiPhoneIntentHandler;
class HmiPhonePopupManager;

// The module's one logging category, "orvane.hmiphone".
const Taldris::PellumCategory &hmiphone();

// The object through which the host talks to the phone module: its identity, its QML types and
// objects, the phone's screen-state subtree and its root-hierarchy popups and transitions.
class HmiPhoneIntegration : public Taldris::HmiModuleIntegration
{
    Q_OBJECT
public:
    explicit HmiPhoneIntegration(QObject *parent = nullptr);
    ~HmiPhoneIntegration() override;

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    QString rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    RootHierarchyTransitions moduleRootHierarchyTransitions() const override;
    RootHierarchyPopupStates moduleRootHierarchyPopupStates() const override;
    void registerTypes() override;
    Quorvel::HmiState *createScreenStateSubTree(Quorvel::HmiState *parent) override;
    void exportObjects(QQmlContext *context) override;

    QString createViewIdentifier(const QString &viewName) const;

private:
    QPointer<HmiPhoneController> m_controller; // QML can delete it (deleteLater())
    HmiPhonePopupManager *m_popupManager;
    HmiPhoneGlobalStateHandler *m_globalStateHandler;
    HmiPhoneIntentHandler *m_intentHandler;
};

} // namespace HmiPhone

// The plug-in object the host finds by the module interface identifier.
class HmiPhoneModule : public QObject, public Taldris::ModuleInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.orvane.ivi.ModuleInterface" FILE "hmiphone.json")
    Q_INTERFACES(Taldris::ModuleInterface)
public:
    Taldris::HmiModuleIntegration *createModuleIntegration(const QString &name,
                                                           QObject *parent) override;
};
