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

    // Search fields with the default key on two kinds of page; one that opts out.
    component NotesPage: Page { property alias field: field; SearchField { id: field } }
    component MailPage: Page { property alias field: field; SearchField { id: field } }
    component SilentPage: Page { property alias field: field; SearchField { id: field; autoFillKey: "" } }
    Component { id: notesPage; NotesPage {} }
    Component { id: mailPage; MailPage {} }
    Component { id: silentPage; SilentPage {} }

    // A search over a list: the field in the header, the model replaced as the user types.
    readonly property var cities: ["Oslo", "Osaka", "Ostrava", "Paris", "Porto"]
    Component {
        id: searchList
        ListView {
            id: list
            width: 480
            height: 400
            model: root.cities
            header: SearchField {
                width: list.width
                onTextChanged: list.model = root.cities.filter(function(city) { return city.toLowerCase().indexOf(text.toLowerCase()) >= 0 })
            }
            delegate: Text { text: modelData; height: 40 }
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
                var x = plain.editor.mapToItem(plain, plain.editor.cursorRectangle.x, 0).x
                return x > plain.leftPadding && x < plain.width - plain.rightPadding
            })
            verify(plain.editor.width > plain.width)
            keyClick(Qt.Key_Home)
            tryVerify(function() { return plain.editor.mapToItem(plain, 0, 0).x === plain.leftPadding })
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
            search.forget("hi") // what the typing test may have left
            search.remember("harbour")
            search.remember("hamburg")
            search.remember("oslo")
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

        // Typing into a search field in a list's header refills the list: the field keeps
        // the focus through every key, also on the gallery's page that shows the pattern.
        function test_searchInListHeader_data() {
            return [
                { tag: "model replaced", component: searchList },
                { tag: "gallery: rows refilled", component: Qt.createComponent("../../examples/gallery/qml/SearchPage.qml") },
            ]
        }

        function test_searchInListHeader(data) {
            var made = data.component.createObject(root)
            var list = made.list || made
            var field = list.headerItem instanceof TextField ? list.headerItem : list.headerItem.children[1]
            mouseClick(field, field.width / 2, field.topPadding + 4)
            verify(field.focused)
            var typed = "os"
            for (var i = 0; i < typed.length; ++i) {
                keyClick(typed.charAt(i))
                tryVerify(function() { return list.count > 0 && list.currentItem !== null })
                verify(field.focused, "after " + typed.substring(0, i + 1))
            }
            compare(field.text, "os")
            made.destroy()
        }

        // By default a search field remembers per application and page kind; an empty key
        // remembers nothing.
        function test_searchesRemembered_data() {
            return [
                { tag: "the same kind of page", first: notesPage, second: notesPage, offered: ["quorvane"] },
                { tag: "another kind of page", first: notesPage, second: mailPage, offered: [] },
                { tag: "opted out", first: silentPage, second: silentPage, offered: [] },
            ]
        }

        function test_searchesRemembered(data) {
            var first = data.first.createObject(root)
            var field = first.field
            mouseClick(field, field.width / 2, field.topPadding + 4)
            keyClick("q"); keyClick("u"); keyClick("o"); keyClick("r"); keyClick("v"); keyClick("a"); keyClick("n"); keyClick("e")
            keyClick(Qt.Key_Return)
            var second = data.second.createObject(root) // over the first
            mouseClick(second.field, field.width / 2, field.topPadding + 4)
            keyClick("q")
            if (data.offered.length > 0)
                tryCompare(second.field, "suggestions", data.offered)
            wait(300) // past the typing delay: nothing else comes
            compare(second.field.suggestions, data.offered)
            first.field.forget("quorvane")
            first.destroy()
            second.destroy()
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
            var bottom = field.editor.mapToItem(page, 0, field.editor.height).y
            verify(bottom <= root.keyboard.y + 0.5, "bottom at " + bottom)
            compare(page.contentY > 0, data.scrolls)
            // The keyboard rises further: the field follows it.
            root.keyboard = Qt.rect(0, 300, 480, 500)
            tryVerify(function() { return field.editor.mapToItem(page, 0, field.editor.height).y <= 300.5 })
        }
    }
}
