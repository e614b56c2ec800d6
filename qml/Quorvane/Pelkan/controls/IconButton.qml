import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A theme icon that acts as a button: drawn in the primary colour, in the highlight
// colour while pressed or `down`, dimmed while disabled. `iconSource` is a theme icon
// ("image://theme/icon-m-close"); the tint is added here.
MouseArea {
    id: button

    property string iconSource
    property bool down: pressed && containsMouse
    property color color: Theme.primaryColor
    property color highlightColor: Theme.highlightColor

    implicitWidth: Theme.itemSizeSmall
    implicitHeight: Theme.itemSizeSmall
    opacity: enabled ? 1 : 0.4
    onPressed: Private.Util.playTouchFeedback() // a touch tone at the profile's level

    Image {
        anchors.centerIn: parent
        width: Math.min(button.width, Theme.iconSizeMedium)
        height: width
        sourceSize: Qt.size(width, height)
        source: button.iconSource === "" ? ""
              : button.iconSource + (button.iconSource.indexOf("?") < 0 ? "?" : "")
                + (button.down ? button.highlightColor : button.color)
    }
}
