#include "globalsource.h"

namespace Mavrosk {

GlobalSource::GlobalSource()
    : DataSource(QStringLiteral("global"))
{ }

GlobalSource *GlobalSource::instance()
{
    static GlobalSource *const source = adopt(new GlobalSource);
    return source;
}

void GlobalSource::sendDisplayOnlyModeBeginShutdownRequest()
{
    journalCall(QStringLiteral("sendDisplayOnlyModeBeginShutdownRequest"));
}

} // namespace Mavrosk
