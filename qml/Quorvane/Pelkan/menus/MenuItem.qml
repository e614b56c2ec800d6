import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// An entry of a pull-down, push-up or context menu: centred text, highlighted while the
// finger would pick it (pulley menus pick on release, context menus on a tap). Its menu is
// the Private.MenuColumn it sits in.
Text {
    id: item

    /*! Emitted when the item is picked: tapped in a context menu, or let go on in a pulley
        menu once the content has settled at its edge. */
    signal clicked()
    /*! True while the item would run if the finger let go now, or while it is pressed. */
    readonly property bool highlighted: (internal.menu !== null && internal.menu.highlightedItem === item) || tap.pressed

    width: parent ? parent.width : 0
    height: Theme.itemSizeSmall * 0.75
    horizontalAlignment: Text.AlignHCenter
    verticalAlignment: Text.AlignVCenter
    color: highlighted ? Theme.highlightColor : Theme.primaryColor
    opacity: enabled ? 1 : 0.4
    font.pixelSize: Theme.fontSizeMedium

    Accessible.role: Accessible.MenuItem
    Accessible.name: text
    Accessible.onPressAction: if (enabled) item.clicked()

    QtObject {
        id: internal
        readonly property Private.MenuColumn menu: item.parent instanceof Private.MenuColumn ? item.parent : null
    }

    MouseArea {
        id: tap
        anchors.fill: item
        enabled: internal.menu !== null && internal.menu.tapToPick
        onPressed: Private.Util.playTouchFeedback()
        onClicked: {
            internal.menu.picked(item)
            item.clicked()
        }
    }
}
