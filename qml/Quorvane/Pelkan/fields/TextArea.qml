import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A multi-line text field that grows with its text: placeholder, underline, label and
// error state as on TextField. The page around it keeps the cursor above the keyboard
// as lines are added.
Private.TextBaseItem {
    id: field

    property alias text: edit.text
    property string label
    property string placeholderText
    property alias readOnly: edit.readOnly
    property alias wrapMode: edit.wrapMode
    property alias inputMethodHints: edit.inputMethodHints
    property alias cursorPosition: edit.cursorPosition
    property alias horizontalAlignment: edit.horizontalAlignment
    property alias font: edit.font
    property alias color: edit.color
    property alias textFormat: edit.textFormat
    readonly property alias _editor: edit

    function selectAll() { edit.selectAll() }

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    opacity: enabled ? 1 : 0.4

    editor: edit
    placeholderItem: placeholder
    labelItem: labelText

    TextEdit {
        id: edit
        objectName: "textEditor"
        focus: true
        wrapMode: TextEdit.Wrap
        color: field.highlighted ? field.palette.highlightColor : field.palette.primaryColor
        selectionColor: Theme.rgba(field.palette.highlightColor, 0.4)
        selectedTextColor: field.palette.highlightColor
        font.pixelSize: Theme.fontSizeMedium
    }

    Text {
        id: placeholder
        visible: field.empty
        text: field.placeholderText
        color: field.focused ? field.palette.secondaryHighlightColor : field.palette.secondaryColor
        font: edit.font
        wrapMode: Text.Wrap
    }

    Text {
        id: labelText
        visible: field.label !== ""
        text: field.label
        color: field.errorHighlight ? "#ff4d4d" : field.focused ? field.palette.secondaryHighlightColor : field.palette.secondaryColor
        font.pixelSize: Theme.fontSizeSmall
        elide: Text.ElideRight
    }
}
