import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A multi-line text field that grows with its text: placeholder, underline, label and
// error state as on TextField. The page around it keeps the cursor above the keyboard
// as lines are added.
Private.TextBaseItem {
    id: field

    /*! The text in the field. */
    property alias text: edit.text
    /*! A line under the field saying what it is for (or what is wrong with it). */
    property string label
    /*! Shown in the field while it is empty. */
    property string placeholderText
    /*! Whether the text can be selected and copied but not changed. */
    property alias readOnly: edit.readOnly
    /*! How lines break: TextEdit.Wrap (the default), WordWrap, NoWrap, ... */
    property alias wrapMode: edit.wrapMode
    /*! Hints to the keyboard (Qt.ImhNoPredictiveText, ...). */
    property alias inputMethodHints: edit.inputMethodHints
    /*! Where the cursor is, in characters. */
    property alias cursorPosition: edit.cursorPosition
    /*! How the lines are aligned. */
    property alias horizontalAlignment: edit.horizontalAlignment
    /*! The font of the text. */
    property alias font: edit.font
    /*! The colour of the text; the palette's unless set. */
    property alias color: edit.color
    /*! TextEdit.PlainText, RichText, AutoText or MarkdownText. */
    property alias textFormat: edit.textFormat

    /*! Selects the whole text. */
    function selectAll() { edit.selectAll() }

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    opacity: enabled ? 1 : 0.4

    editor: edit
    placeholderItem: placeholder
    labelItem: labelText

    QtObject {
        id: internal

        function focusNext(forward) {
            var next = edit.nextItemInFocusChain(forward)
            if (next && next !== edit)
                next.forceActiveFocus(forward ? Qt.TabFocusReason : Qt.BacktabFocusReason)
        }
    }

    TextEdit {
        id: edit
        objectName: "textEditor"
        focus: true
        activeFocusOnTab: true
        wrapMode: TextEdit.Wrap
        // Tab and Shift+Tab go on to the next or previous control, as from any field of a
        // form, rather than typing a tab.
        Keys.onTabPressed: internal.focusNext(true)
        Keys.onBacktabPressed: internal.focusNext(false)
        color: field.highlighted ? field.palette.highlightColor : field.palette.primaryColor
        selectionColor: Theme.rgba(field.palette.highlightColor, 0.4)
        selectedTextColor: field.palette.highlightColor
        font.pixelSize: Theme.fontSizeMedium
        Accessible.name: field.label !== "" ? field.label : field.placeholderText
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
        color: field.errorHighlight ? field.palette.errorColor
                                    : field.focused ? field.palette.secondaryHighlightColor : field.palette.secondaryColor
        font.pixelSize: Theme.fontSizeSmall
        elide: Text.ElideRight
    }
}
