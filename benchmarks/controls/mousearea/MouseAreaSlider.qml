import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The benchmark's baseline: Slider's look rooted on a bare MouseArea, the finger-to-value
// mapping and the drag direction handling written in the file as before the native bases
// (its state kept the way it was then, in underscore properties on the root).
MouseArea {
    id: slider

    property real value: minimumValue
    property real minimumValue: 0
    property real maximumValue: 1
    property real stepSize: 0
    property string label
    property string valueText
    readonly property bool down: pressed

    signal released()

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    implicitHeight: Theme.itemSizeSmall + (label !== "" ? labelText.height : 0) + (valueText !== "" ? valueLabel.height : 0)
    opacity: enabled ? 1 : 0.4
    preventStealing: false

    readonly property real _progress: maximumValue > minimumValue
                                      ? Math.max(0, Math.min(1, (value - minimumValue) / (maximumValue - minimumValue))) : 0
    readonly property real _trackLeft: Theme.horizontalPageMargin + knob.width / 2
    readonly property real _trackWidth: Math.max(1, width - 2 * _trackLeft)
    property real _pressX
    property real _pressY

    function _setFromFinger() {
        var v = Math.max(minimumValue, Math.min(maximumValue, mapping.value))
        if (stepSize > 0)
            v = minimumValue + Math.round((v - minimumValue) / stepSize) * stepSize
        value = Math.max(minimumValue, Math.min(maximumValue, v))
    }

    Private.VariantInterpolator {
        id: mapping
        from: slider.minimumValue
        to: slider.maximumValue
        progress: (slider.mouseX - slider._trackLeft) / slider._trackWidth
    }

    onPressed: _setFromFinger()
    onPositionChanged: {
        if (!preventStealing && Math.abs(mouse.x - _pressX) > Math.abs(mouse.y - _pressY))
            preventStealing = true
        _setFromFinger()
    }
    onReleased: { preventStealing = false; slider.released() }
    onCanceled: preventStealing = false
    onPressedChanged: if (pressed) { _pressX = mouseX; _pressY = mouseY }

    Text {
        id: valueLabel
        visible: slider.valueText !== ""
        x: Math.max(0, Math.min(slider.width - width, knob.x + knob.width / 2 - width / 2))
        text: slider.valueText
        color: Theme.highlightColor
        font.pixelSize: Theme.fontSizeLarge
    }

    Rectangle {
        id: track
        x: slider._trackLeft
        y: (slider.valueText !== "" ? valueLabel.height : 0) + (Theme.itemSizeSmall - height) / 2
        width: slider._trackWidth
        height: Math.max(2, Math.round(Theme.paddingSmall / 2))
        radius: height / 2
        color: Theme.rgba(Theme.primaryColor, 0.3)

        Rectangle {
            width: parent.width * slider._progress
            height: parent.height
            radius: parent.radius
            color: Theme.highlightColor
        }
    }

    Rectangle {
        id: knob
        width: Theme.paddingLarge * 1.5
        height: width
        radius: width / 2
        x: track.x + track.width * slider._progress - width / 2
        y: track.y + track.height / 2 - height / 2
        color: Theme.highlightColor
        scale: slider.down ? 1.3 : 1
        Behavior on scale { NumberAnimation { duration: 100 } }
    }

    Text {
        id: labelText
        visible: slider.label !== ""
        anchors.horizontalCenter: parent.horizontalCenter
        y: track.y + (Theme.itemSizeSmall + track.height) / 2
        width: Math.min(implicitWidth, slider.width - 2 * Theme.horizontalPageMargin)
        text: slider.label
        color: slider.down ? Theme.secondaryHighlightColor : Theme.secondaryColor
        font.pixelSize: Theme.fontSizeSmall
        elide: Text.ElideRight
    }
}
