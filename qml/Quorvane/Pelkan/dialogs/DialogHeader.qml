import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The top of a dialog: cancel on the left, accept on the right, an optional title below.
// The texts come from the catalogue unless given.
Item {
    id: header

    property Item dialog: _findDialog()
    property string title
    property string acceptText: qsTrId("quorvanepelkan-bt-accept")
    property string cancelText: qsTrId("quorvanepelkan-bt-cancel")

    width: parent ? parent.width : 0
    height: Theme.itemSizeLarge + (title.length > 0 ? titleLabel.height : 0)

    function _findDialog() {
        for (var item = parent; item; item = item.parent) {
            if (item.hasOwnProperty("canAccept") && item.hasOwnProperty("accept"))
                return item
        }
        return null
    }

    GlassBackground {
        anchors.fill: parent
        radius: 0
        color: Theme.rgba(Theme.highlightBackgroundColor, 0.1)
    }

    MouseArea {
        id: cancelButton
        objectName: "cancel"
        width: parent.width / 2
        height: Theme.itemSizeLarge
        onClicked: if (header.dialog) header.dialog.reject()

        Text {
            anchors { left: cancelButton.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: cancelButton.verticalCenter }
            text: header.cancelText
            color: cancelButton.pressed ? Theme.highlightColor : Theme.primaryColor
            font.pixelSize: Theme.fontSizeLarge
        }
    }

    MouseArea {
        id: acceptButton
        objectName: "accept"
        x: parent.width / 2
        width: parent.width / 2
        height: Theme.itemSizeLarge
        enabled: !header.dialog || header.dialog.canAccept
        onClicked: if (header.dialog) header.dialog.accept()

        Text {
            anchors { right: acceptButton.right; rightMargin: Theme.horizontalPageMargin; verticalCenter: acceptButton.verticalCenter }
            text: header.acceptText
            color: acceptButton.pressed ? Theme.highlightColor : Theme.primaryColor
            opacity: acceptButton.enabled ? 1 : 0.4
            font.pixelSize: Theme.fontSizeLarge
        }
    }

    Text {
        id: titleLabel
        anchors { top: acceptButton.bottom; right: header.right; rightMargin: Theme.horizontalPageMargin }
        visible: header.title.length > 0
        text: header.title
        color: Theme.highlightColor
        font.pixelSize: Theme.fontSizeLarge
    }
}
