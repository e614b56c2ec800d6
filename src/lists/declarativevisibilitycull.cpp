#include "declarativevisibilitycull.h"

#include <QTimer>
#include <private/qquickitem_p.h>

namespace {

QQuickItem *nearestFlickable(QQuickItem *item)
{
    for (; item; item = item->parentItem()) {
        if (item->inherits("QQuickFlickable"))
            return item;
    }
    return nullptr;
}

} // namespace

DeclarativeVisibilityCull::DeclarativeVisibilityCull(QQuickItem *parent)
    : QQuickItem(parent)
{
}

DeclarativeVisibilityCull::~DeclarativeVisibilityCull()
{
    restoreAll();
}

void DeclarativeVisibilityCull::setTarget(QQuickItem *target)
{
    m_targetSet = true;
    if (target == m_target)
        return;
    restoreAll();
    m_target = target;
    follow();
    Q_EMIT targetChanged();
}

void DeclarativeVisibilityCull::setFlickable(QQuickItem *flickable)
{
    m_flickableSet = true;
    if (flickable == m_flickable)
        return;
    m_flickable = flickable;
    follow();
    Q_EMIT flickableChanged();
}

void DeclarativeVisibilityCull::setMargin(qreal margin)
{
    if (qFuzzyCompare(margin, m_margin))
        return;
    m_margin = margin;
    scheduleUpdate();
    Q_EMIT marginChanged();
}

void DeclarativeVisibilityCull::componentComplete()
{
    QQuickItem::componentComplete();
    follow();
}

void DeclarativeVisibilityCull::itemChange(ItemChange change, const ItemChangeData &data)
{
    QQuickItem::itemChange(change, data);
    if (change == ItemParentHasChanged && isComponentComplete())
        follow();
}

void DeclarativeVisibilityCull::follow()
{
    for (const QMetaObject::Connection &connection : qAsConst(m_connections))
        disconnect(connection);
    m_connections.clear();
    if (!m_targetSet)
        m_target = parentItem();
    if (!m_flickableSet)
        m_flickable = nearestFlickable(parentItem());
    if (m_flickable) {
        for (const char *signal : { SIGNAL(contentYChanged()), SIGNAL(contentXChanged()), SIGNAL(heightChanged()),
                                    SIGNAL(widthChanged()) })
            m_connections << connect(m_flickable, signal, this, SLOT(update()));
    }
    if (m_target) {
        // Children added, moved or resized by a layout: once per event loop turn.
        m_connections << connect(m_target, &QQuickItem::childrenChanged, this, &DeclarativeVisibilityCull::scheduleUpdate);
        m_connections << connect(m_target, &QQuickItem::heightChanged, this, &DeclarativeVisibilityCull::scheduleUpdate);
        m_connections << connect(m_target, &QQuickItem::yChanged, this, &DeclarativeVisibilityCull::scheduleUpdate);
    }
    scheduleUpdate();
}

void DeclarativeVisibilityCull::scheduleUpdate()
{
    if (m_updatePending)
        return;
    m_updatePending = true;
    QTimer::singleShot(0, this, [this] {
        m_updatePending = false;
        update();
    });
}

void DeclarativeVisibilityCull::update()
{
    if (!m_target || !m_flickable) {
        restoreAll();
        return;
    }
    // The view in the target's coordinates, grown by the margin.
    const QRectF view = m_target->mapRectFromItem(m_flickable, QRectF(0, 0, m_flickable->width(), m_flickable->height()))
                                .adjusted(-m_margin, -m_margin, m_margin, m_margin);
    QList<QPointer<QQuickItem>> culled;
    int drawn = 0;
    const QList<QQuickItem *> children = m_target->childItems();
    for (QQuickItem *child : children) {
        if (child == this)
            continue;
        const QRectF box(child->x(), child->y(), child->width(), child->height());
        const bool outside = !box.intersects(view) && !(box.isEmpty() && view.contains(box.topLeft()));
        QQuickItemPrivate *d = QQuickItemPrivate::get(child);
        if (outside) {
            if (!d->culled)
                d->setCulled(true);
            culled << child;
        } else {
            if (d->culled)
                d->setCulled(false);
            if (child->isVisible() && !box.isEmpty())
                ++drawn;
        }
    }
    m_culled = culled;
    if (drawn != m_drawnCount) {
        m_drawnCount = drawn;
        Q_EMIT drawnCountChanged();
    }
}

void DeclarativeVisibilityCull::restoreAll()
{
    for (const QPointer<QQuickItem> &child : qAsConst(m_culled)) {
        if (child)
            QQuickItemPrivate::get(child)->setCulled(false);
    }
    m_culled.clear();
}
