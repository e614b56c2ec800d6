#include "overlaybackground.h"
#include "rendering/backgrounds/glassbackground.h"
#include "rendering/overlay/overlaybackgroundsource.h"
#include "core/pelkanlogging.h"

#include <QQuickItem>
#include <QQuickWindow>

OverlayBackground::OverlayBackground(QObject *parent)
    : QObject(parent)
    , m_item(qobject_cast<QQuickItem *>(parent))
{
    if (!m_item)
        qCWarning(lcPelkanCoreLog) << "OverlayBackground: attached to" << parent << "which is no item; ignored";
    else
        connect(m_item, &QQuickItem::windowChanged, this, [this] { rebuild(); });
}

OverlayBackground::~OverlayBackground()
{
    delete m_background;
}

OverlayBackground *OverlayBackground::qmlAttachedProperties(QObject *object)
{
    return new OverlayBackground(object);
}

void OverlayBackground::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return;
    m_enabled = enabled;
    rebuild();
    Q_EMIT enabledChanged();
}

OverlayBackgroundSource *OverlayBackground::source() const
{
    if (m_sourceSet)
        return m_source;
    return m_item && m_item->window() ? OverlayBackgroundSource::forWindow(m_item->window()) : nullptr;
}

void OverlayBackground::setSource(OverlayBackgroundSource *source)
{
    if (m_sourceSet && source == m_source)
        return;
    m_source = source;
    m_sourceSet = true;
    apply();
    Q_EMIT sourceChanged();
}

void OverlayBackground::resetSource()
{
    if (!std::exchange(m_sourceSet, false))
        return;
    m_source = nullptr;
    apply();
    Q_EMIT sourceChanged();
}

QColor OverlayBackground::color() const
{
    if (m_colorSet)
        return m_color;
    return m_background ? m_background->color() : QColor();
}

void OverlayBackground::setColor(const QColor &color)
{
    if (m_colorSet && color == m_color)
        return;
    m_color = color;
    m_colorSet = true;
    apply();
    Q_EMIT colorChanged();
}

void OverlayBackground::resetColor()
{
    if (!std::exchange(m_colorSet, false))
        return;
    apply();
    Q_EMIT colorChanged();
}

void OverlayBackground::setRadius(qreal radius)
{
    if (qFuzzyCompare(radius, m_radius))
        return;
    m_radius = radius;
    apply();
    Q_EMIT radiusChanged();
}

QQuickItem *OverlayBackground::background() const
{
    return m_background;
}

void OverlayBackground::rebuild()
{
    const bool wanted = m_enabled && m_item;
    if (wanted == bool(m_background)) {
        apply();
        return;
    }
    if (!wanted) {
        delete m_background;
    } else {
        m_background = new GlassBackground(m_item);
        // Under the overlay's own children, filling it.
        m_background->setZ(-1);
        m_background->setSize(m_item->size());
        connect(m_item, &QQuickItem::widthChanged, m_background, [this] { m_background->setWidth(m_item->width()); });
        connect(m_item, &QQuickItem::heightChanged, m_background, [this] { m_background->setHeight(m_item->height()); });
        connect(m_background, &BackgroundShapeItem::colorChanged, this, [this] {
            if (!m_colorSet)
                Q_EMIT colorChanged();
        });
        m_background->setPatternOpacity(0);
        apply();
    }
    Q_EMIT backgroundChanged();
    if (!m_colorSet)
        Q_EMIT colorChanged();
}

void OverlayBackground::apply()
{
    if (!m_background)
        return;
    m_background->setBackdrop(source());
    if (m_colorSet)
        m_background->setColor(m_color);
    else
        m_background->resetColor();
    m_background->setRadius(m_radius);
}
