import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// The page stack through its public surface: moves made by calls and by swipes (real mouse
// and touch events), alone and in quick succession, the statuses they leave, and dialogs;
// what a page gives an application: its window, and the focus it gave a field meanwhile.
Item {
    id: root
    width: 400; height: 600

    property var log: []
    property var faults: []
    property double now: 0 // the stack's clock

    ApplicationWindow {
        id: app
        anchors.fill: parent
    }

    Component {
        id: pageComponent
        Page {
            property string name
            property int last: PageStatus.Inactive
            onStatusChanged: {
                root.log.push(name + ":" + ["Inactive", "Activating", "Active", "Deactivating"][status])
                // Each move: Inactive, Activating, Active, Deactivating, Inactive, in turn; a
                // move ends only once nothing slides.
                if (status !== (last + 1) % 4)
                    root.faults.push(name + ": " + last + " to " + status)
                if ((status === PageStatus.Active || status === PageStatus.Inactive) && app.pageStack.busy)
                    root.faults.push(name + ": " + status + " while busy")
                last = status
            }
            MouseArea { anchors.fill: parent } // content that takes presses, as a list does
        }
    }

    // A page is a focus scope: the focus given to a field while the page becomes active stays.
    Component {
        id: formPage
        Page {
            property alias field: titleField
            onStatusChanged: if (status === PageStatus.Active) titleField.forceActiveFocus()
            TextField { id: titleField; label: "Title" }
        }
    }

    Component {
        id: dialogComponent
        Dialog {
            property var outcome: []
            onOpened: outcome.push("opened")
            onAccepted: outcome.push("accepted")
            onRejected: outcome.push("rejected")
            property var then: null
            onDone: if (then) then()
            DialogHeader { id: header }
            property alias header: header
        }
    }

    GestureTestCase {
        name: "PageStack"

        readonly property Item stack: app.pageStack

        function init() {
            stack.clock = function() { return root.now }
            stack.clear()
            page("A")
            page("B")
            compare(stack.depth, 2)
            root.log = []
            root.faults = []
        }

        function page(name, animated, properties) {
            var given = properties || {}
            given.name = name
            return stack.push(pageComponent, given, animated ? PageStackAction.Animated : PageStackAction.Immediate)
        }

        function pushKind(kind) {
            compare(stack.push(kind, { "backNavigation": false }).backNavigation, false, "properties given with the push")
        }

        function settle() {
            tryCompare(stack, "busy", false)
        }

        // Across the middle in a dozen moves on the stack's clock (16 ms apart: a finger at 60
        // frames a second), the pages following.
        function drag(input, fromX, toX, msPerMove) {
            swipe(stack, input, fromX, 300, toX, 300, { steps: 12, moving: function() { root.now += msPerMove || 16 },
                released: function() {
                    var moved = stack._leftFlickDifference - stack._rightFlickDifference
                    verify(moved !== 0)
                    compare(stack.currentPage.x, moved)
                    var beside = moved > 0 ? stack.previousPage : stack.nextPage
                    if (beside)
                        compare(beside.x, moved > 0 ? moved - stack.width : moved + stack.width)
                } })
        }

        function test_move_data() {
            // What happens; the depth and top page it leaves, and the statuses it logs.
            var push = ["B:Deactivating", "C:Activating", "B:Inactive", "C:Active"]
            var pop = ["B:Deactivating", "A:Activating", "B:Inactive", "A:Active"]
            var forward = ["B:Deactivating", "N:Activating", "B:Inactive", "N:Active"]
            var named = function(name) { return function(p) { return p.name === name } }
            return [
                { tag: "push, animated", act: function(s, t) { t.page("C", true) }, depth: 3, top: "C", log: push },
                { tag: "push, immediate", act: function(s, t) { t.page("C") }, depth: 3, top: "C", log: push },
                { tag: "pop, animated", act: function(s) { s.pop() }, depth: 1, top: "A", log: pop },
                { tag: "pop, immediate", act: function(s) { s.pop(PageStackAction.Immediate) }, depth: 1, top: "A", log: pop },
                { tag: "replace", act: function(s) { s.replace(pageComponent, { "name": "C" }) }, depth: 2, top: "C", log: push },
                { tag: "navigate forward", act: function(s) { s.pushAttached(pageComponent, { "name": "N" }); s.navigateForward() },
                  depth: 3, top: "N", log: forward },
                { tag: "swipe back past half, mouse", act: function(s, t) { t.drag("mouse", 20, 300) }, depth: 1, top: "A", log: pop },
                { tag: "swipe back before half, touch", act: function(s, t) { t.drag("touch", 20, 150) }, depth: 2, top: "B", log: [] },
                { tag: "a quick flick before half", act: function(s, t) { t.drag("touch", 20, 150, 4) }, depth: 1, top: "A", log: pop },
                { tag: "a swipe taken away by the system", act: function(s, t) { t.drag("cancel", 20, 300) }, depth: 2, top: "B", log: [] },
                { tag: "swipe forward", act: function(s, t) {
                    s.pushAttached(pageComponent, { "name": "N" }); t.drag("touch", 380, 100) },
                  depth: 3, top: "N", log: forward },
                // Calls in quick succession, whatever slides: each takes effect, in order.
                { tag: "pop, and pop again 30 ms later", act: function(s, t) { t.page("C"); s.pop(); t.wait(30); s.pop() },
                  depth: 1, top: "A" },
                { tag: "twenty pages popped 50 ms apart", act: function(s, t) {
                    for (var i = 3; i <= 20; ++i)
                        t.page("P" + i)
                    for (var j = 1; j < 20; ++j) {
                        s.pop()
                        t.wait(50)
                    } }, depth: 1, top: "A" },
                { tag: "a push while a pop slides", act: function(s, t) { s.pop(); t.wait(30); t.page("C", true) },
                  depth: 2, top: "C", log: pop.concat(["A:Deactivating", "C:Activating", "A:Inactive", "C:Active"]) },
                { tag: "clear and push while a push slides", act: function(s, t) { t.page("C", true); s.clear(); t.page("D", true) },
                  depth: 1, top: "D", log: push.concat(["C:Deactivating", "C:Inactive", "D:Activating", "D:Active"]) },
                { tag: "attach and go forward while a pop slides", act: function(s, t) {
                    s.pop(); t.wait(30); s.pushAttached(pageComponent, { "name": "N" }); s.navigateForward() }, depth: 2, top: "N" },
                { tag: "a pop while a released finger settles", act: function(s, t) { t.drag("touch", 20, 150); s.pop() },
                  depth: 1, top: "A", log: pop },
                { tag: "a swipe while a pop slides", act: function(s, t) { t.page("C"); s.pop(); t.drag("mouse", 20, 300) },
                  depth: 1, top: "A" },
                { tag: "a pop while a swiped page slides away", act: function(s, t) { t.page("C"); t.drag("mouse", 20, 300); s.pop() },
                  depth: 1, top: "A" },
                // Pages of every kind; an item given goes back where it was once popped.
                { tag: "a URL", act: function(s, t) { t.pushKind(Qt.resolvedUrl("../../qml/Quorvane/Pelkan/pages/Page.qml")) },
                  depth: 3 },
                { tag: "a module and name", act: function(s, t) { t.pushKind("Quorvane.Pelkan.Page") }, depth: 3 },
                { tag: "a module path and name", act: function(s, t) { t.pushKind("Quorvane/Pelkan/Page") }, depth: 3 },
                { tag: "an item", act: function(s, t) {
                    var own = pageComponent.createObject(root, { "name": "own" })
                    t.pushKind(own)
                    s.pop()
                    t.settle()
                    t.compare(own.parent, root)
                    t.verify(!own.visible)
                    own.destroy() }, depth: 2, top: "B" },
            ]
        }

        function test_move(data) {
            data.act(stack, this)
            settle()
            compare(root.faults, [])
            if (data.log)
                compare(root.log, data.log)
            compare(stack.depth, data.depth)
            compare(stack.currentPage.name, data.top)
            compare(stack.currentPage.status, PageStatus.Active)
            compare(stack.currentPage.x, 0)
            // At rest, only the top page shows; those below wait, Inactive.
            stack.find(function(p) {
                if (p !== stack.currentPage)
                    verify(!p.visible && p.status === PageStatus.Inactive, p.name)
                return false
            })
        }

        function test_formPage_data() {
            return [ { tag: "immediate", operation: PageStackAction.Immediate },
                     { tag: "animated", operation: PageStackAction.Animated } ]
        }

        function test_formPage(data) {
            var page = stack.push(formPage, {}, data.operation)
            tryCompare(page, "status", PageStatus.Active)
            wait(50) // a turn for anything that would take the focus back
            verify(page.field.activeFocus, "the field keeps the focus it was given")
            keyClick(Qt.Key_A)
            keyClick(Qt.Key_B)
            compare(page.field.text, "ab")
            compare(page.applicationWindow, app)
            var loose = formPage.createObject(root)
            compare(loose.applicationWindow, null) // outside a window
            loose.destroy()
        }

        function test_dialog_data() {
            var accepted = ["opened", "accepted"]
            var rejected = ["opened", "rejected"]
            return [
                { tag: "accept button", act: function(d, t) { t.mouseClick(d.header, d.width - 20, 20) }, outcome: accepted },
                { tag: "cancel button", act: function(d, t) { t.mouseClick(d.header, 20, 20) }, outcome: rejected },
                { tag: "swipe forward", act: function(d, t) { t.drag("touch", 380, 60) }, outcome: accepted },
                { tag: "swipe back", act: function(d, t) { t.drag("mouse", 20, 340) }, outcome: rejected },
                { tag: "accept() while it cannot", cannot: true, act: function(d) { d.accept() }, outcome: ["opened"] },
                { tag: "accept button while it cannot", cannot: true,
                  act: function(d, t) { t.mouseClick(d.header, d.width - 20, 20) }, outcome: ["opened"] },
                // Decided while it slides in: it opens first.
                { tag: "accept() while it opens", early: true, act: function(d) { d.accept() }, outcome: accepted },
                { tag: "reject(), and open again at once", act: function(d) { d.reject(); d.open() },
                  outcome: ["opened", "rejected", "opened"] },
                { tag: "reject(), and a push at once", act: function(d, t) { d.reject(); t.page("C", true) },
                  outcome: rejected, depth: 3 },
                // A page pushed from the outcome's handler comes on top of the page below.
                { tag: "accept(), a page pushed when done", act: function(d, t) {
                    d.then = function() { t.page("C", true) }; d.accept() }, outcome: accepted, depth: 3 },
                { tag: "swipe back, a page pushed when done", act: function(d, t) {
                    d.then = function() { t.page("C", true) }; t.drag("mouse", 20, 340) }, outcome: rejected, depth: 3 },
            ]
        }

        function test_dialog(data) {
            var dialog = dialogComponent.createObject(stack.currentPage) // declared in a page, as usual
            dialog.canAccept = !data.cannot
            dialog.open()
            if (!data.early) {
                settle()
                compare(stack.currentPage, dialog)
                compare(dialog.status, DialogStatus.Opened)
            }
            data.act(dialog, this)
            settle()
            var open = data.outcome[data.outcome.length - 1] === "opened"
            compare(dialog.outcome, data.outcome)
            compare(dialog.result, open ? DialogResult.None
                                        : data.outcome[1] === "accepted" ? DialogResult.Accepted : DialogResult.Rejected)
            compare(dialog.visible, open)
            compare(root.faults, [])
            compare(stack.depth, data.depth || (open ? 3 : 2))
            if (!open)
                compare(stack.currentPage.name, data.depth ? "C" : "B")
            compare(dialog.status, open ? DialogStatus.Opened : DialogStatus.Closed)
            dialog.destroy()
        }
    }
}
