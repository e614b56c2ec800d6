#include "horizontalautoscroll.h"

HorizontalAutoScroll::HorizontalAutoScroll(QObject *parent)
    : AutoScrollController(parent)
{
    setOrientation(Qt::Horizontal);
}

HorizontalAutoScroll *HorizontalAutoScroll::qmlAttachedProperties(QObject *object)
{
    return new HorizontalAutoScroll(object);
}
