import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// "Clearing in 5 s, tap to cancel" across the top of a page: execute() starts it, the
// action runs when the countdown ends, a tap (or Space or Enter) cancels it.
Private.ButtonBase {
    id: popup

    /*! Whole seconds left until the action runs. */
    property int secondsLeft: 0
    /*! True while a countdown runs. */
    readonly property bool active: countdown.running

    /*! The countdown ended and its action has run. */
    signal triggered()
    /*! The countdown was cancelled; its action does not run. */
    signal canceled()

    /*! Starts the countdown (restarting one that runs); action runs after timeout ms (5000 if
        left out) unless cancelled first. */
    function execute(text, action, timeout) {
        popup.text = text || ""
        internal.action = action
        internal.deadline = Date.now() + (timeout === undefined ? 5000 : timeout)
        secondsLeft = Math.ceil((internal.deadline - Date.now()) / 1000)
        countdown.restart()
    }

    /*! Cancels the running countdown: its action does not run. */
    function cancel() {
        if (!countdown.running)
            return
        countdown.stop()
        internal.action = null
        canceled()
    }

    width: internal.home ? internal.home.width : (parent ? parent.width : 0)
    height: Theme.itemSizeSmall
    visible: active && (!internal.home || internal.home.visible)
    z: 100
    // text: what will happen ("Clearing"), as given to execute(); the whole sentence is the
    // description a screen reader reads out.
    description: label.text
    Private.OverlayBackground.enabled: internal.home !== null
    Private.OverlayBackground.color: Theme.rgba(Theme.highlightBackgroundColor, 0.6)

    onActiveChanged: active ? internal.raise() : internal.lower()
    onClicked: cancel()

    QtObject {
        id: internal
        // The catalogue's sentence; without a catalogue (a build tree) its id, as it is.
        function sentence(what, seconds) {
            var words = what.length ? qsTrId("quorvanepelkan-la-remorse_action") : qsTrId("quorvanepelkan-la-remorse")
            if (words.indexOf("%1") < 0)
                return words
            return what.length ? words.arg(what).arg(seconds) : words.arg(seconds)
        }

        property var action: null
        property double deadline: 0
        // Where it was declared; while counting down it shows in the window's overlay, over
        // a frosted view of the page.
        property Item home: null

        function raise() {
            var window = Private.Util.findAncestor(popup, "overlay")
            if (!window || !window.overlay || home)
                return
            home = popup.parent
            var at = home.mapToItem(window.overlay, 0, 0)
            popup.parent = window.overlay
            popup.x = at.x
            popup.y = at.y
        }

        function lower() {
            if (!home)
                return
            var declared = home
            home = null
            popup.parent = declared
            popup.x = 0
            popup.y = 0
        }
    }

    Timer {
        id: countdown
        interval: 50
        repeat: true
        onTriggered: {
            var left = internal.deadline - Date.now()
            popup.secondsLeft = Math.ceil(left / 1000)
            if (left > 0)
                return
            stop()
            var action = internal.action
            internal.action = null
            if (action)
                action()
            popup.triggered()
        }
    }

    // Outside a window with an overlay, a plain opaque background.
    Rectangle {
        id: plain
        anchors.fill: popup
        visible: internal.home === null
        color: Theme.rgba(Theme.overlayBackgroundColor, 1)
        Rectangle {
            anchors.fill: plain
            color: Theme.highlightBackgroundColor
            opacity: 0.3
        }
    }
    Text {
        id: label
        // By id, not parent: bindings may run again while the popup is torn down.
        anchors {
            left: popup.left
            right: popup.right
            leftMargin: Theme.horizontalPageMargin
            rightMargin: Theme.horizontalPageMargin
            verticalCenter: popup.verticalCenter
        }
        elide: Text.ElideRight
        text: internal.sentence(popup.text, popup.secondsLeft)
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeSmall
    }
}
