#include "control.h"
#include "palette.h"

namespace Pelkan {

Control::Control(QQuickItem *parent)
    : Item(parent)
    , m_palette(new Palette(this))
{
    updateInheritedPalette();
}

void Control::setHighlighted(bool highlighted)
{
    if (m_highlighted == highlighted)
        return;
    m_highlighted = highlighted;
    Q_EMIT highlightedChanged();
}

void Control::itemChange(ItemChange change, const ItemChangeData &data)
{
    Item::itemChange(change, data);
    if (change == ItemParentHasChanged) {
        // Controls below keep inheriting from this one; only this one may have moved.
        updateInheritedPalette();
    } else if (change == ItemChildAddedChange && data.item) {
        // A plain item may bring a subtree of controls that now inherit from this one.
        if (auto control = qobject_cast<Control *>(data.item))
            control->updateInheritedPalette();
        else
            updateControlsBelow(data.item);
    }
}

void Control::updateControlsBelow(QQuickItem *item)
{
    for (QQuickItem *child : item->childItems()) {
        if (auto control = qobject_cast<Control *>(child))
            control->updateInheritedPalette();
        else
            updateControlsBelow(child);
    }
}

void Control::updateInheritedPalette()
{
    Control *ancestor = findAncestor<Control>();
    m_palette->setInheritedPalette(ancestor ? ancestor->palette() : nullptr);
}

} // namespace Pelkan
