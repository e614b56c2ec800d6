import QtQuick 2.6
import Quorvane.Pelkan 1.0

// "Clearing in 5 s, tap to cancel" across the top of a page: execute() starts it, the
// action runs when the countdown ends, a tap cancels it.
MouseArea {
    id: popup

    property string text
    property int secondsLeft: 0
    readonly property bool active: countdown.running
    property var _action: null
    property double _deadline: 0

    signal triggered()
    signal canceled()

    width: parent ? parent.width : 0
    height: Theme.itemSizeSmall
    visible: active
    z: 100

    function execute(text, action, timeout) {
        popup.text = text || ""
        _action = action
        _deadline = Date.now() + (timeout === undefined ? 5000 : timeout)
        secondsLeft = Math.ceil((_deadline - Date.now()) / 1000)
        countdown.restart()
    }

    function cancel() {
        if (!countdown.running)
            return
        countdown.stop()
        _action = null
        canceled()
    }

    onClicked: cancel()

    Timer {
        id: countdown
        interval: 50
        repeat: true
        onTriggered: {
            var left = popup._deadline - Date.now()
            popup.secondsLeft = Math.ceil(left / 1000)
            if (left > 0)
                return
            stop()
            var action = popup._action
            popup._action = null
            if (action)
                action()
            popup.triggered()
        }
    }

    Rectangle {
        anchors.fill: parent
        color: Theme.highlightBackgroundColor
        opacity: 0.9
    }
    Text {
        anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
        text: popup.text + (popup.text.length ? " " : "") + qsTr("in %1 s, tap to cancel").arg(popup.secondsLeft)
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeSmall
    }
}
