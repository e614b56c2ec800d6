import QtQuick 2.6
import Quorvane.Pelkan 1.0

Page {
    id: page

    property int greetings: 0

    onStatusChanged: if (status === PageStatus.Active) console.log("application: first page active")

    Flickable {
        anchors.fill: parent
        contentHeight: column.height

        PullDownMenu {
            MenuItem {
                text: "Say hello"
                onClicked: page.greetings++
            }
        }

        Column {
            id: column
            width: page.width

            PageHeader { title: "My application" }

            Text {
                x: Theme.horizontalPageMargin
                width: parent.width - 2 * Theme.horizontalPageMargin
                wrapMode: Text.Wrap
                text: page.greetings === 0 ? "Pull down for the menu." : "Hello, " + page.greetings + " times."
                color: Theme.highlightColor
                font.pixelSize: Theme.fontSizeLarge
            }
        }
    }
}
