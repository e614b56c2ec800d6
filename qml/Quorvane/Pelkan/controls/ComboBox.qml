import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype ComboBox
    \inqmlmodule Quorvane.Pelkan
    \brief A choice from a list: the `label` and the current `value` on one row.

    A tap (or Space, Enter, Return) opens the choices as a menu below, pushing what follows
    aside; a tap on one picks it, sets `currentIndex` and emits activated(). Up and Down pick
    the previous or next choice from the keyboard.
*/
Private.ButtonBase {
    id: combo

    /*! What is chosen, shown before the value. */
    property string label
    /*! The choices: an array of strings or a string-list model. */
    property var model: []
    /*! The index of the chosen entry in `model`. */
    property int currentIndex: 0
    /*! How many choices the model holds. */
    readonly property int count: !model ? 0 : (model.length !== undefined ? model.length : model.count)
    /*! The text of the chosen entry. */
    readonly property string value: internal.textAt(currentIndex, count)
    /*! Whether the choices are shown. */
    readonly property bool menuOpen: menu.visible

    /*! A choice was picked by the user; `index` is its place in the model. */
    signal activated(int index)

    QtObject {
        id: internal
        function textAt(i) {
            if (i < 0 || i >= combo.count)
                return ""
            return combo.model.length !== undefined ? String(combo.model[i]) : combo.model.get(i)
        }
        function pick(i) {
            if (i < 0 || i >= combo.count)
                return
            combo.currentIndex = i
            combo.activated(i)
        }
    }

    text: label
    accessibleRole: Accessible.ComboBox
    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    implicitHeight: row.height + (menu.visible ? menu.height : 0)
    opacity: enabled ? 1 : 0.4

    onClicked: menu.visible = !menu.visible
    Keys.onUpPressed: internal.pick(currentIndex - 1)
    Keys.onDownPressed: internal.pick(currentIndex + 1)

    Item {
        id: row
        width: combo.width
        height: Math.max(Theme.itemSizeSmall, texts.height + 2 * Theme.paddingSmall)

        Rectangle {
            anchors.fill: parent
            visible: combo.down || menu.visible
            color: combo.palette.highlightBackgroundColor
            opacity: 0.3
        }

        Column {
            id: texts
            anchors { left: parent.left; right: parent.right; margins: Theme.horizontalPageMargin
                      verticalCenter: parent.verticalCenter }
            Row {
                spacing: Theme.paddingMedium
                anchors { left: parent.left; right: parent.right }
                Text {
                    text: combo.label
                    color: combo.down || combo.visualFocus ? combo.palette.highlightColor : combo.palette.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                }
                Text {
                    text: combo.value
                    color: combo.palette.highlightColor
                    font.pixelSize: Theme.fontSizeMedium
                }
            }
            Text {
                visible: text !== ""
                width: parent.width
                text: combo.description
                color: combo.palette.secondaryColor
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
                color: index === combo.currentIndex || highlighted ? combo.palette.highlightColor : combo.palette.primaryColor
                onClicked: internal.pick(index)
            }
        }
    }
}
