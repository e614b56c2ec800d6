import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The title of a page, at its top right, with an optional description below.
Item {
    id: header

    property string title
    property string description
    property alias titleColor: titleLabel.color

    width: parent ? parent.width : 0
    height: Math.max(Theme.itemSizeLarge, column.height + 2 * Theme.paddingMedium)

    Column {
        id: column
        anchors {
            right: header.right
            rightMargin: Theme.horizontalPageMargin
            left: header.left
            leftMargin: Theme.horizontalPageMargin
            verticalCenter: header.verticalCenter
        }

        Text {
            id: titleLabel
            width: parent.width
            horizontalAlignment: Text.AlignRight
            text: header.title
            color: Theme.highlightColor
            font.pixelSize: Theme.fontSizeLarge
            elide: Text.ElideRight
        }
        Text {
            width: parent.width
            horizontalAlignment: Text.AlignRight
            visible: text.length > 0
            text: header.description
            color: Theme.secondaryHighlightColor
            font.pixelSize: Theme.fontSizeSmall
            elide: Text.ElideRight
        }
    }
}
