#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// The phone accessory channel: while events are blocked the phone keys do nothing. The whole bridge
// is listed in <mavrosk/bridge.h>.
class EAPhoneSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(bool eventsBlocked READ eventsBlocked WRITE setEventsBlocked NOTIFY
                       eventsBlockedChanged)
public:
    static EAPhoneSource *instance();

    bool eventsBlocked() const { return m_eventsBlocked; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setEventsBlocked(bool value);

signals:
    void eventsBlockedChanged(bool value);

private:
    EAPhoneSource();
    bool m_eventsBlocked = false;
};

} // namespace Mavrosk
