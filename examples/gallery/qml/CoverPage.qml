import QtQuick 2.6
import Quorvane.Pelkan 1.0

// An application cover with two actions. The actions are on the session bus: press one
// from a shell with examples/trigger-cover-action (the bus name is shown below).
Item {
    id: page
    property int played: 0
    property int skipped: 0

    Cover {
        id: cover
        anchors.horizontalCenter: parent.horizontalCenter
        y: Theme.paddingLarge
        width: Theme.coverSizeLarge.width
        height: Theme.coverSizeLarge.height

        Rectangle {
            anchors.fill: parent
            radius: Theme.paddingMedium
            color: Theme.rgba(Theme.highlightBackgroundColor, 0.3)
            border.color: Theme.secondaryColor
        }
        Text {
            anchors { top: parent.top; topMargin: Theme.paddingLarge; horizontalCenter: parent.horizontalCenter }
            horizontalAlignment: Text.AlignHCenter
            text: "Player\n▶ " + page.played + "   » " + page.skipped
            color: Theme.primaryColor
            font.pixelSize: Theme.fontSizeMedium
        }
        Row {
            // Laid out in the cover's action strip.
            x: cover.coverActionArea.x
            y: cover.coverActionArea.y
            width: cover.coverActionArea.width
            height: cover.coverActionArea.height
            Repeater {
                model: 2
                Text {
                    width: parent.width / 2
                    height: parent.height
                    horizontalAlignment: Text.AlignHCenter
                    verticalAlignment: Text.AlignVCenter
                    text: index === 0 ? "▶" : "»"
                    color: Theme.highlightColor
                    font.pixelSize: Theme.fontSizeLarge
                }
            }
        }

        CoverActionList {
            id: actions
            iconBackground: true
            CoverAction {
                iconSource: "image://theme/icon-cover-play"
                onTriggered: page.played++
            }
            CoverAction {
                iconSource: "image://theme/icon-cover-next"
                onTriggered: page.skipped++
            }
        }
    }

    Column {
        anchors { top: cover.bottom; topMargin: Theme.paddingLarge; left: parent.left; right: parent.right
                  leftMargin: Theme.horizontalPageMargin; rightMargin: Theme.horizontalPageMargin }
        spacing: Theme.paddingSmall

        Text {
            width: parent.width
            wrapMode: Text.Wrap
            color: Theme.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            text: "Cover status: " + ["inactive", "activating", "active", "deactivating"][cover.status]
                  + "\nSize: " + (cover.size === Cover.Large ? "large" : "small")
        }
        Text {
            width: parent.width
            wrapMode: Text.WrapAnywhere
            color: Theme.primaryColor
            font.pixelSize: Theme.fontSizeSmall
            text: "Press the first action from a shell:\nexamples/trigger-cover-action 0"
        }
    }
}
