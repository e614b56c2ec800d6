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
Private.TextBaseItem {
    id: field

    property alias text: input.text
    property string label
    property string placeholderText
    property string autoFillKey
    property int maximumSuggestions: 4
    readonly property var suggestions: _autoFill ? _autoFill.suggestions : []
    property alias echoMode: input.echoMode
    property alias passwordCharacter: input.passwordCharacter
    property alias inputMethodHints: input.inputMethodHints
    property alias validator: input.validator
    property alias acceptableInput: input.acceptableInput
    property alias readOnly: input.readOnly
    property alias maximumLength: input.maximumLength
    property alias cursorPosition: input.cursorPosition
    property alias horizontalAlignment: input.horizontalAlignment
    property alias font: input.font
    property alias color: input.color
    readonly property alias _editor: input
    property QtObject _autoFill: null

    signal accepted()

    function selectAll() { input.selectAll() }
    function copy() { input.copy() }
    function paste() { input.paste() }
    // Remembers the current text under autoFillKey now (Enter does it on its own).
    function remember() {
        if (_autoFill && input.text.trim() !== "") {
            _autoFill.insert(input.text)
            _autoFill.save()
        }
    }

    width: parent ? parent.width : implicitWidth
    implicitWidth: Theme.itemSizeExtraLarge * 3
    opacity: enabled ? 1 : 0.4

    editor: input
    placeholderItem: placeholder
    labelItem: labelText
    errorHighlight: !input.acceptableInput

    onAutoFillKeyChanged: {
        if (autoFillKey !== "" && !_autoFill) {
            _autoFill = autoFillComponent.createObject(field)
            var below = belowComponent.createObject(field)
            labelText.parent = below
            labelText.width = Qt.binding(function() { return below.width })
            labelItem = below
        }
        if (_autoFill)
            _autoFill.key = autoFillKey
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
        color: field.highlighted ? field.palette.highlightColor : field.palette.primaryColor
        selectionColor: Theme.rgba(field.palette.highlightColor, 0.4)
        selectedTextColor: field.palette.highlightColor
        font.pixelSize: Theme.fontSizeMedium
        onAccepted: field.accepted()
        onTextChanged: field._checkFits()
        onWidthChanged: field._checkFits()
    }

    // Most fields never hold more than fits: the flickable that scrolls the text sideways
    // is made for the first that does.
    property Item _scroller: null
    function _checkFits() {
        if (!_scroller && input.text !== "" && input.width > 0 && input.implicitWidth > input.width)
            _makeScroller()
    }
    function _makeScroller() {
        var scroller = scrollerComponent.createObject(field)
        input.parent = scroller.contentItem
        input.x = 0
        input.y = 0
        input.width = Qt.binding(function() { return Math.max(scroller.width, input.implicitWidth) })
        contentItem = scroller
        _scroller = scroller
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
        color: field.errorHighlight ? "#ff4d4d" : field.focused ? field.palette.secondaryHighlightColor : field.palette.secondaryColor
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
                model: field.focused && field._autoFill ? field._autoFill.suggestions : null
                Text {
                    width: parent.width
                    height: Theme.itemSizeSmall * 0.75
                    verticalAlignment: Text.AlignVCenter
                    text: modelData
                    color: tap.pressed ? field.palette.highlightColor : field.palette.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                    elide: Text.ElideRight
                    MouseArea {
                        id: tap
                        anchors.fill: parent
                        onClicked: {
                            input.text = modelData
                            input.cursorPosition = input.length
                        }
                    }
                }
            }
        }
    }

    EnterKey.onClicked: field.remember()
}
