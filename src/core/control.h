#pragma once

#include "item.h"

namespace Pelkan {

class Palette;

// An item that draws with a palette and can be highlighted. Its palette inherits from
// the palette of the nearest ancestor control, so setting a colour on a page recolours
// every control in it that has not set that colour itself. The link is renewed when a
// control moves and when a subtree is added below a control.
class Control : public Item
{
    Q_OBJECT
    Q_PROPERTY(Pelkan::Palette *palette READ palette CONSTANT)
    Q_PROPERTY(bool highlighted READ highlighted WRITE setHighlighted NOTIFY highlightedChanged)

public:
    explicit Control(QQuickItem *parent = nullptr);

    Palette *palette() const { return m_palette; }

    bool highlighted() const { return m_highlighted; }
    void setHighlighted(bool highlighted);

Q_SIGNALS:
    void highlightedChanged();

protected:
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private:
    static void updateControlsBelow(QQuickItem *item);
    void updateInheritedPalette();

    Palette *m_palette;
    bool m_highlighted = false;
};

} // namespace Pelkan
