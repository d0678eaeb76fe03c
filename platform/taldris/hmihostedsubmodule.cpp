#include "hmihostedsubmodule.h"

namespace Taldris {

HmiHostedSubmodule::HmiHostedSubmodule(QObject *parent)
    : QObject(parent)
{ }

HmiHostedSubmodule::~HmiHostedSubmodule() = default;

HmiHostedSubmodule::RootHierarchyTransitions HmiHostedSubmodule::createRootHierarchyTransitions()
{
    return {};
}

HmiHostedSubmodule::RootHierarchyPopupStates HmiHostedSubmodule::createRootHierarchyPopupStates()
{
    return {};
}

} // namespace Taldris
