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
    leftPadding: Theme.horizontalPageMargin
    rightPadding: Theme.horizontalPageMargin
    topPadding: Theme.paddingSmall
    bottomPadding: Theme.paddingMedium
    labelSpacing: Theme.paddingSmall
    opacity: enabled ? 1 : 0.4

    editor: input
    contentItem: flick
    placeholderItem: placeholder
    labelItem: below
    errorHighlight: !input.acceptableInput
    underline.color: Theme.rgba(palette.primaryColor, 0.4)
    underline.highlightColor: palette.highlightColor
    underline.errorColor: "#ff4d4d"
    underline.lineWidth: Math.max(1, Math.round(Theme.pixelRatio))
    underline.focusLineWidth: Math.max(2, Math.round(2 * Theme.pixelRatio))

    onAutoFillKeyChanged: {
        if (autoFillKey !== "" && !_autoFill)
            _autoFill = autoFillComponent.createObject(field)
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

    Flickable {
        id: flick
        interactive: false
        clip: contentWidth > width
        contentWidth: input.width
        contentHeight: height
        flickableDirection: Flickable.HorizontalFlick
        HorizontalAutoScroll.margin: Theme.paddingSmall

        TextInput {
            id: input
            objectName: "textEditor"
            // As wide as the text, so that the flickable (not the input) scrolls it.
            width: Math.max(flick.width, implicitWidth)
            autoScroll: false
            focus: true
            color: field.highlighted ? field.palette.highlightColor : field.palette.primaryColor
            selectionColor: Theme.rgba(field.palette.highlightColor, 0.4)
            selectedTextColor: field.palette.highlightColor
            font.pixelSize: Theme.fontSizeMedium
            onAccepted: field.accepted()
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

    Column {
        id: below
        visible: field.label !== "" || suggestionList.count > 0

        Text {
            visible: field.label !== ""
            width: parent.width
            text: field.label
            color: field.errorHighlight ? "#ff4d4d" : field.focused ? field.palette.secondaryHighlightColor : field.palette.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            elide: Text.ElideRight
        }

        Repeater {
            id: suggestionList
            model: field.focused && field._autoFill ? field._autoFill.suggestions : null
            Text {
                width: below.width
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

    EnterKey.onClicked: field.remember()
}
