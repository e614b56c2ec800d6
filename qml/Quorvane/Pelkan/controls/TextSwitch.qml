import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype TextSwitch
    \inqmlmodule Quorvane.Pelkan
    \brief A switch with its `text` and an optional `description` under it.

    A tap anywhere on the row, or Space, Enter and Return while it is focused, flips
    `checked` and emits toggled() and clicked(). The switch sits at the row's start: on the
    left, on the right when mirrored.
*/
Private.ButtonBase {
    id: row

    /*! Whether a click flips `checked`; turn it off for a switch whose state comes from
        elsewhere (set `checked` when the change took effect). */
    property bool automaticCheck: true
    /*! Pulses the switch while a change is being applied. */
    property bool busy: false

    checkable: automaticCheck
    accessibleRole: Accessible.CheckBox
    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    implicitHeight: Math.max(Theme.itemSizeSmall, texts.height + 2 * Theme.paddingMedium)
    opacity: enabled ? 1 : 0.4

    Item {
        id: indicator
        anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
        width: Theme.iconSizeMedium * 1.25
        height: Theme.iconSizeMedium * 0.6

        Rectangle {
            anchors.fill: parent
            radius: height / 2
            color: row.checked ? Theme.rgba(row.palette.highlightColor, 0.5) : Theme.rgba(row.palette.primaryColor, 0.2)
        }
        Rectangle {
            id: knob
            width: parent.height
            height: width
            radius: width / 2
            // On at the far end of the switch: the right, the left when mirrored.
            x: row.checked !== row.mirrored ? parent.width - width : 0
            color: row.checked || row.down ? row.palette.highlightColor : row.palette.primaryColor
            Behavior on x { NumberAnimation { duration: 120; easing.type: Easing.OutQuad } }
            SequentialAnimation on opacity {
                running: row.busy
                loops: Animation.Infinite
                onRunningChanged: if (!running) knob.opacity = 1
                NumberAnimation { to: 0.3; duration: 500 }
                NumberAnimation { to: 1; duration: 500 }
            }
        }
    }

    Column {
        id: texts
        anchors { left: indicator.right; leftMargin: Theme.paddingLarge; right: parent.right
                  rightMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
        Text {
            width: parent.width
            text: row.text
            color: row.down || row.visualFocus ? row.palette.highlightColor : row.palette.primaryColor
            font.pixelSize: Theme.fontSizeMedium
            wrapMode: Text.Wrap
        }
        Text {
            visible: text !== ""
            width: parent.width
            text: row.description
            color: row.down || row.visualFocus ? row.palette.secondaryHighlightColor : row.palette.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            wrapMode: Text.Wrap
        }
    }
}
