import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// Text fields with real keys and taps: typing, Enter running the EnterKey action,
// remembered suggestions filtered while typing and taken by a tap, and the page keeping
// the focused field above a keyboard.
Item {
    id: root
    width: 480
    height: 800

    property var entered: []
    property rect keyboard: Qt.rect(0, 500, 480, 300)

    Flickable {
        id: page
        anchors.fill: parent
        contentHeight: form.height
        VerticalAutoScroll.animated: false
        VerticalAutoScroll.keyboardRectangle: root.keyboard

        Column {
            id: form
            width: page.width
            TextField { id: plain; label: "Name"; placeholderText: "Your name"; EnterKey.onClicked: root.entered.push("plain") }
            PasswordField { id: secret; EnterKey.onClicked: root.entered.push("secret") }
            SearchField { id: search; autoFillKey: "tst_fields_search"; EnterKey.onClicked: root.entered.push("search") }
            TextArea { id: area; label: "Notes"; EnterKey.onClicked: root.entered.push("area") }
            Repeater { model: 12; TextField { label: "Filler " + index } }
            TextField { id: last; label: "Last" }
        }
    }

    TestCase {
        name: "Fields"
        when: windowShown

        function init() {
            root.entered = []
            page.contentY = 0
            root.keyboard = Qt.rect(0, 500, 480, 300)
        }

        function test_typing_data() {
            return [
                { tag: "text field", field: plain, typed: "ab", text: "ab", tag2: "plain" },
                { tag: "password field", field: secret, typed: "pw", text: "pw", tag2: "secret" },
                { tag: "search field", field: search, typed: "hi", text: "hi", tag2: "search" },
                { tag: "text area, Enter breaks the line", field: area, typed: "x", text: "x\n", tag2: "area" },
            ]
        }

        function test_typing(data) {
            data.field.text = ""
            mouseClick(data.field, data.field.width / 2, data.field.topPadding + 4)
            verify(data.field.focused)
            verify(data.field.empty)
            for (var i = 0; i < data.typed.length; ++i)
                keyClick(data.typed.charAt(i))
            compare(data.field.empty, false)
            keyClick(Qt.Key_Return)
            compare(data.field.text, data.text)
            compare(root.entered, [data.tag2])
        }

        // Typing past the field's end scrolls the text so the cursor stays in the field.
        function test_longText() {
            plain.text = ""
            mouseClick(plain, plain.width / 2, plain.topPadding + 4)
            for (var i = 0; i < 40; ++i)
                keyClick("w")
            wait(500)
            tryVerify(function() {
                var x = plain._editor.mapToItem(plain, plain._editor.cursorRectangle.x, 0).x
                return x > plain.leftPadding && x < plain.width - plain.rightPadding
            })
            verify(plain._editor.width > plain.width)
            keyClick(Qt.Key_Home)
            tryVerify(function() { return plain._editor.mapToItem(plain, 0, 0).x === plain.leftPadding })
        }

        function test_validation() {
            plain.text = ""
            plain.validator = intOnly
            verify(plain.errorHighlight === false || plain.text === "")
            plain.text = "12"
            compare(plain.errorHighlight, false)
            plain.text = "1234"
            compare(plain.errorHighlight, true)
            compare(plain.underline.errorHighlight, true)
            plain.validator = null
            compare(plain.errorHighlight, false)
        }
        IntValidator { id: intOnly; bottom: 0; top: 99 }

        function test_suggestions() {
            search.text = ""
            search._autoFill.remove("hi") // what the typing test may have left
            search._autoFill.insert("harbour")
            search._autoFill.insert("hamburg")
            search._autoFill.insert("oslo")
            mouseClick(search, search.width / 2, search.topPadding + 4)
            keyClick("h")
            tryCompare(search, "suggestions", ["hamburg", "harbour"])
            keyClick("a")
            keyClick("r")
            tryCompare(search, "suggestions", ["harbour"])
            // The one suggestion left is the first row under the field's line.
            mouseClick(search, search.width / 2, search.labelItem.y + Theme.itemSizeSmall * 0.75 / 2)
            compare(search.text, "harbour")
        }

        function test_keptAboveKeyboard_data() {
            return [
                { tag: "field below the keyboard's top", field: function() { return last }, scrolls: true },
                { tag: "field already visible", field: function() { return plain }, scrolls: false },
            ]
        }

        function test_keptAboveKeyboard(data) {
            var field = data.field()
            field.forceEditorFocus()
            tryVerify(function() { return field.focused })
            wait(0)
            var bottom = field._editor.mapToItem(page, 0, field._editor.height).y
            verify(bottom <= root.keyboard.y + 0.5, "bottom at " + bottom)
            compare(page.contentY > 0, data.scrolls)
            // The keyboard rises further: the field follows it.
            root.keyboard = Qt.rect(0, 300, 480, 500)
            tryVerify(function() { return field._editor.mapToItem(page, 0, field._editor.height).y <= 300.5 })
        }
    }
}
