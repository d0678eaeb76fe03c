#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// Driver profile of the ignition key. The whole bridge is listed in <mavrosk/bridge.h>.
class ArdelSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(int ignitionKeyType READ ignitionKeyType WRITE setIgnitionKeyType NOTIFY
                       ignitionKeyTypeChanged)
    Q_PROPERTY(bool doNotDisturbOption READ doNotDisturbOption WRITE setDoNotDisturbOption NOTIFY
                       doNotDisturbOptionChanged)
public:
    static ArdelSource *instance();

    int ignitionKeyType() const { return m_ignitionKeyType; }
    bool doNotDisturbOption() const { return m_doNotDisturbOption; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setIgnitionKeyType(int value);
    void setDoNotDisturbOption(bool value);

signals:
    void ignitionKeyTypeChanged(int value);
    void doNotDisturbOptionChanged(bool value);

private:
    ArdelSource();
    int m_ignitionKeyType = 0;
    bool m_doNotDisturbOption = false;
};

} // namespace Mavrosk
