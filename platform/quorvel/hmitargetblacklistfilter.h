#pragma once

#include <quorvel/hmitargetfilter.h>

#include <QStringList>

namespace Quorvel {

// Refuses the states of the listed names as back targets.
class HmiTargetBlacklistFilter : public HmiTargetFilter
{
public:
    explicit HmiTargetBlacklistFilter(const QString &stateName);
    explicit HmiTargetBlacklistFilter(const QStringList &stateNames);
    ~HmiTargetBlacklistFilter() override;

    bool acceptsTarget(const QAbstractState *state) const override;
    QStringList blacklist() const { return m_names; }

private:
    QStringList m_names;
};

} // namespace Quorvel
