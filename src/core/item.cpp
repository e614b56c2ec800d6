#include "item.h"

namespace Pelkan {

Item::Item(QQuickItem *parent)
    : QQuickItem(parent)
{
}

} // namespace Pelkan
