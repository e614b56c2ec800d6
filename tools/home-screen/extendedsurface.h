#pragma once

#include "qwayland-server-surface-extension.h"

#include <QObject>
#include <QPointer>
#include <QVariantMap>
#include <QWaylandSurface>

// The home screen's end of one client window's property channel: it decodes every
// property the client sends and remembers the latest value of each.
class ExtendedSurface : public QObject, public QtWaylandServer::qt_extended_surface
{
    Q_OBJECT
public:
    ExtendedSurface(QWaylandSurface *surface, wl_client *client, uint32_t id, int version);

    QWaylandSurface *surface() const { return m_surface; }
    QVariantMap properties() const { return m_properties; }
    QVariant property(const QString &name) const { return m_properties.value(name); }

    // Reads a value as the client's platform plugin writes it: a QVariant in a QDataStream.
    static QVariant decode(const QByteArray &bytes, bool *ok = nullptr);

Q_SIGNALS:
    void propertyChanged(const QString &name, const QVariant &value);
    void malformedProperty(const QString &name);
    void raiseRequested();
    void lowerRequested();

protected:
    void extended_surface_update_generic_property(Resource *resource, const QString &name, wl_array *value) override;
    void extended_surface_set_content_orientation_mask(Resource *resource, int32_t orientation) override;
    void extended_surface_set_window_flags(Resource *resource, int32_t flags) override;
    void extended_surface_raise(Resource *resource) override;
    void extended_surface_lower(Resource *resource) override;
    void extended_surface_destroy_resource(Resource *resource) override;

private:
    QPointer<QWaylandSurface> m_surface;
    QVariantMap m_properties;
};
