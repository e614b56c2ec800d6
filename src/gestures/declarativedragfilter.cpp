#include "declarativedragfilter.h"

#include "enums/declarativepagenavigation.h"

#include <QQuickItem>

DeclarativeDragFilter::DeclarativeDragFilter(QObject *parent)
    : QObject(parent)
{
}

DeclarativeDragFilter *DeclarativeDragFilter::qmlAttachedProperties(QObject *object)
{
    return new DeclarativeDragFilter(object);
}

void DeclarativeDragFilter::setOrientations(Qt::Orientations orientations)
{
    if (orientations == m_orientations)
        return;
    m_orientations = orientations;
    Q_EMIT orientationsChanged();
}

void DeclarativeDragFilter::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return;
    m_enabled = enabled;
    Q_EMIT enabledChanged();
}

void DeclarativeDragFilter::setReleasedNavigation(int navigation)
{
    if (navigation == m_releasedNavigation)
        return;
    m_releasedNavigation = navigation;
    Q_EMIT releasedNavigationChanged();
}

int DeclarativeDragFilter::released(QQuickItem *item, const QQuickItem *boundary, Qt::Orientation orientation)
{
    int released = DeclarativePageNavigation::Back | DeclarativePageNavigation::Forward;
    for (; item && item != boundary; item = item->parentItem()) {
        auto filter = qobject_cast<DeclarativeDragFilter *>(qmlAttachedPropertiesObject<DeclarativeDragFilter>(item, false));
        if (filter && filter->enabled() && (filter->orientations() & orientation))
            released &= filter->releasedNavigation();
    }
    return released;
}

Qt::Orientations DeclarativeDragFilter::claimed(QQuickItem *item, const QQuickItem *boundary)
{
    Qt::Orientations orientations;
    for (; item && item != boundary; item = item->parentItem()) {
        auto filter = qobject_cast<DeclarativeDragFilter *>(qmlAttachedPropertiesObject<DeclarativeDragFilter>(item, false));
        if (filter && filter->enabled())
            orientations |= filter->orientations();
    }
    return orientations;
}
