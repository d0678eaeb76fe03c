#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// Vehicle-wide requests. The whole bridge is listed in <mavrosk/bridge.h>.
class GlobalSource : public DataSource
{
    Q_OBJECT
public:
    static GlobalSource *instance();

    // Commands: journaled as bridge {call, args}; their outcome arrives later as changes.
public slots:
    // Vehicle
    void sendDisplayOnlyModeBeginShutdownRequest();

private:
    GlobalSource();
};

} // namespace Mavrosk
