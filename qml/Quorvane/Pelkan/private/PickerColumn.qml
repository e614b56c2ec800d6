import QtQuick 2.6
import Quorvane.Pelkan 1.0

// One wheel of a picker: `labels` in a column, the chosen one (`currentIndex`) in the
// middle band and in the highlight colour; flicking snaps to an entry, Up and Down (or a
// screen reader's decrease and increase) pick the entry before or after.
ListView {
    id: column

    signal picked(int index)

    property var labels: []
    // The colours of the picker the wheel belongs to; the theme's without one.
    property QtObject palette: Theme
    readonly property real itemHeight: Theme.itemSizeSmall * 0.8
    // What assistive technology reads of a wheel, as of any value it can step.
    readonly property int value: currentIndex
    readonly property int minimumValue: 0
    readonly property int maximumValue: Math.max(0, count - 1)
    readonly property int stepSize: 1

    function accessibleIncreaseAction() { if (currentIndex + 1 < count) picked(currentIndex + 1) }
    function accessibleDecreaseAction() { if (currentIndex > 0) picked(currentIndex - 1) }

    activeFocusOnTab: true
    Keys.onUpPressed: accessibleDecreaseAction()
    Keys.onDownPressed: accessibleIncreaseAction()
    Accessible.role: Accessible.SpinBox

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
        color: ListView.isCurrentItem ? column.palette.highlightColor : column.palette.primaryColor
        opacity: ListView.isCurrentItem ? 1 : 0.6
        font.pixelSize: Theme.fontSizeLarge

        MouseArea {
            anchors.fill: parent
            onClicked: column.picked(index)
        }
    }
}
