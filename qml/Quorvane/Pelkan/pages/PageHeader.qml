import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype PageHeader
    \inqmlmodule Quorvane.Pelkan
    \brief The title of a page, at its end edge, with an optional description below.

    A heading to screen readers. The title sits at the right, at the left when mirrored.
*/
Private.ControlBase {
    id: header

    /*! The page's title. */
    property string title
    /*! The title's colour; the palette's highlight colour until set. */
    property color titleColor: palette.highlightColor

    text: title
    accessibleRole: Accessible.Heading
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
            width: parent.width
            horizontalAlignment: Text.AlignRight
            text: header.title
            color: header.titleColor
            font.pixelSize: Theme.fontSizeLarge
            elide: Text.ElideRight
        }
        Text {
            width: parent.width
            horizontalAlignment: Text.AlignRight
            visible: text.length > 0
            text: header.description
            color: header.palette.secondaryHighlightColor
            font.pixelSize: Theme.fontSizeSmall
            elide: Text.ElideRight
        }
    }
}
