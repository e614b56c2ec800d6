#pragma once

#include "layout/autoscrollcontroller.h"

// VerticalAutoScroll, attached to a Flickable: keeps the focused field's cursor in view
// above the keyboard as the page scrolls up and down. Text fields attach it to the
// flickable around them when they take focus, so pages of fields need nothing more.
class VerticalAutoScroll : public AutoScrollController
{
    Q_OBJECT

public:
    explicit VerticalAutoScroll(QObject *parent = nullptr);

    static VerticalAutoScroll *qmlAttachedProperties(QObject *object);
};

QML_DECLARE_TYPEINFO(VerticalAutoScroll, QML_HAS_ATTACHED_PROPERTIES)
