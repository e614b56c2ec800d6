import QtQuick 2.6
import Quorvane.Pelkan 1.0

// One wheel of a picker: `labels` in a column, the chosen one (`currentIndex`) in the
// middle band and in the highlight colour; flicking snaps to an entry.
ListView {
    id: column

    signal picked(int index)

    property var labels: []
    readonly property real itemHeight: Theme.itemSizeSmall * 0.8

    width: Theme.itemSizeLarge
    height: itemHeight * 3
    clip: true
    model: labels
    snapMode: ListView.SnapToItem
    highlightRangeMode: ListView.StrictlyEnforceRange
    preferredHighlightBegin: itemHeight
    preferredHighlightEnd: itemHeight * 2
    highlightMoveDuration: 150
    boundsBehavior: Flickable.StopAtBounds
    onMovementEnded: picked(currentIndex)

    delegate: Text {
        width: column.width
        height: column.itemHeight
        horizontalAlignment: Text.AlignHCenter
        verticalAlignment: Text.AlignVCenter
        text: modelData
        color: ListView.isCurrentItem ? Theme.highlightColor : Theme.primaryColor
        opacity: ListView.isCurrentItem ? 1 : 0.6
        font.pixelSize: Theme.fontSizeLarge

        MouseArea {
            anchors.fill: parent
            onClicked: column.picked(index)
        }
    }
}
