#pragma once

#include "layout/autoscrollcontroller.h"

// HorizontalAutoScroll, attached to the Flickable that clips a single-line field's text:
// scrolls the text sideways with its cursor, animated, so the cursor never leaves the field.
class HorizontalAutoScroll : public AutoScrollController
{
    Q_OBJECT

public:
    explicit HorizontalAutoScroll(QObject *parent = nullptr);

    static HorizontalAutoScroll *qmlAttachedProperties(QObject *object);
};

QML_DECLARE_TYPEINFO(HorizontalAutoScroll, QML_HAS_ATTACHED_PROPERTIES)
