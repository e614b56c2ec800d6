import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype MenuItem
    \inqmlmodule Quorvane.Pelkan
    \brief An entry of a pull-down, push-up or context menu: its `text`, centred.

    Highlighted while the finger would pick it (pulley menus pick on release, once the
    content has settled) or while pressed. In a context menu a tap, or Space, Enter and
    Return while it is focused, picks it: the menu closes and clicked() follows. Its menu is
    the Private.MenuColumn it sits in. Tab reaches the items of a context menu; those of a
    pulley menu, out of sight beyond the content's edge, it passes by.
*/
Private.ButtonBase {
    id: item

    /*! The colour of the text; the palette's highlight colour while highlighted, its primary
        colour otherwise, until set. */
    property color color: highlighted ? palette.highlightColor : palette.primaryColor

    accessibleRole: Accessible.MenuItem
    width: parent ? parent.width : 0
    height: Theme.itemSizeSmall * 0.75
    opacity: enabled ? 1 : 0.4
    highlighted: (internal.menu !== null && internal.menu.highlightedItem === item) || down || visualFocus

    // A menu that picks by a tap hears of it before clicked(), so that it closes first.
    onReleased: if (internal.menu !== null && internal.menu.tapToPick) internal.menu.picked(item)

    QtObject {
        id: internal
        readonly property Private.MenuColumn menu: item.parent instanceof Private.MenuColumn ? item.parent : null
    }

    Text {
        anchors { fill: parent; leftMargin: Theme.paddingMedium; rightMargin: Theme.paddingMedium }
        horizontalAlignment: Text.AlignHCenter
        verticalAlignment: Text.AlignVCenter
        text: item.text
        color: item.color
        font.pixelSize: Theme.fontSizeMedium
        elide: Text.ElideRight
    }
}
