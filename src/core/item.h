#pragma once

#include <QQuickItem>

namespace Pelkan {

// Base of the toolkit's visual items.
class Item : public QQuickItem
{
    Q_OBJECT

public:
    explicit Item(QQuickItem *parent = nullptr);

    // The nearest item above this one (not this one) that is a T, or null.
    template <typename T>
    T *findAncestor() const
    {
        for (QQuickItem *item = parentItem(); item; item = item->parentItem()) {
            if (T *match = qobject_cast<T *>(item))
                return match;
        }
        return nullptr;
    }
};

} // namespace Pelkan
