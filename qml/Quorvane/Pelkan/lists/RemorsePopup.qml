import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// "Clearing in 5 s, tap to cancel" across the top of a page: execute() starts it, the
// action runs when the countdown ends, a tap cancels it.
MouseArea {
    id: popup

    property string text
    property int secondsLeft: 0
    readonly property bool active: countdown.running
    property var _action: null
    property double _deadline: 0
    // Where it was declared; while counting down it shows in the window's overlay, over a
    // frosted view of the page.
    property Item _home: null

    signal triggered()
    signal canceled()

    width: _home ? _home.width : (parent ? parent.width : 0)
    height: Theme.itemSizeSmall
    visible: active && (!_home || _home.visible)
    z: 100
    Private.OverlayBackground.enabled: _home !== null
    Private.OverlayBackground.color: Theme.rgba(Theme.highlightBackgroundColor, 0.6)

    onActiveChanged: active ? _raise() : _lower()

    function _raise() {
        var window = Private.Util.findAncestor(popup, "overlay")
        if (!window || !window.overlay || _home)
            return
        _home = parent
        var at = _home.mapToItem(window.overlay, 0, 0)
        parent = window.overlay
        x = at.x
        y = at.y
    }

    function _lower() {
        if (!_home)
            return
        var home = _home
        _home = null
        parent = home
        x = 0
        y = 0
    }

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

    // Outside a window with an overlay, a plain background.
    Rectangle {
        anchors.fill: parent
        visible: popup._home === null
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
