import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The title of a section of a list, at its right.
Text {
    width: parent ? parent.width - 2 * Theme.horizontalPageMargin : 0
    x: Theme.horizontalPageMargin
    height: Theme.itemSizeSmall * 0.75
    horizontalAlignment: Text.AlignRight
    verticalAlignment: Text.AlignVCenter
    color: Theme.highlightColor
    font.pixelSize: Theme.fontSizeSmall
    elide: Text.ElideRight
}
