import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The gallery's cover on the home screen, with two actions pressed from there.
Cover {
    id: cover

    property int played
    property int skipped

    signal playPressed()
    signal nextPressed()

    transparent: true

    CoverBackground {}

    Text {
        anchors.centerIn: parent
        horizontalAlignment: Text.AlignHCenter
        text: "Gallery\n▶ " + cover.played + "   » " + cover.skipped
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeMedium
    }

    CoverActionList {
        CoverAction {
            iconSource: "image://theme/icon-cover-play"
            onTriggered: cover.playPressed()
        }
        CoverAction {
            iconSource: "image://theme/icon-cover-next"
            onTriggered: cover.nextPressed()
        }
    }
}
