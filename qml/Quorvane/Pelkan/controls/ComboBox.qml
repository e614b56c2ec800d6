import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A choice from a list: the `label` and the current `value` on one row; a tap opens the
// choices (`model`: an array of strings or a string-list model) as a menu below, pushing
// what follows aside, and a tap on one picks it, sets `currentIndex` and emits activated().
Item {
    id: combo

    property string label
    property string description
    property var model: []
    property int currentIndex: 0
    readonly property int count: !model ? 0 : (model.length !== undefined ? model.length : model.count)
    readonly property string value: _textAt(currentIndex, count)
    readonly property bool menuOpen: menu.visible

    signal activated(int index)

    function _textAt(i) {
        if (i < 0 || i >= count)
            return ""
        return model.length !== undefined ? String(model[i]) : model.get(i)
    }

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    height: row.height + (menu.visible ? menu.height : 0)
    opacity: enabled ? 1 : 0.4

    MouseArea {
        id: row
        width: combo.width
        height: Math.max(Theme.itemSizeSmall, texts.height + 2 * Theme.paddingSmall)
        onClicked: menu.visible = !menu.visible

        Rectangle {
            anchors.fill: parent
            visible: row.pressed || menu.visible
            color: Theme.highlightBackgroundColor
            opacity: 0.3
        }

        Column {
            id: texts
            anchors { left: parent.left; right: parent.right; margins: Theme.horizontalPageMargin
                      verticalCenter: parent.verticalCenter }
            Row {
                spacing: Theme.paddingMedium
                Text {
                    text: combo.label
                    color: row.pressed ? Theme.highlightColor : Theme.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                }
                Text {
                    text: combo.value
                    color: Theme.highlightColor
                    font.pixelSize: Theme.fontSizeMedium
                }
            }
            Text {
                visible: text !== ""
                width: parent.width
                text: combo.description
                color: Theme.secondaryColor
                font.pixelSize: Theme.fontSizeSmall
                wrapMode: Text.Wrap
            }
        }
    }

    ContextMenu {
        id: menu
        y: row.height
        width: combo.width

        Repeater {
            model: combo.model
            MenuItem {
                text: modelData
                color: index === combo.currentIndex || highlighted ? Theme.highlightColor : Theme.primaryColor
                onClicked: {
                    combo.currentIndex = index
                    combo.activated(index)
                }
            }
        }
    }
}
