import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A line of text among menu items, never picked.
Text {
    width: parent ? parent.width : 0
    height: Theme.itemSizeSmall * 0.6
    horizontalAlignment: Text.AlignHCenter
    verticalAlignment: Text.AlignVCenter
    color: Theme.secondaryHighlightColor
    font.pixelSize: Theme.fontSizeSmall
    elide: Text.ElideRight
}
