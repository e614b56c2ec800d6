import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The quick-scroll button of a long list: it appears at the right edge after fast or long
// scrolling and takes the view to the top (or bottom) when tapped. Declare it beside the
// flickable and set `flickable`.
Private.QuickScrollButtonBase {
    id: button

    QtObject {
        id: internal
        readonly property bool up: button.direction === Qt.UpArrow
    }

    width: Theme.itemSizeSmall
    height: Theme.itemSizeSmall
    x: flickable ? flickable.x + flickable.width - width - Theme.paddingMedium : 0
    y: !flickable ? 0 : internal.up ? flickable.y + Theme.paddingLarge : flickable.y + flickable.height - height - Theme.paddingLarge
    z: 50
    opacity: active ? 1 : 0
    // Tappable from the moment it starts to appear (an animator sets opacity only at its end).
    visible: active || opacity > 0
    Behavior on opacity { OpacityAnimator { duration: 200 } }

    Rectangle {
        anchors.fill: parent
        radius: width / 2
        color: Theme.highlightBackgroundColor
        opacity: area.pressed ? 0.9 : 0.6
    }
    Text {
        anchors.centerIn: parent
        text: internal.up ? "\u2191" : "\u2193"
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeLarge
    }
    Private.ButtonBase {
        id: area
        anchors.fill: parent
        enabled: button.active
        text: internal.up ? qsTrId("quorvanepelkan-bt-scroll_to_top") : qsTrId("quorvanepelkan-bt-scroll_to_bottom")
        onClicked: button.scroll()
    }
}
