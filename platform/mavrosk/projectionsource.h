#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// Phone projection (the phone drawing on the head unit). The whole bridge is listed in
// <mavrosk/bridge.h>.
class ProjectionSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(int projectionMode READ projectionMode WRITE setProjectionMode NOTIFY
                       projectionModeChanged)
    Q_PROPERTY(bool isRendering READ isRendering WRITE setIsRendering NOTIFY isRenderingChanged)
public:
    static ProjectionSource *instance();

    int projectionMode() const { return m_projectionMode; }
    bool isRendering() const { return m_isRendering; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setProjectionMode(int value);
    void setIsRendering(bool value);

signals:
    void projectionModeChanged(int value);
    void isRenderingChanged(bool value);

    void projectionNotActive(bool notActive);
    void projectionDIONotActive(bool notActive);

private:
    ProjectionSource();
    int m_projectionMode = 0;
    bool m_isRendering = false;
};

} // namespace Mavrosk
