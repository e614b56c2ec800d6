import QtQuick 2.6
import Quorvane.Pelkan 1.0

Text {
    width: parent.width
    topPadding: Theme.paddingLarge
    bottomPadding: Theme.paddingSmall
    horizontalAlignment: Text.AlignRight
    color: Theme.highlightColor
    font.pixelSize: Theme.fontSizeSmall
}
