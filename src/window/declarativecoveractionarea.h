#pragma once

#include <QQuickItem>

// The strip along the bottom of a cover where the cover action buttons sit. It keeps its
// height in proportion to the cover: the small item size scaled by how the cover compares
// to the large cover size, but never more than half the cover's width.
class DeclarativeCoverActionArea : public QQuickItem
{
    Q_OBJECT

public:
    explicit DeclarativeCoverActionArea(QQuickItem *cover);

    void updateGeometry();
};
