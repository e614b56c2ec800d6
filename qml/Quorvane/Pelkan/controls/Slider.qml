import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype Slider
    \inqmlmodule Quorvane.Pelkan
    \brief A horizontal slider with a `label` under the track and `valueText` over the knob.

    A tap on the track sets the value there, a sideways drag moves it with the finger (a drag
    up or down scrolls the page instead); arrows, Page Up/Down, Home and End move it from the
    keyboard. User changes snap to `stepSize` (0: none) and emit moved(); released() follows
    the finger's lift. The value runs from `minimumValue` (also `from`) to `maximumValue`
    (also `to`), right to left when mirrored.
*/
Private.RangeBase {
    id: slider

    /*! The words under the track; also what a screen reader calls the slider. */
    property string label
    /*! The value as the user should read it, shown over the knob; empty shows nothing. */
    property string valueText

    text: label
    description: valueText
    leftPadding: Theme.horizontalPageMargin + knob.width / 2
    rightPadding: leftPadding
    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    implicitHeight: Theme.itemSizeSmall + (label !== "" ? labelText.height : 0) + (valueText !== "" ? valueLabel.height : 0)
    opacity: enabled ? 1 : 0.4

    Text {
        id: valueLabel
        visible: slider.valueText !== ""
        x: Math.max(0, Math.min(slider.width - width, knob.x + knob.width / 2 - width / 2))
        text: slider.valueText
        color: slider.palette.highlightColor
        font.pixelSize: Theme.fontSizeLarge
    }

    Rectangle {
        id: track
        x: slider.leftPadding
        y: (slider.valueText !== "" ? valueLabel.height : 0) + (Theme.itemSizeSmall - height) / 2
        width: Math.max(1, slider.width - slider.leftPadding - slider.rightPadding)
        height: Math.max(2, Math.round(Theme.paddingSmall / 2))
        radius: height / 2
        color: Theme.rgba(slider.palette.primaryColor, 0.3)

        // Filled from the minimum's end: the left, the right when mirrored.
        Rectangle {
            x: slider.mirrored ? parent.width * slider.visualPosition : 0
            width: parent.width * slider.position
            height: parent.height
            radius: parent.radius
            color: slider.palette.highlightColor
        }
    }

    Rectangle {
        id: knob
        width: Theme.paddingLarge * 1.5
        height: width
        radius: width / 2
        x: track.x + track.width * slider.visualPosition - width / 2
        y: track.y + track.height / 2 - height / 2
        color: slider.palette.highlightColor
        scale: slider.pressed || slider.visualFocus ? 1.3 : 1
        Behavior on scale { NumberAnimation { duration: 100 } }
    }

    Text {
        id: labelText
        visible: slider.label !== ""
        x: (slider.width - width) / 2
        y: track.y + (Theme.itemSizeSmall + track.height) / 2
        width: Math.min(implicitWidth, slider.width - 2 * Theme.horizontalPageMargin)
        text: slider.label
        color: slider.pressed ? slider.palette.secondaryHighlightColor : slider.palette.secondaryColor
        font.pixelSize: Theme.fontSizeSmall
        elide: Text.ElideRight
    }
}
