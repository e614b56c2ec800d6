#include "declarativedimmedregion.h"

#include "core/theme.h"

#include <QSGFlatColorMaterial>
#include <QSGGeometryNode>

#include <algorithm>
#include <cmath>

namespace {

void addRect(QVector<QPointF> &points, const QRectF &r)
{
    points << r.topLeft() << r.topRight() << r.bottomLeft()
           << r.topRight() << r.bottomRight() << r.bottomLeft();
}

// The part of a hole's corner square outside its rounded corner: a fan from the square's
// outer corner along the arc.
void addCorner(QVector<QPointF> &points, const QPointF &corner, const QPointF &centre, qreal radius,
               qreal fromAngle)
{
    const int steps = std::max(4, int(radius / 2));
    for (int i = 0; i < steps; ++i) {
        const qreal a0 = fromAngle + (M_PI / 2) * i / steps;
        const qreal a1 = fromAngle + (M_PI / 2) * (i + 1) / steps;
        points << corner
               << centre + QPointF(std::cos(a0) * radius, -std::sin(a0) * radius)
               << centre + QPointF(std::cos(a1) * radius, -std::sin(a1) * radius);
    }
}

} // namespace

DeclarativeDimmedRegion::DeclarativeDimmedRegion(QQuickItem *parent)
    : QQuickItem(parent)
    , m_color(this, [] { return Pelkan::Theme::instance()->rgba(Pelkan::Theme::instance()->overlayBackgroundColor(), 0.7); },
              [this] {
                  update();
                  Q_EMIT colorChanged();
              })
{
    setFlag(ItemHasContents);
}

void DeclarativeDimmedRegion::setHoles(const QVariantList &holes)
{
    for (const QPointer<QQuickItem> &item : qAsConst(m_watched)) {
        if (item)
            disconnect(item, nullptr, this, nullptr);
    }
    m_watched.clear();
    m_holes = holes;
    for (const QVariant &hole : holes) {
        if (auto *item = qobject_cast<QQuickItem *>(hole.value<QObject *>())) {
            // A hole follows its item.
            for (auto signal : { &QQuickItem::xChanged, &QQuickItem::yChanged, &QQuickItem::widthChanged,
                                 &QQuickItem::heightChanged, &QQuickItem::visibleChanged })
                connect(item, signal, this, &QQuickItem::update);
            m_watched.append(item);
        }
    }
    update();
    Q_EMIT holesChanged();
}

void DeclarativeDimmedRegion::setRadius(qreal radius)
{
    radius = std::max<qreal>(0, radius);
    if (radius == m_radius)
        return;
    m_radius = radius;
    update();
    Q_EMIT radiusChanged();
}

void DeclarativeDimmedRegion::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    update();
}

QVector<QRectF> DeclarativeDimmedRegion::holeRects() const
{
    const QRectF area(0, 0, width(), height());
    QVector<QRectF> rects;
    for (const QVariant &hole : m_holes) {
        QRectF rect;
        if (auto *item = qobject_cast<QQuickItem *>(hole.value<QObject *>())) {
            if (!item->isVisible())
                continue;
            rect = item->mapRectToItem(this, QRectF(0, 0, item->width(), item->height()));
        } else if (hole.canConvert<QRectF>()) {
            rect = hole.toRectF();
        }
        rect = rect & area;
        if (!rect.isEmpty())
            rects.append(rect);
    }
    return rects;
}

QVector<QPointF> DeclarativeDimmedRegion::triangles(const QRectF &area, const QVector<QRectF> &holes, qreal radius)
{
    QVector<QPointF> points;
    // Bands between every hole edge; in each, the stretches no hole covers.
    QVector<qreal> ys { area.top(), area.bottom() };
    for (const QRectF &hole : holes)
        ys << hole.top() << hole.bottom();
    std::sort(ys.begin(), ys.end());
    ys.erase(std::unique(ys.begin(), ys.end()), ys.end());
    for (int i = 0; i + 1 < ys.size(); ++i) {
        const qreal top = ys.at(i), bottom = ys.at(i + 1);
        if (bottom <= top)
            continue;
        QVector<QPair<qreal, qreal>> covered;
        for (const QRectF &hole : holes) {
            if (hole.top() <= top && hole.bottom() >= bottom)
                covered.append({ hole.left(), hole.right() });
        }
        std::sort(covered.begin(), covered.end());
        qreal x = area.left();
        for (const auto &span : qAsConst(covered)) {
            if (span.first > x)
                addRect(points, QRectF(x, top, span.first - x, bottom - top));
            x = std::max(x, span.second);
        }
        if (x < area.right())
            addRect(points, QRectF(x, top, area.right() - x, bottom - top));
    }
    // Rounded holes leave their corners dimmed.
    for (const QRectF &hole : holes) {
        const qreal r = std::min({ radius, hole.width() / 2, hole.height() / 2 });
        if (r <= 0)
            continue;
        addCorner(points, hole.topRight(), hole.topRight() + QPointF(-r, r), r, 0);
        addCorner(points, hole.topLeft(), hole.topLeft() + QPointF(r, r), r, M_PI / 2);
        addCorner(points, hole.bottomLeft(), hole.bottomLeft() + QPointF(r, -r), r, M_PI);
        addCorner(points, hole.bottomRight(), hole.bottomRight() + QPointF(-r, -r), r, 3 * M_PI / 2);
    }
    return points;
}

QSGNode *DeclarativeDimmedRegion::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    auto *node = static_cast<QSGGeometryNode *>(oldNode);
    const QVector<QPointF> points = triangles(QRectF(0, 0, width(), height()), holeRects(), m_radius);
    if (points.isEmpty()) {
        delete node;
        return nullptr;
    }
    if (!node) {
        node = new QSGGeometryNode;
        auto *geometry = new QSGGeometry(QSGGeometry::defaultAttributes_Point2D(), 0);
        geometry->setDrawingMode(QSGGeometry::DrawTriangles);
        node->setGeometry(geometry);
        node->setFlag(QSGNode::OwnsGeometry);
        node->setMaterial(new QSGFlatColorMaterial);
        node->setFlag(QSGNode::OwnsMaterial);
    }
    QSGGeometry *geometry = node->geometry();
    geometry->allocate(points.size());
    QSGGeometry::Point2D *vertices = geometry->vertexDataAsPoint2D();
    for (int i = 0; i < points.size(); ++i)
        vertices[i].set(float(points.at(i).x()), float(points.at(i).y()));
    node->markDirty(QSGNode::DirtyGeometry);
    auto *material = static_cast<QSGFlatColorMaterial *>(node->material());
    if (material->color() != color()) {
        material->setColor(color());
        node->markDirty(QSGNode::DirtyMaterial);
    }
    return node;
}
