#include "declarativeutil.h"
#include "rendering/debug/framerateoverlay.h"

#include "services/profilelistener.h"

#include <QQuickItem>
#include <QQuickWindow>

DeclarativeUtil::DeclarativeUtil(QObject *parent)
    : QObject(parent)
{
    connect(ProfileListener::instance(), &ProfileListener::changed, this, &DeclarativeUtil::touchToneLevelChanged);
}

QQuickItem *DeclarativeUtil::findFlickable(QQuickItem *item) const
{
    for (QQuickItem *above = item ? item->parentItem() : nullptr; above; above = above->parentItem()) {
        if (above->inherits("QQuickFlickable"))
            return above;
    }
    return nullptr;
}

QQuickItem *DeclarativeUtil::findPage(QQuickItem *item) const
{
    // A page is what the page stack gives a status and an orientation.
    for (QQuickItem *above = item ? item->parentItem() : nullptr; above; above = above->parentItem()) {
        const QMetaObject *meta = above->metaObject();
        if (meta->indexOfProperty("pageStack") >= 0 && meta->indexOfProperty("status") >= 0
                && meta->indexOfProperty("allowedOrientations") >= 0)
            return above;
    }
    return nullptr;
}

QQuickItem *DeclarativeUtil::findAncestor(QQuickItem *item, const QString &property) const
{
    const QByteArray name = property.toUtf8();
    for (QQuickItem *above = item ? item->parentItem() : nullptr; above; above = above->parentItem()) {
        if (above->metaObject()->indexOfProperty(name.constData()) >= 0)
            return above;
    }
    return nullptr;
}

QRectF DeclarativeUtil::mapRect(QQuickItem *from, QQuickItem *to, const QRectF &rect) const
{
    if (from)
        return from->mapRectToItem(to, rect);
    return to ? to->mapRectFromScene(rect) : rect;
}

bool DeclarativeUtil::isVisibleInWindow(QQuickItem *item) const
{
    if (!item || !item->window() || !item->isVisible())
        return false;
    for (QQuickItem *above = item; above; above = above->parentItem()) {
        if (above->opacity() <= 0)
            return false;
    }
    const QRectF inScene = item->mapRectToScene(QRectF(0, 0, item->width(), item->height()));
    const QRectF window(0, 0, item->window()->width(), item->window()->height());
    return inScene.intersects(window);
}

qreal DeclarativeUtil::touchToneLevel() const
{
    return ProfileListener::instance()->touchToneLevel();
}

void DeclarativeUtil::playTouchFeedback()
{
    const qreal level = touchToneLevel();
    if (level > 0)
        Q_EMIT touchFeedback(level);
}

void DeclarativeUtil::showFrameRate(QQuickItem *item, bool shown)
{
    if (item)
        FrameRateOverlay::setShown(item->window(), shown);
}
