#include "hmimoduleintegration.h"

#include <brisken/viewmanager.h>

namespace Taldris {

HmiModuleIntegration::HmiModuleIntegration(int moduleType, QObject *parent)
    : QObject(parent)
    , m_moduleType(moduleType)
{ }

HmiModuleIntegration::~HmiModuleIntegration() = default;

QString HmiModuleIntegration::moduleIdForType(int moduleType)
{
    switch (moduleType) {
    case 1:
        return QStringLiteral("PHONE");
    default:
        return QString();
    }
}

QString HmiModuleIntegration::moduleId() const
{
    return moduleIdForType(m_moduleType);
}

int HmiModuleIntegration::modulePriority() const
{
    return 0;
}

int HmiModuleIntegration::moduleDomain() const
{
    return 0;
}

QString HmiModuleIntegration::viewDescriptorFile() const
{
    return QString();
}

QString HmiModuleIntegration::rootStateIdentifier() const
{
    return Brisken::ViewManager::viewIdentifier(moduleId(), QStringLiteral("Root"));
}

QUrl HmiModuleIntegration::iconUrl() const
{
    return QUrl();
}

HmiModuleIntegration::RootHierarchyTransitions
HmiModuleIntegration::moduleRootHierarchyTransitions() const
{
    return {};
}

HmiModuleIntegration::RootHierarchyPopupStates
HmiModuleIntegration::moduleRootHierarchyPopupStates() const
{
    return {};
}

void HmiModuleIntegration::registerTypes() { }

void HmiModuleIntegration::exportObjects(QQmlContext *) { }

} // namespace Taldris
