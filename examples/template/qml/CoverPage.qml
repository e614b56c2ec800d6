import QtQuick 2.6
import Quorvane.Pelkan 1.0

Cover {
    transparent: true

    Text {
        anchors.centerIn: parent
        text: "My application"
        color: Theme.primaryColor
        font.pixelSize: Theme.fontSizeMedium
    }

    CoverActionList {
        CoverAction {
            iconSource: "image://theme/icon-cover-refresh"
            onTriggered: console.log("application: cover action")
        }
    }
}
