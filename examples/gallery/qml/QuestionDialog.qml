import QtQuick 2.6
import Quorvane.Pelkan 1.0

// Asks for a name: accepted only with one, by the header's button or a swipe to the left.
Dialog {
    id: dialog

    property alias name: field.text

    canAccept: field.text.length > 0

    Column {
        width: dialog.width
        spacing: Theme.paddingLarge

        DialogHeader { title: "Your name" }

        Rectangle {
            x: Theme.horizontalPageMargin
            width: parent.width - 2 * Theme.horizontalPageMargin
            height: Theme.itemSizeSmall
            color: "transparent"
            border.color: field.activeFocus ? Theme.highlightColor : Theme.secondaryColor
            radius: Theme.paddingSmall

            TextInput {
                id: field
                objectName: "name"
                anchors { fill: parent; margins: Theme.paddingMedium }
                verticalAlignment: TextInput.AlignVCenter
                color: Theme.primaryColor
                font.pixelSize: Theme.fontSizeMedium
                focus: true
                EnterKey.text: "Accept"
                EnterKey.enabled: dialog.canAccept
                EnterKey.onClicked: dialog.accept()
            }
        }

        Text {
            x: Theme.horizontalPageMargin
            width: parent.width - 2 * Theme.horizontalPageMargin
            wrapMode: Text.Wrap
            color: Theme.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            text: "Swipe left to accept, right to cancel."
        }
    }
}
