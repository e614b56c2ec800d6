#include "declarativeutil.h"
#include "rendering/debug/framerateoverlay.h"

#include "services/profilelistener.h"

#include <QHash>
#include <QQuickItem>
#include <QVector>
#include <private/qquickflickable_p.h>
#include <QQuickWindow>

DeclarativeUtil::DeclarativeUtil(QObject *parent)
    : QObject(parent)
{
    connect(ProfileListener::instance(), &ProfileListener::changed, this, &DeclarativeUtil::touchToneLevelChanged);
}

namespace {

QQuickItem *parentOf(QObject *object)
{
    auto item = qobject_cast<QQuickItem *>(object);
    return item ? item->parentItem() : nullptr;
}

// Whether objects of a class have a property, asked of the meta-object once per class and
// name: a walk asks at every level, and indexOfProperty compares the name with each of an
// item's sixty-odd properties. Every instance of a QML type has a meta-object of its own,
// but all share the class name, which is unique to the type: the table is keyed by the
// name's address and checks the name itself on a hit. GUI thread only.
bool hasProperty(const QMetaObject *meta, const QByteArray &name)
{
    struct Answer {
        QByteArray property;
        bool has;
    };
    struct Type {
        QByteArray className;
        QVector<Answer> answers;
    };
    static QHash<const char *, Type> known;
    const char *className = meta->className();
    Type &type = known[className];
    if (type.className != className) { // new, or the address now names another type
        type.className = className;
        type.answers.clear();
    }
    for (const Answer &answer : qAsConst(type.answers)) {
        if (answer.property == name)
            return answer.has;
    }
    const bool has = meta->indexOfProperty(name.constData()) >= 0;
    if (type.answers.size() < 64) // names come from QML: keep the table bounded
        type.answers.append({ name, has });
    return has;
}

} // namespace

QObject *DeclarativeUtil::findFlickable(QObject *item) const
{
    for (QQuickItem *above = parentOf(item); above; above = above->parentItem()) {
        if (qobject_cast<QQuickFlickable *>(above))
            return above;
    }
    return nullptr;
}

QObject *DeclarativeUtil::findPage(QObject *item) const
{
    // A page is what the page stack gives a status and an orientation.
    for (QQuickItem *above = parentOf(item); above; above = above->parentItem()) {
        static const QByteArray pageStack("pageStack"), status("status"), orientations("allowedOrientations");
        const QMetaObject *meta = above->metaObject();
        if (hasProperty(meta, pageStack) && hasProperty(meta, status) && hasProperty(meta, orientations))
            return above;
    }
    return nullptr;
}

QObject *DeclarativeUtil::findAncestor(QObject *item, const QString &property) const
{
    const QByteArray name = property.toUtf8();
    for (QQuickItem *above = parentOf(item); above; above = above->parentItem()) {
        if (hasProperty(above->metaObject(), name))
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
