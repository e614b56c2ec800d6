import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The benchmark's baseline: Button's look rooted on a bare MouseArea, press handling
// written in the file as the components did before they had native bases.
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
    onPressed: Private.Util.playTouchFeedback()

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
