import QtQuick 2.6
import Quorvane.Pelkan 1.0

// "Deleting in 5 s, tap to cancel" over a list item, counting down what the view's
// RemorseCache holds for the row. Made by ListItem.remorseAction(); a tap cancels.
MouseArea {
    id: remorse

    property Item listItem
    property var cache
    property int row: -1
    property string text
    property int secondsLeft: 0

    anchors.fill: parent
    z: 10

    function refresh() {
        secondsLeft = cache ? Math.ceil(cache.remaining(row) / 1000) : 0
    }

    onClicked: if (cache) cache.cancel(row)
    Component.onCompleted: refresh()

    Timer {
        interval: 200
        repeat: true
        running: remorse.visible
        onTriggered: remorse.refresh()
    }

    Rectangle {
        anchors.fill: parent
        color: Theme.highlightBackgroundColor
        opacity: 0.85
    }
    Text {
        anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
        text: remorse.text + (remorse.text.length ? " " : "") + qsTr("in %1 s, tap to cancel").arg(remorse.secondsLeft)
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeSmall
    }
}
