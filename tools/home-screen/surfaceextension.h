#pragma once

#include "qwayland-server-surface-extension.h"

#include <QObject>

class ExtendedSurface;
class QWaylandCompositor;

// The global through which clients ask for a property channel on their surfaces.
class SurfaceExtension : public QObject, public QtWaylandServer::qt_surface_extension
{
    Q_OBJECT
public:
    explicit SurfaceExtension(QWaylandCompositor *compositor);

Q_SIGNALS:
    void extendedSurfaceCreated(ExtendedSurface *surface);

protected:
    void surface_extension_get_extended_surface(Resource *resource, uint32_t id, wl_resource *surface) override;
};
