import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// What a page gives an application: the window it is shown in, and the focus the
// application gave a field while the page became active (a page is a focus scope).
Item {
    id: root
    width: 400
    height: 600

    ApplicationWindow {
        id: app
        anchors.fill: parent
    }

    Component {
        id: formPage
        Page {
            property alias field: titleField
            onStatusChanged: if (status === PageStatus.Active) titleField.forceActiveFocus()
            TextField { id: titleField; label: "Title" }
        }
    }

    TestCase {
        name: "Pages"
        when: windowShown

        function test_focusGivenWhileActivating_data() {
            return [ { tag: "immediate", operation: PageStackAction.Immediate },
                     { tag: "animated", operation: PageStackAction.Animated } ]
        }

        function test_focusGivenWhileActivating(data) {
            var page = app.pageStack.push(formPage, {}, data.operation)
            tryCompare(page, "status", PageStatus.Active)
            wait(50) // a turn for anything that would take the focus back
            verify(page.field.activeFocus, "the field keeps the focus it was given")
            keyClick(Qt.Key_A)
            keyClick(Qt.Key_B)
            compare(page.field.text, "ab")
            compare(page.applicationWindow, app)
            app.pageStack.pop(null, PageStackAction.Immediate)
        }

        function test_outsideAWindow() {
            var page = formPage.createObject(root)
            compare(page.applicationWindow, null)
            page.destroy()
        }
    }
}
