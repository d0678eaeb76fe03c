#include "hmitargetblacklistfilter.h"

#include <QAbstractState>

namespace Quorvel {

HmiTargetBlacklistFilter::HmiTargetBlacklistFilter(const QString &stateName)
    : m_names{stateName}
{ }

HmiTargetBlacklistFilter::HmiTargetBlacklistFilter(const QStringList &stateNames)
    : m_names(stateNames)
{ }

HmiTargetBlacklistFilter::~HmiTargetBlacklistFilter() = default;

bool HmiTargetBlacklistFilter::acceptsTarget(const QAbstractState *state) const
{
    return state && !m_names.contains(state->objectName());
}

} // namespace Quorvel
