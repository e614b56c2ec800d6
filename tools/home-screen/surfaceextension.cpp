#include "surfaceextension.h"
#include "extendedsurface.h"

#include <QWaylandCompositor>

SurfaceExtension::SurfaceExtension(QWaylandCompositor *compositor)
    : QObject(compositor)
    , QtWaylandServer::qt_surface_extension(compositor->display(), 1)
{
}

void SurfaceExtension::surface_extension_get_extended_surface(Resource *resource, uint32_t id, wl_resource *surface)
{
    auto extended = new ExtendedSurface(QWaylandSurface::fromResource(surface), resource->client(), id,
                                        wl_resource_get_version(resource->handle));
    Q_EMIT extendedSurfaceCreated(extended);
}
