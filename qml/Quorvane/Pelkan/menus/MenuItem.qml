import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// An entry of a pull-down, push-up or context menu: centred text, highlighted while the
// finger would pick it (pulley menus pick on release, context menus on a tap).
Text {
    id: item

    signal clicked()
    readonly property Item _menu: parent && parent.hasOwnProperty("_tapToPick") ? parent
                                  : parent && parent.parent && parent.parent.hasOwnProperty("highlightedItem") ? parent.parent : null
    readonly property bool highlighted: (_menu && _menu.highlightedItem === item) || tap.pressed

    width: parent ? parent.width : 0
    height: Theme.itemSizeSmall * 0.75
    horizontalAlignment: Text.AlignHCenter
    verticalAlignment: Text.AlignVCenter
    color: highlighted ? Theme.highlightColor : Theme.primaryColor
    opacity: enabled ? 1 : 0.4
    font.pixelSize: Theme.fontSizeMedium

    MouseArea {
        id: tap
        anchors.fill: parent
        enabled: !!item._menu && item._menu._tapToPick === true
        onPressed: Private.Util.playTouchFeedback()
        onClicked: {
            item.clicked()
            item._menu._picked(item)
        }
    }
}
