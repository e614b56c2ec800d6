import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype Button
    \inqmlmodule Quorvane.Pelkan
    \brief A push button: its text on a rounded, translucent background.

    Pressed by a tap, the mouse or Space, Enter and Return while focused; clicked() on
    release. Drawn highlighted while `down`. Several buttons lay out with ButtonLayout.
    Press handling, keys, focus and accessibility come from ButtonBase; this file draws.
*/
Private.ButtonBase {
    id: button

    /*! The colour of the text while not down; the palette's primary colour until set. */
    property color color: palette.primaryColor
    /*! The colour of the text while down; the palette's highlight colour until set. */
    property color highlightColor: palette.highlightColor
    /*! The background while not down. */
    property color backgroundColor: Theme.rgba(color, 0.2)
    /*! The background while down. */
    property color highlightBackgroundColor: Theme.rgba(palette.highlightBackgroundColor, 0.5)

    implicitWidth: Math.max(Theme.itemSizeExtraLarge * 1.5, label.implicitWidth + 2 * Theme.paddingLarge)
    implicitHeight: Theme.itemSizeSmall * 0.75
    opacity: enabled ? 1 : 0.4

    Rectangle {
        anchors.fill: parent
        radius: height / 2
        color: button.down || button.visualFocus ? button.highlightBackgroundColor : button.backgroundColor
    }

    Text {
        id: label
        anchors.centerIn: parent
        width: Math.min(implicitWidth, button.width - 2 * Theme.paddingMedium)
        text: button.text
        color: button.down || button.visualFocus ? button.highlightColor : button.color
        font.pixelSize: Theme.fontSizeMedium
        elide: Text.ElideRight
    }
}
