import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A single-line text field: the text, a placeholder while nothing is typed (counting what
// the keyboard is still composing), a line under it that thickens while focused and turns
// to the error colour while `errorHighlight` (by default: the validator does not accept the
// text), and a `label` under the line. The text scrolls sideways with the cursor.
//
// `EnterKey` attaches to the field itself (EnterKey.text, EnterKey.onClicked). With an
// `autoFillKey`, what was entered is remembered under that key (on Enter) and offered back,
// filtered by what is typed, below the field while it has focus; a tap takes a suggestion.
//
// In the header (or footer) of a ListView or GridView the field keeps its focus while the
// view refills its model as the user types (a search over the list): the view's new current
// item does not take it.
Private.TextBaseItem {
    id: field

    /*! The text in the field. */
    property alias text: input.text
    /*! A line under the field saying what it is for (or what is wrong with it). */
    property string label
    /*! Shown in the field while it is empty. */
    property string placeholderText
    /*! The key under which entered texts are remembered and offered back; empty (the
        default) remembers nothing. Keys of letters, digits, '_' and '.' only. */
    property string autoFillKey
    /*! How many remembered texts are offered at most. */
    property int maximumSuggestions: 4
    /*! The remembered texts offered now, filtered by what is typed. */
    readonly property var suggestions: internal.autoFill ? internal.autoFill.suggestions : []
    /*! How the text shows: TextInput.Normal, Password, NoEcho or PasswordEchoOnEdit. */
    property alias echoMode: input.echoMode
    /*! The character shown for each one typed in a password echo mode. */
    property alias passwordCharacter: input.passwordCharacter
    /*! Hints to the keyboard (Qt.ImhDigitsOnly, Qt.ImhNoPredictiveText, ...). */
    property alias inputMethodHints: input.inputMethodHints
    /*! Decides which texts are acceptable; errorHighlight follows it unless set. */
    property alias validator: input.validator
    /*! Whether the validator accepts the text. */
    property alias acceptableInput: input.acceptableInput
    /*! Whether the text can be selected and copied but not changed. */
    property alias readOnly: input.readOnly
    /*! The most characters the field takes. */
    property alias maximumLength: input.maximumLength
    /*! Where the cursor is, in characters. */
    property alias cursorPosition: input.cursorPosition
    /*! How the text is aligned when it is shorter than the field. */
    property alias horizontalAlignment: input.horizontalAlignment
    /*! The font of the text. */
    property alias font: input.font
    /*! The colour of the text; the palette's unless set. */
    property alias color: input.color

    /*! Enter or Return was pressed with acceptable text. */
    signal accepted()

    /*! Selects the whole text. */
    function selectAll() { input.selectAll() }
    /*! Copies the selected text to the clipboard. */
    function copy() { input.copy() }
    /*! Pastes the clipboard's text at the cursor. */
    function paste() { input.paste() }
    /*! Remembers text (by default the current text) under autoFillKey now (Enter
        remembers the current text on its own). */
    function remember(text) {
        var entry = text === undefined ? input.text : String(text)
        if (internal.autoFill && entry.trim() !== "") {
            internal.autoFill.insert(entry)
            internal.autoFill.save()
        }
    }
    /*! Forgets a remembered text: it is no longer offered under autoFillKey. */
    function forget(text) {
        if (internal.autoFill)
            internal.autoFill.remove(String(text))
    }

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    opacity: enabled ? 1 : 0.4

    editor: input
    placeholderItem: placeholder
    labelItem: labelText
    errorHighlight: !input.acceptableInput

    onAutoFillKeyChanged: internal.followAutoFillKey()
    onFocusedChanged: {
        if (focused) {
            internal.findView()
        } else {
            // Taken by the view it sits in (see keepFocus) within this turn, or for good.
            internal.justLostFocus = true
            Qt.callLater(function() {
                if (internal) // gone with the field meanwhile
                    internal.justLostFocus = false
            })
        }
    }

    QtObject {
        id: internal

        property QtObject autoFill: null
        // Most fields never hold more than fits: the flickable that scrolls the text
        // sideways is made for the first that does.
        property Item scroller: null
        // The item view whose header or footer holds the field, once looked for.
        property Item view: null
        property bool viewLookedFor: false
        property bool justLostFocus: false

        function followAutoFillKey() {
            if (field.autoFillKey !== "" && !autoFill) {
                autoFill = autoFillComponent.createObject(field)
                var below = belowComponent.createObject(field)
                labelText.parent = below
                labelText.width = Qt.binding(function() { return below.width })
                field.labelItem = below
            }
            if (autoFill)
                autoFill.key = field.autoFillKey
        }

        function checkFits() {
            if (!scroller && input.text !== "" && input.width > 0 && input.implicitWidth > input.width)
                makeScroller()
        }

        function makeScroller() {
            var flickable = scrollerComponent.createObject(field)
            input.parent = flickable.contentItem
            input.x = 0
            input.y = 0
            input.width = Qt.binding(function() { return Math.max(flickable.width, input.implicitWidth) })
            field.contentItem = flickable
            scroller = flickable
        }

        function findView() {
            if (viewLookedFor)
                return
            viewLookedFor = true
            for (var item = field.parent; item; item = item.parent) {
                if (item.headerItem === undefined || item.currentItem === undefined)
                    continue
                for (var inside = field; inside; inside = inside.parent) {
                    if (inside === item.headerItem || inside === item.footerItem) {
                        view = item
                        return
                    }
                }
                return // in the view's delegates: the view's focus is its own business
            }
        }

        // An item view gives focus to its new current item when its model refills; the
        // user was typing here, so the field takes it back at once.
        function keepFocus() {
            if (justLostFocus && view && view.currentItem && view.currentItem.activeFocus)
                field.forceEditorFocus()
        }
    }

    Connections {
        target: internal.view
        ignoreUnknownSignals: true
        function onCurrentItemChanged() { internal.keepFocus() }
    }

    Component {
        id: autoFillComponent
        Private.AutoFill {
            inputItem: input
            maximumSuggestions: field.maximumSuggestions
        }
    }

    TextInput {
        id: input
        objectName: "textEditor"
        // The field scrolls the text (animated, with the cursor) once it no longer fits.
        autoScroll: false
        focus: true
        activeFocusOnTab: true
        color: field.highlighted ? field.palette.highlightColor : field.palette.primaryColor
        selectionColor: Theme.rgba(field.palette.highlightColor, 0.4)
        selectedTextColor: field.palette.highlightColor
        font.pixelSize: Theme.fontSizeMedium
        Accessible.name: field.label !== "" ? field.label : field.placeholderText
        onAccepted: field.accepted()
        onTextChanged: internal.checkFits()
        onWidthChanged: internal.checkFits()
    }

    Component {
        id: scrollerComponent
        Flickable {
            interactive: false
            clip: true
            contentWidth: input.width
            contentHeight: height
            flickableDirection: Flickable.HorizontalFlick
            HorizontalAutoScroll.margin: Theme.paddingSmall
        }
    }

    Text {
        id: placeholder
        visible: field.empty
        text: field.placeholderText
        color: field.focused ? field.palette.secondaryHighlightColor : field.palette.secondaryColor
        font: input.font
        elide: Text.ElideRight
        horizontalAlignment: input.effectiveHorizontalAlignment
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

    // Made with the auto-fill, for the few fields that remember: the label and the
    // suggestions under it, in one column below the line.
    Component {
        id: belowComponent
        Column {
            visible: labelText.visible || suggestionList.count > 0
            Repeater {
                id: suggestionList
                model: field.focused && internal.autoFill ? internal.autoFill.suggestions : null
                Text {
                    width: parent.width
                    height: Theme.itemSizeSmall * 0.75
                    verticalAlignment: Text.AlignVCenter
                    text: modelData
                    color: tap.pressed ? field.palette.highlightColor : field.palette.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                    elide: Text.ElideRight
                    function take() {
                        input.text = modelData
                        input.cursorPosition = input.length
                    }
                    MouseArea {
                        id: tap
                        anchors.fill: parent
                        Accessible.role: Accessible.Button
                        Accessible.name: modelData
                        Accessible.onPressAction: parent.take()
                        onClicked: parent.take()
                    }
                }
            }
        }
    }

    EnterKey.onClicked: field.remember()
}
