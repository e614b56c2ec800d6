import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// "Deleting in 5 s, tap to cancel" over a list row, for as long as its countdown runs.
// Made by ListItem.remorseAction(), which gives it the countdown the view keeps for the row;
// a tap (or Space or Enter) cancels the countdown. Opaque, so that the row's own content
// never shows through.
Private.ButtonBase {
    id: remorse

    /*! The countdown shown: a RemorseCountdown from the view's RemorseCache. */
    property QtObject countdown: null
    /*! Whole seconds left until the action runs. */
    readonly property int secondsLeft: internal.secondsLeft

    /*! Cancels the countdown: its action does not run. */
    function cancel() {
        if (countdown)
            countdown.cancel()
    }

    anchors.fill: parent
    z: 10
    visible: countdown !== null && countdown.row >= 0
    // What will happen ("Deleting"), as given to remorseAction(); the whole sentence is what a
    // screen reader reads out as its description.
    text: countdown ? countdown.text : ""
    description: label.text
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
        property int secondsLeft: 0
        function refresh() {
            secondsLeft = remorse.countdown ? Math.ceil(remorse.countdown.remaining() / 1000) : 0
        }
    }

    onCountdownChanged: internal.refresh()
    Component.onCompleted: internal.refresh()

    Timer {
        interval: 200
        repeat: true
        running: remorse.visible && remorse.countdown !== null
        onTriggered: internal.refresh()
    }

    // An opaque ground first: the row's content must not show through the words.
    Rectangle {
        anchors.fill: remorse
        color: Theme.rgba(Theme.overlayBackgroundColor, 1)
    }
    Rectangle {
        anchors.fill: remorse
        color: Theme.highlightBackgroundColor
        opacity: 0.3
    }
    Text {
        id: label
        anchors {
            left: remorse.left
            right: remorse.right
            leftMargin: Theme.horizontalPageMargin
            rightMargin: Theme.horizontalPageMargin
            verticalCenter: remorse.verticalCenter
        }
        horizontalAlignment: Text.AlignLeft
        elide: Text.ElideRight
        text: internal.sentence(remorse.text, remorse.secondsLeft)
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeSmall
    }
}
