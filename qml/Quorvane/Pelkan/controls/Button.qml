import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A push button: its text on a rounded, translucent background; highlighted while pressed
// (or while `down` is set), clicked on release inside. Lay several out with ButtonLayout.
MouseArea {
    id: button

    property string text
    property bool down: pressed && containsMouse
    property color color: Theme.primaryColor
    property color highlightColor: Theme.highlightColor
    property color backgroundColor: Theme.rgba(color, 0.2)
    property color highlightBackgroundColor: Theme.rgba(Theme.highlightBackgroundColor, 0.5)

    implicitWidth: Math.max(Theme.itemSizeExtraLarge * 1.5, label.implicitWidth + 2 * Theme.paddingLarge)
    implicitHeight: Theme.itemSizeSmall * 0.75
    opacity: enabled ? 1 : 0.4
    onPressed: Private.Util.playTouchFeedback() // a touch tone at the profile's level

    Rectangle {
        anchors.fill: parent
        radius: height / 2
        color: button.down ? button.highlightBackgroundColor : button.backgroundColor
    }

    Text {
        id: label
        anchors.centerIn: parent
        width: Math.min(implicitWidth, button.width - 2 * Theme.paddingMedium)
        text: button.text
        color: button.down ? button.highlightColor : button.color
        font.pixelSize: Theme.fontSizeMedium
        elide: Text.ElideRight
    }
}
