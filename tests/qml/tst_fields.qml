import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// Text fields with real keys and taps: typing, Enter running the EnterKey action,
// remembered suggestions filtered while typing and taken by a tap, the page keeping the
// focused field above a keyboard; and a formatting proxy model's roles in a list.
Item {
    id: root
    width: 480; height: 800

    property var entered: []
    property rect keyboard: Qt.rect(0, 500, 480, 300)

    Flickable {
        id: page
        anchors.fill: parent; contentHeight: form.height
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
            width: 480; height: 400; model: root.cities
            header: SearchField {
                width: list.width
                onTextChanged: list.model = root.cities.filter(function(city) { return city.toLowerCase().indexOf(text.toLowerCase()) >= 0 })
            }
            delegate: Text { text: modelData; height: 40 }
        }
    }

    ListModel { id: files }
    FormattingProxyModel { id: proxy; formats: [{ role: "sizeText", source: "size", operation: "formatFileSize" }] }
    ListView { id: fileList; y: 800; width: 400; height: 100; delegate: Text { height: 40; text: model.name + ": " + model.sizeText } }

    TestCase {
        name: "Fields"
        when: windowShown

        function init() {
            root.entered = []
            page.contentY = 0
            root.keyboard = Qt.rect(0, 500, 480, 300)
        }

        function tap(field) {
            mouseClick(field, field.width / 2, field.topPadding + 4)
        }

        function type(text) {
            for (var i = 0; i < text.length; ++i)
                keyClick(text.charAt(i))
        }

        // Tab walks the fields (a tab is never typed), Shift+Tab walks back; right to left the
        // search and password buttons change sides.
        function test_tabAndMirroring() {
            plain.forceActiveFocus()
            var reached = []
            for (var i = 0; i < 6 && !area.editor.activeFocus; ++i) {
                keyClick(Qt.Key_Tab)
                ;[secret, search, area].forEach(function(f) { if (f.editor.activeFocus) reached.push(f) })
            }
            compare(reached, [secret, search, area])
            keyClick(Qt.Key_Tab)
            compare(area.text, "")
            verify(!area.editor.activeFocus)
            keyClick(Qt.Key_Backtab)
            verify(area.editor.activeFocus)
            var side = function(field, source) {
                for (var i = 0; i < field.children.length; ++i) {
                    var child = field.children[i]
                    if (String(child.source || child.iconSource || "").indexOf(source) >= 0)
                        return child.x + child.width / 2 < field.width / 2 ? "left" : "right"
                }
                return "none"
            }
            form.LayoutMirroring.childrenInherit = true
            for (var mirrored = 0; mirrored < 2; ++mirrored) {
                form.LayoutMirroring.enabled = !!mirrored
                compare(side(search, "icon-m-search"), mirrored ? "right" : "left")
                compare(side(secret, "icon-m-visible"), mirrored ? "left" : "right")
                verify(secret.editor.x > 0 && secret.editor.x + secret.editor.width < secret.width)
            }
            form.LayoutMirroring.enabled = false
        }

        // Typing past a field's end scrolls the text so the cursor stays in the field; Home
        // brings its start back; Enter runs the EnterKey action.
        function test_typing_data() {
            return [
                { tag: "text field", field: plain, typed: "ab", text: "ab", tag2: "plain" },
                { tag: "text field, longer than it is wide", field: plain, typed: "w".repeat(40), text: "w".repeat(40), tag2: "plain" },
                { tag: "password field", field: secret, typed: "pw", text: "pw", tag2: "secret" },
                { tag: "search field", field: search, typed: "hi", text: "hi", tag2: "search" },
                { tag: "text area, Enter breaks the line", field: area, typed: "x", text: "x\n", tag2: "area" },
            ]
        }

        function test_typing(data) {
            var field = data.field
            field.text = ""
            tap(field)
            verify(field.focused && field.empty)
            type(data.typed)
            compare(field.empty, false)
            tryVerify(function() {
                var x = field.editor.mapToItem(field, field.editor.cursorRectangle.x, 0).x
                return x > field.leftPadding && x < field.width - field.rightPadding
            })
            keyClick(Qt.Key_Home)
            tryVerify(function() { return field.editor.mapToItem(field, 0, 0).x === field.leftPadding })
            keyClick(Qt.Key_End)
            keyClick(Qt.Key_Return)
            compare(field.text, data.text)
            compare(root.entered, [data.tag2])
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
            tap(search)
            type("h")
            tryCompare(search, "suggestions", ["hamburg", "harbour"])
            type("ar")
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
            tap(field)
            verify(field.focused)
            ;["o", "s"].forEach(function(key) {
                type(key)
                tryVerify(function() { return list.count > 0 && list.currentItem !== null })
                verify(field.focused, "after " + field.text)
            })
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
            tap(first.field)
            type("quorvane")
            keyClick(Qt.Key_Return)
            var second = data.second.createObject(root) // over the first
            tap(second.field)
            type("q")
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

        // The source's roles pass through next to the formatted ones, also over a ListModel
        // that names its roles only once its first row arrives.
        function test_formattingProxyRoles_data() {
            return [
                { tag: "source empty when attached, filled later", fillFirst: false },
                { tag: "source filled when attached", fillFirst: true },
            ]
        }

        function test_formattingProxyRoles(data) {
            var fill = function() { files.append({ "name": "a.jpg", "size": 2048 }); files.append({ "name": "b.txt", "size": 10 }) }
            fileList.model = null
            proxy.sourceModel = null
            files.clear()
            if (data.fillFirst)
                fill()
            proxy.sourceModel = files
            fileList.model = proxy
            if (!data.fillFirst)
                fill()
            tryCompare(fileList, "count", 2)
            fileList.forceLayout()
            compare(fileList.itemAtIndex(0).text, "a.jpg: " + Format.formatFileSize(2048, 1))
            compare(fileList.itemAtIndex(1).text, "b.txt: " + Format.formatFileSize(10, 1))
        }
    }
}
