#include "extendedsurface.h"

#include <QDataStream>

ExtendedSurface::ExtendedSurface(QWaylandSurface *surface, wl_client *client, uint32_t id, int version)
    : QtWaylandServer::qt_extended_surface(client, int(id), version)
    , m_surface(surface)
{
}

QVariant ExtendedSurface::decode(const QByteArray &bytes, bool *ok)
{
    QDataStream stream(bytes);
    QVariant value;
    stream >> value;
    if (ok)
        *ok = stream.status() == QDataStream::Ok;
    return value;
}

void ExtendedSurface::extended_surface_update_generic_property(Resource *, const QString &name, wl_array *value)
{
    bool ok = false;
    const QVariant decoded = decode(QByteArray(static_cast<const char *>(value->data), int(value->size)), &ok);
    if (!ok) {
        Q_EMIT malformedProperty(name);
        return;
    }
    m_properties.insert(name, decoded);
    Q_EMIT propertyChanged(name, decoded);
}

void ExtendedSurface::extended_surface_set_content_orientation_mask(Resource *, int32_t)
{
}

void ExtendedSurface::extended_surface_set_window_flags(Resource *, int32_t)
{
}

void ExtendedSurface::extended_surface_raise(Resource *)
{
    Q_EMIT raiseRequested();
}

void ExtendedSurface::extended_surface_lower(Resource *)
{
    Q_EMIT lowerRequested();
}

void ExtendedSurface::extended_surface_destroy_resource(Resource *)
{
    deleteLater();
}
