#include "declarativecoveractionarea.h"
#include "theme.h"

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
    const qreal scale = cover->width() / theme->coverSizeLarge().width();
    setWidth(cover->width());
    const qreal half = std::round(cover->width() * 0.5);
    const int height = int(theme->itemSizeSmall() * scale);
    setHeight(qMin<qreal>(height, half));
    setY(cover->height() - this->height());
}
