import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype DialogHeader
    \inqmlmodule Quorvane.Pelkan
    \brief The top of a dialog: cancel at the start, accept at the end, an optional title.

    Cancel rejects the dialog, accept accepts it (only while the dialog's canAccept is true).
    Both are buttons: a tap, or Space, Enter and Return while focused. The words come from the
    catalogue unless given; cancel sits on the left, on the right when mirrored.
*/
Private.ControlBase {
    id: header

    /*! The dialog the buttons close; the nearest dialog above the header until set. */
    property Item dialog: internal.findDialog()
    /*! A title under the buttons; none until set. */
    property string title
    /*! The accept button's words. */
    property string acceptText: qsTrId("quorvanepelkan-bt-accept")
    /*! The cancel button's words. */
    property string cancelText: qsTrId("quorvanepelkan-bt-cancel")

    text: title
    accessibleRole: Accessible.ToolBar
    width: parent ? parent.width : 0
    height: Theme.itemSizeLarge + (title.length > 0 ? titleLabel.height : 0)

    QtObject {
        id: internal
        function findDialog() {
            for (var item = header.parent; item; item = item.parent) {
                if (item.hasOwnProperty("canAccept") && item.hasOwnProperty("accept"))
                    return item
            }
            return null
        }
    }

    GlassBackground {
        anchors.fill: parent
        radius: 0
        color: Theme.rgba(header.palette.highlightBackgroundColor, 0.1)
    }

    Private.ButtonBase {
        id: cancelButton
        objectName: "cancel"
        anchors.left: parent.left
        width: parent.width / 2
        height: Theme.itemSizeLarge
        text: header.cancelText
        onClicked: if (header.dialog) header.dialog.reject()

        Text {
            anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
            text: cancelButton.text
            color: cancelButton.down || cancelButton.visualFocus ? header.palette.highlightColor : header.palette.primaryColor
            font.pixelSize: Theme.fontSizeLarge
        }
    }

    Private.ButtonBase {
        id: acceptButton
        objectName: "accept"
        anchors.right: parent.right
        width: parent.width / 2
        height: Theme.itemSizeLarge
        text: header.acceptText
        enabled: !header.dialog || header.dialog.canAccept
        onClicked: if (header.dialog) header.dialog.accept()

        Text {
            anchors { right: parent.right; rightMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
            text: acceptButton.text
            color: acceptButton.down || acceptButton.visualFocus ? header.palette.highlightColor : header.palette.primaryColor
            opacity: acceptButton.enabled ? 1 : 0.4
            font.pixelSize: Theme.fontSizeLarge
        }
    }

    Text {
        id: titleLabel
        anchors { top: acceptButton.bottom; right: header.right; rightMargin: Theme.horizontalPageMargin }
        visible: header.title.length > 0
        text: header.title
        color: header.palette.highlightColor
        font.pixelSize: Theme.fontSizeLarge
    }
}
