#include "verticalautoscroll.h"

VerticalAutoScroll::VerticalAutoScroll(QObject *parent)
    : AutoScrollController(parent)
{
    setOrientation(Qt::Vertical);
}

VerticalAutoScroll *VerticalAutoScroll::qmlAttachedProperties(QObject *object)
{
    return new VerticalAutoScroll(object);
}
