import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype IconButton
    \inqmlmodule Quorvane.Pelkan
    \brief A theme icon that acts as a button.

    Drawn in the palette's primary colour, in its highlight colour while `down`, dimmed while
    disabled. Give it a `text` too: it is not drawn, but it is what a screen reader says.
*/
Private.ButtonBase {
    id: button

    /*! A theme icon, "image://theme/icon-m-close"; the tint is added here. */
    property string iconSource
    /*! The icon's colour while not down. */
    property color color: palette.primaryColor
    /*! The icon's colour while down. */
    property color highlightColor: palette.highlightColor

    implicitWidth: Theme.itemSizeSmall
    implicitHeight: Theme.itemSizeSmall
    opacity: enabled ? 1 : 0.4

    Image {
        anchors.centerIn: parent
        width: Math.min(button.width, Theme.iconSizeMedium)
        height: width
        sourceSize: Qt.size(width, height)
        source: button.iconSource === "" ? ""
              : button.iconSource + (button.iconSource.indexOf("?") < 0 ? "?" : "")
                + (button.down || button.visualFocus ? button.highlightColor : button.color)
    }
}
