import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The benchmark's baseline: TextSwitch's look rooted on a bare MouseArea, the checked
// state and the tap handling written in the file as before the native bases.
MouseArea {
    id: row

    property alias text: label.text
    property alias description: descriptionLabel.text
    property bool checked
    property bool automaticCheck: true
    property bool busy: false
    readonly property bool down: pressed && containsMouse

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    implicitHeight: Math.max(Theme.itemSizeSmall, texts.height + 2 * Theme.paddingMedium)
    opacity: enabled ? 1 : 0.4
    onPressed: Private.Util.playTouchFeedback()
    onClicked: if (automaticCheck) checked = !checked

    Item {
        id: indicator
        x: Theme.horizontalPageMargin
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.iconSizeMedium * 1.25
        height: Theme.iconSizeMedium * 0.6

        Rectangle {
            anchors.fill: parent
            radius: height / 2
            color: row.checked ? Theme.rgba(Theme.highlightColor, 0.5) : Theme.rgba(Theme.primaryColor, 0.2)
        }
        Rectangle {
            id: knob
            width: parent.height
            height: width
            radius: width / 2
            x: row.checked ? parent.width - width : 0
            color: row.checked || row.down ? Theme.highlightColor : Theme.primaryColor
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
            id: label
            width: parent.width
            color: row.down ? Theme.highlightColor : Theme.primaryColor
            font.pixelSize: Theme.fontSizeMedium
            wrapMode: Text.Wrap
        }
        Text {
            id: descriptionLabel
            visible: text !== ""
            width: parent.width
            color: row.down ? Theme.secondaryHighlightColor : Theme.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            wrapMode: Text.Wrap
        }
    }
}
