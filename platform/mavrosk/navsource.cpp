#include "navsource.h"

namespace Mavrosk {

NavSource::NavSource()
    : DataSource(QStringLiteral("nav"))
{ }

NavSource *NavSource::instance()
{
    static NavSource *const source = adopt(new NavSource);
    return source;
}

void NavSource::setRouteActive(bool value)
{
    update(m_routeActive, value, &NavSource::routeActiveChanged);
}

} // namespace Mavrosk
