#include "framerateoverlay.h"

#include "core/theme.h"

#include <QQuickWindow>
#include <QSGGeometryNode>
#include <QSGVertexColorMaterial>

namespace {

// Which of the seven segments (top, top right, bottom right, bottom, bottom left, top
// left, middle) each digit lights.
const uchar Segments[10] = { 0x3f, 0x06, 0x5b, 0x4f, 0x66, 0x6d, 0x7d, 0x07, 0x7f, 0x6f };

class Triangles
{
public:
    explicit Triangles(QVector<QSGGeometry::ColoredPoint2D> &out) : m_out(out) {}

    void rect(const QRectF &r, QColor c)
    {
        const qreal a = c.alphaF(); // premultiplied
        const uchar red = uchar(c.red() * a), green = uchar(c.green() * a), blue = uchar(c.blue() * a), alpha = uchar(c.alpha());
        const QPointF p[6] = { r.topLeft(), r.topRight(), r.bottomLeft(), r.topRight(), r.bottomRight(), r.bottomLeft() };
        for (const QPointF &q : p) {
            QSGGeometry::ColoredPoint2D v;
            v.set(float(q.x()), float(q.y()), red, green, blue, alpha);
            m_out.append(v);
        }
    }

    // A digit of the given height; its width is half that.
    void digit(int value, const QPointF &at, qreal height, const QColor &c)
    {
        const qreal w = height / 2, t = qMax<qreal>(1, height / 10), h = height / 2;
        const QRectF segment[7] = {
            QRectF(at.x(), at.y(), w, t), QRectF(at.x() + w - t, at.y(), t, h), QRectF(at.x() + w - t, at.y() + h, t, h),
            QRectF(at.x(), at.y() + height - t, w, t), QRectF(at.x(), at.y() + h, t, h), QRectF(at.x(), at.y(), t, h),
            QRectF(at.x(), at.y() + h - t / 2, w, t),
        };
        for (int i = 0; i < 7; ++i) {
            if (Segments[value] & (1 << i))
                rect(segment[i], c);
        }
    }

private:
    QVector<QSGGeometry::ColoredPoint2D> &m_out;
};

} // namespace

bool FrameRateOverlay::requestedByEnvironment()
{
    static const bool requested = [] {
        const QByteArray value = qgetenv("PELKAN_FRAME_RATE");
        return !value.isEmpty() && value != "0";
    }();
    return requested;
}

FrameRateOverlay *FrameRateOverlay::find(QQuickWindow *window)
{
    return window ? window->contentItem()->findChild<FrameRateOverlay *>(QString(), Qt::FindDirectChildrenOnly) : nullptr;
}

void FrameRateOverlay::setShown(QQuickWindow *window, bool shown)
{
    if (!window)
        return;
    FrameRateOverlay *existing = find(window);
    if (shown && !existing)
        new FrameRateOverlay(window);
    else if (!shown)
        delete existing;
}

FrameRateOverlay::FrameRateOverlay(QQuickWindow *window)
    : QQuickItem(window->contentItem())
{
    setFlag(ItemHasContents);
    // Above every other item of the window, drawn last.
    setZ(std::numeric_limits<qreal>::max());
    const qreal unit = Pelkan::Theme::instance()->pixelRatio();
    setPosition(QPointF(8 * unit, 8 * unit));
    setSize(QSizeF((History * 3 + 60) * unit, 56 * unit));
    m_clock.start();
    connect(window, &QQuickWindow::frameSwapped, this, &FrameRateOverlay::frameSwapped, Qt::DirectConnection);
    m_refresh.setInterval(500);
    connect(&m_refresh, &QTimer::timeout, this, &FrameRateOverlay::refresh);
    m_refresh.start();
}

void FrameRateOverlay::frameSwapped()
{
    QMutexLocker lock(&m_mutex);
    m_swaps.append(m_clock.nsecsElapsed() / 1000);
    if (m_swaps.size() > History + 1)
        m_swaps.removeFirst();
    ++m_swapsSinceRefresh;
}

// Redrawing causes a frame of its own: counting that one, the window was idle.
void FrameRateOverlay::refresh()
{
    QMutexLocker lock(&m_mutex);
    const int others = m_swapsSinceRefresh - (m_ownFramePending ? 1 : 0);
    m_swapsSinceRefresh = 0;
    m_ownFramePending = others > 0;
    if (others > 0)
        update();
}

int FrameRateOverlay::framesPerSecond() const
{
    QMutexLocker lock(&m_mutex);
    const qint64 since = m_clock.nsecsElapsed() / 1000 - 1000000;
    return int(std::count_if(m_swaps.begin(), m_swaps.end(), [since](qint64 t) { return t > since; }));
}

QVector<qreal> FrameRateOverlay::frameTimes() const
{
    QMutexLocker lock(&m_mutex);
    QVector<qreal> times;
    for (int i = 1; i < m_swaps.size(); ++i)
        times.append((m_swaps.at(i) - m_swaps.at(i - 1)) / 1000.0);
    return times;
}

QSGNode *FrameRateOverlay::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    auto node = static_cast<QSGGeometryNode *>(oldNode);
    if (!node) {
        node = new QSGGeometryNode;
        auto geometry = new QSGGeometry(QSGGeometry::defaultAttributes_ColoredPoint2D(), 0);
        geometry->setDrawingMode(QSGGeometry::DrawTriangles);
        node->setGeometry(geometry);
        node->setFlag(QSGNode::OwnsGeometry);
        node->setMaterial(new QSGVertexColorMaterial);
        node->setFlag(QSGNode::OwnsMaterial);
    }
    const qreal unit = height() / 56;
    QVector<QSGGeometry::ColoredPoint2D> vertices;
    vertices.reserve(6 * (History + 24));
    Triangles draw(vertices);
    draw.rect(boundingRect(), QColor(0, 0, 0, 160));

    // Frames per second, up to three digits.
    const int fps = qMin(999, framesPerSecond());
    const QString digits = QString::number(fps);
    qreal x = 6 * unit;
    for (const QChar &c : digits) {
        draw.digit(c.digitValue(), QPointF(x, 16 * unit), 24 * unit, Qt::white);
        x += 16 * unit;
    }

    // The frame times as bars from the bottom, 50 ms at the top.
    const QVector<qreal> times = frameTimes();
    const qreal graphLeft = 56 * unit, graphBottom = height() - 4 * unit, graphHeight = height() - 8 * unit;
    for (int i = 0; i < times.size(); ++i) {
        const qreal ms = times.at(i);
        const qreal h = qMin<qreal>(ms, 50) / 50 * graphHeight;
        const QColor c = ms <= 17.5 ? QColor(80, 220, 100) : ms <= 34 ? QColor(240, 200, 60) : QColor(240, 70, 60);
        draw.rect(QRectF(graphLeft + (History - times.size() + i) * 3 * unit, graphBottom - h, 2 * unit, h), c);
    }
    draw.rect(QRectF(graphLeft, graphBottom - 16.7 / 50 * graphHeight, History * 3 * unit, unit), QColor(255, 255, 255, 128));

    QSGGeometry *geometry = node->geometry();
    geometry->allocate(vertices.size());
    std::copy(vertices.begin(), vertices.end(), geometry->vertexDataAsColoredPoint2D());
    node->markDirty(QSGNode::DirtyGeometry);
    return node;
}
