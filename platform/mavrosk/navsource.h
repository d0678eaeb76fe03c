#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// Navigation. The whole bridge is listed in <mavrosk/bridge.h>.
class NavSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(bool routeActive READ routeActive WRITE setRouteActive NOTIFY routeActiveChanged)
public:
    static NavSource *instance();

    bool routeActive() const { return m_routeActive; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setRouteActive(bool value);

signals:
    void routeActiveChanged(bool value);

private:
    NavSource();
    bool m_routeActive = false;
};

} // namespace Mavrosk
