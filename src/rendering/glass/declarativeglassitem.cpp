#include "declarativeglassitem.h"
#include "window/declarativewindow.h"
#include "rendering/glass/glassitemnode.h"
#include "rendering/glass/glassmaterial.h"
#include "core/theme.h"

#include <QGuiApplication>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QScreen>
#include <private/qquickitem_p.h>
#include <private/qsgcontext_p.h>

#include <cmath>

DeclarativeGlassItem::DeclarativeGlassItem(QQuickItem *parent)
    : Pelkan::Item(parent)
{
    setFlag(ItemHasContents);
    const qreal size = std::round(Pelkan::Theme::instance()->itemSizeMedium());
    setImplicitSize(size, size);
    connect(this, &QQuickItem::scaleChanged, this, &DeclarativeGlassItem::setDirty);
    m_angle = computeAngle();
}

template <typename T>
bool DeclarativeGlassItem::assign(T &field, const T &value)
{
    if (field == value)
        return false;
    field = value;
    m_materialDirty = true;
    update();
    return true;
}

void DeclarativeGlassItem::setColor(const QColor &color)
{
    if (assign(m_color, color))
        Q_EMIT colorChanged();
}

void DeclarativeGlassItem::setBackgroundColor(const QColor &color)
{
    // Announced as a colour change, on purpose.
    if (assign(m_backgroundColor, color))
        Q_EMIT colorChanged();
}

void DeclarativeGlassItem::setDimmed(bool dimmed)
{
    if (assign(m_dimmed, dimmed))
        Q_EMIT dimmedChanged();
}

void DeclarativeGlassItem::setCache(bool cache)
{
    if (assign(m_cache, cache))
        Q_EMIT cacheChanged();
}

void DeclarativeGlassItem::setRadius(float radius)
{
    if (assign(m_radius, radius))
        Q_EMIT radiusChanged();
}

void DeclarativeGlassItem::setFalloffRadius(float radius)
{
    if (assign(m_falloffRadius, radius))
        Q_EMIT falloffRadiusChanged();
}

void DeclarativeGlassItem::setRatio(float ratio)
{
    if (assign(m_ratio, ratio))
        Q_EMIT ratioChanged();
}

void DeclarativeGlassItem::setDashed(bool dashed)
{
    if (assign(m_dashed, dashed))
        Q_EMIT dashedChanged();
}

void DeclarativeGlassItem::setDashOffset(float offset)
{
    if (assign(m_dashOffset, offset))
        Q_EMIT dashOffsetChanged();
}

void DeclarativeGlassItem::setDashLength(float length)
{
    if (length == m_dashLength)
        return;
    m_dashLength = length;
    // Only dashes need redrawing for it.
    if (m_dashed) {
        m_materialDirty = true;
        update();
    }
    Q_EMIT dashLengthChanged();
}

void DeclarativeGlassItem::setDashMargin(float margin)
{
    if (margin == m_dashMargin)
        return;
    m_dashMargin = margin;
    if (m_dashed) {
        m_materialDirty = true;
        update();
    }
    Q_EMIT dashMarginChanged();
}

void DeclarativeGlassItem::setBrightness(float brightness)
{
    if (assign(m_brightness, brightness))
        Q_EMIT brightnessChanged();
}

void DeclarativeGlassItem::setPattern(const QUrl &pattern)
{
    if (pattern == m_patternUrl)
        return;
    m_patternUrl = pattern;
    m_materialDirty = true;
    Q_EMIT patternChanged();
    if (isComponentComplete())
        loadPattern();
}

void DeclarativeGlassItem::componentComplete()
{
    Pelkan::Item::componentComplete();
    loadPattern();
}

void DeclarativeGlassItem::loadPattern()
{
    QQmlEngine *engine = qmlEngine(this);
    if (!engine)
        return;
    m_pattern.load(engine, m_patternUrl, QQuickPixmap::Cache);
    if (m_pattern.isLoading())
        m_pattern.connectFinished(this, SLOT(setDirty()));
    update();
}

void DeclarativeGlassItem::setDirty()
{
    m_materialDirty = true;
    update();
}

int DeclarativeGlassItem::computeAngle() const
{
    const int offset = DeclarativeWindow::configuredScreenRotation();
    int angle = offset;
    QScreen *screen = QGuiApplication::primaryScreen();
    if (m_window && screen) {
        const Qt::ScreenOrientation orientation = DeclarativeWindow::toScreenOrientation(m_window->orientation());
        angle = screen->angleBetween(orientation, Qt::PrimaryOrientation) - offset;
    }
    return ((angle % 360) + 360) % 360;
}

void DeclarativeGlassItem::angleChanged()
{
    m_angle = computeAngle();
    m_recreateNode = true;
    m_geometryDirty = true;
    m_materialDirty = true;
    update();
}

void DeclarativeGlassItem::itemChange(ItemChange change, const ItemChangeData &data)
{
    Pelkan::Item::itemChange(change, data);
    switch (change) {
    case ItemOpacityHasChanged:
    case ItemRotationHasChanged:
        m_materialDirty = true;
        break;
    case ItemSceneChange:
        if (m_window)
            disconnect(m_window, nullptr, this, nullptr);
        m_window = DeclarativeWindow::findWindow(this);
        if (m_window)
            connect(m_window, &DeclarativeWindow::orientationChanged, this, &DeclarativeGlassItem::angleChanged);
        angleChanged();
        break;
    default:
        break;
    }
}

void DeclarativeGlassItem::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    Pelkan::Item::geometryChanged(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        m_geometryDirty = true;
    // The stretched glow depends on the size.
    m_materialDirty = true;
    update();
}

QSGNode *DeclarativeGlassItem::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    auto node = static_cast<GlassItemNode *>(oldNode);
    bool created = false;
    if (!node || m_recreateNode) {
        delete node;
        m_recreateNode = false;
        m_materialDirty = true;
        node = new GlassItemNode(m_angle);
        created = true;
    }
    if (std::fabs(width()) <= 0.00001 || std::fabs(height()) <= 0.00001)
        return node;

    GlassMaterial *material = node->glassMaterial();
    if (material && (created || m_materialDirty)) {
        GlassState &state = material->state();
        state.color = m_color;
        state.backgroundColor = m_backgroundColor;
        state.border = m_radius;
        state.sigma = m_falloffRadius;
        state.size = m_dashSize;
        state.pattern = m_pattern.textureFactory()
                ? QQuickItemPrivate::get(this)->sceneGraphRenderContext()->textureForFactory(m_pattern.textureFactory(), window())
                : nullptr;
        if (m_ratio != 0) {
            state.centersize = QVector2D(0, 0);
        } else {
            const qreal shorter = qMin(width(), height());
            const qreal longer = qMax(width(), height());
            const float s = float((longer - shorter) / longer * 0.5);
            state.centersize = width() / height() < 1.0 ? QVector2D(0, s) : QVector2D(s, 0);
        }
        state.brightness = m_brightness * (m_dimmed ? 0.3f : 1.0f);
        state.dash = QVector3D(m_dashed ? m_dashLength : 0, m_dashLength + m_dashMargin, m_dashOffset);
        node->markDirty(QSGNode::DirtyMaterial);
        m_materialDirty = false;
    }
    if (created || m_geometryDirty) {
        node->setRect(QRectF(0, 0, width(), height()));
        m_geometryDirty = false;
    }
    return node;
}
