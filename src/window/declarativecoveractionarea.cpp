#include "declarativecoveractionarea.h"
#include "core/theme.h"

#include <cmath>

DeclarativeCoverActionArea::DeclarativeCoverActionArea(QQuickItem *cover)
    : QQuickItem(cover)
{
    if (cover) {
        connect(cover, &QQuickItem::widthChanged, this, &DeclarativeCoverActionArea::updateGeometry);
        connect(cover, &QQuickItem::heightChanged, this, &DeclarativeCoverActionArea::updateGeometry);
    }
    updateGeometry();
}

void DeclarativeCoverActionArea::updateGeometry()
{
    QQuickItem *cover = parentItem();
    if (!cover)
        return;
    Pelkan::Theme *theme = Pelkan::Theme::instance();
    const int largeWidth = theme->coverSizeLarge().width();
    const qreal scale = largeWidth > 0 ? cover->width() / largeWidth : 0.0;
    setWidth(cover->width());
    const qreal half = std::round(cover->width() * 0.5);
    const int height = int(theme->itemSizeSmall() * scale);
    setHeight(qMin<qreal>(height, half));
    setY(cover->height() - this->height());
}
