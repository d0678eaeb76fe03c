#include "projectionsource.h"

namespace Mavrosk {

ProjectionSource::ProjectionSource()
    : DataSource(QStringLiteral("projection"))
{ }

ProjectionSource *ProjectionSource::instance()
{
    static ProjectionSource *const source = adopt(new ProjectionSource);
    return source;
}

void ProjectionSource::setProjectionMode(int value)
{
    update(m_projectionMode, value, &ProjectionSource::projectionModeChanged);
}

void ProjectionSource::setIsRendering(bool value)
{
    update(m_isRendering, value, &ProjectionSource::isRenderingChanged);
}

} // namespace Mavrosk
