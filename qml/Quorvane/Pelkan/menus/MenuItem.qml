import QtQuick 2.6
import Quorvane.Pelkan 1.0

// An entry of a pull-down menu: centred text, highlighted while the finger would pick it.
Text {
    id: item

    signal clicked()
    readonly property bool highlighted: parent && parent.parent && parent.parent.highlightedItem === item

    width: parent ? parent.width : 0
    height: Theme.itemSizeSmall * 0.75
    horizontalAlignment: Text.AlignHCenter
    verticalAlignment: Text.AlignVCenter
    color: highlighted ? Theme.highlightColor : Theme.primaryColor
    opacity: enabled ? 1 : 0.4
    font.pixelSize: Theme.fontSizeMedium
}
