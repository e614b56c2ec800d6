import QtQuick 2.6
import QtQuick.Window 2.2
import QtTest 1.2
import Quorvane.Pelkan 1.0
import PelkanTest 1.0

// The page stack through its public surface: swipes with real mouse and touch events,
// page statuses for every kind of move, and dialogs.
Item {
    id: root
    width: 400
    height: 600

    property var log: []
    property double now: 0 // the stack's clock

    ApplicationWindow {
        id: app
        anchors.fill: parent
    }

    Component {
        id: pageComponent
        Page {
            property string name
            onStatusChanged: root.log.push(name + ":" + ["Inactive", "Activating", "Active", "Deactivating"][status])
            MouseArea { anchors.fill: parent } // content that takes presses, as a list does
        }
    }

    Component {
        id: dialogComponent
        Dialog {
            property var outcome: []
            onAccepted: outcome.push("accepted")
            onRejected: outcome.push("rejected")
            DialogHeader { id: header }
            property alias header: header
        }
    }

    TestCase {
        name: "PageStack"
        when: windowShown

        readonly property Item stack: app.pageStack

        function init() {
            stack._now = function() { return root.now }
            stack.clear()
            stack.push(pageComponent, { "name": "A" }, PageStackAction.Immediate)
            stack.push(pageComponent, { "name": "B" }, PageStackAction.Immediate)
            compare(stack.depth, 2)
            root.log = []
        }

        function settle() {
            tryCompare(stack, "busy", false)
        }

        // A finger (or the mouse) from one x to another at mid-height in a dozen moves;
        // the callback sees the stack between the last move and the release.
        function drag(input, fromX, toX, beforeRelease, msPerMove) {
            var y = 300
            var steps = 12
            var touch = input === "touch" ? touchEvent(stack) : null
            if (touch)
                touch.press(0, stack, fromX, y).commit()
            else
                mousePress(stack, fromX, y)
            for (var i = 1; i <= steps; ++i) {
                root.now += msPerMove || 16 // a finger's pace at 60 frames a second
                var x = fromX + (toX - fromX) * i / steps
                if (touch)
                    touch.move(0, stack, x, y).commit()
                else
                    mouseMove(stack, x, y)
            }
            if (beforeRelease)
                beforeRelease()
            if (input === "cancel")
                return
            if (touch)
                touch.release(0, stack, toX, y).commit()
            else
                mouseRelease(stack, toX, y)
        }

        function test_swipe_data() {
            return [
                { tag: "mouse, back past half", input: "mouse", to: 300, depth: 1, top: "A" },
                { tag: "mouse, back before half", input: "mouse", to: 150, depth: 2, top: "B" },
                { tag: "touch, back past half", input: "touch", to: 300, depth: 1, top: "A" },
                { tag: "touch, back before half", input: "touch", to: 150, depth: 2, top: "B" },
                { tag: "touch, a quick flick before half", input: "touch", to: 150, pace: 4, depth: 1, top: "A" },
                { tag: "touch, taken away by the system", input: "cancel", to: 300, depth: 2, top: "B" },
            ]
        }

        function test_swipe(data) {
            var page = stack.currentPage
            drag(data.input === "cancel" ? "touch" : data.input, 20, data.to, function() {
                // The page follows the finger, the one below comes in from the left.
                verify(stack._leftFlickDifference > 0)
                compare(page.parent.x, stack._leftFlickDifference)
                compare(stack.previousPage.parent.x, stack._leftFlickDifference - stack.width)
                if (data.input === "cancel")
                    TouchSystem.cancel(root.Window.window)
            }, data.pace)
            settle()
            compare(stack.depth, data.depth)
            compare(stack.currentPage.name, data.top)
            compare(stack.currentPage.parent.x, 0)
        }

        function test_status_data() {
            // What happens, and the statuses it leaves in the log, in order.
            var push = ["B:Deactivating", "C:Activating", "B:Inactive", "C:Active"]
            var pop = ["B:Deactivating", "A:Activating", "B:Inactive", "A:Active"]
            var forward = ["B:Deactivating", "N:Activating", "B:Inactive", "N:Active"]
            return [
                { tag: "push, animated", act: function(s) { s.push(pageComponent, { "name": "C" }) }, log: push },
                { tag: "push, immediate", act: function(s) { s.push(pageComponent, { "name": "C" }, PageStackAction.Immediate) }, log: push },
                { tag: "pop, animated", act: function(s) { s.pop() }, log: pop },
                { tag: "pop, immediate", act: function(s) { s.pop(PageStackAction.Immediate) }, log: pop },
                { tag: "replace", act: function(s) { s.replace(pageComponent, { "name": "C" }) }, log: push },
                { tag: "swipe back", act: function(s, t) { t.drag("mouse", 20, 300) }, log: pop },
                { tag: "navigate forward", act: function(s) {
                    s.pushAttached(pageComponent, { "name": "N" }); s.navigateForward() }, log: forward },
                { tag: "swipe forward", act: function(s, t) {
                    s.pushAttached(pageComponent, { "name": "N" }); t.drag("touch", 380, 100) }, log: forward },
            ]
        }

        function test_status(data) {
            data.act(stack, this)
            settle()
            compare(root.log, data.log)
        }

        function test_backKeyPopsOnlyOnTheDevice() {
            // The Back key belongs to the device's compositor; elsewhere it does nothing.
            stack.forceActiveFocus()
            keyClick(Qt.Key_Back)
            settle()
            compare(stack.depth, 2)
        }

        function test_dialog_data() {
            return [
                { tag: "accept button", act: function(d, t) { t.mouseClick(d.header, d.width - 20, 20) }, result: DialogResult.Accepted },
                { tag: "cancel button", act: function(d, t) { t.mouseClick(d.header, 20, 20) }, result: DialogResult.Rejected },
                { tag: "accept()", act: function(d) { d.accept() }, result: DialogResult.Accepted },
                { tag: "reject()", act: function(d) { d.reject() }, result: DialogResult.Rejected },
                { tag: "swipe forward", act: function(d, t) { t.drag("touch", 380, 60) }, result: DialogResult.Accepted },
                { tag: "swipe back", act: function(d, t) { t.drag("mouse", 20, 340) }, result: DialogResult.Rejected },
                { tag: "accept() while it cannot", cannot: true, act: function(d) { d.accept() }, result: DialogResult.None },
                { tag: "accept button while it cannot", cannot: true,
                  act: function(d, t) { t.mouseClick(d.header, d.width - 20, 20) }, result: DialogResult.None },
            ]
        }

        function test_dialog(data) {
            var dialog = dialogComponent.createObject(stack.currentPage) // declared in a page, as usual
            dialog.canAccept = !data.cannot
            dialog.open()
            settle()
            compare(stack.currentPage, dialog)
            compare(dialog.status, DialogStatus.Opened)
            data.act(dialog, this)
            settle()
            compare(dialog.result, data.result)
            var expected = data.result === DialogResult.None ? [] : [data.result === DialogResult.Accepted ? "accepted" : "rejected"]
            compare(dialog.outcome, expected)
            compare(stack.depth, data.result === DialogResult.None ? 3 : 2)
            compare(dialog.status, data.result === DialogResult.None ? DialogStatus.Opened : DialogStatus.Closed)
            dialog.destroy()
        }

        function test_pageKinds_data() {
            return [
                { tag: "component", page: pageComponent },
                { tag: "URL", page: Qt.resolvedUrl("../../qml/Quorvane/Pelkan/pages/Page.qml") },
                { tag: "module and name", page: "Quorvane.Pelkan.Page" },
                { tag: "module path and name", page: "Quorvane/Pelkan/Page" },
                { tag: "instance", instance: true },
            ]
        }

        function test_pageKinds(data) {
            var own = data.instance ? pageComponent.createObject(root, { "name": "own" }) : null
            var page = stack.push(own || data.page, { "backNavigation": false }, PageStackAction.Immediate)
            verify(page)
            compare(stack.currentPage, page)
            compare(page.backNavigation, false, "properties given with the push")
            compare(stack.find(function(p) { return p.name === "A" }).name, "A")
            stack.pop(PageStackAction.Immediate)
            compare(stack.depth, 2)
            if (own) {
                // Instances stay the application's: popped, they go back where they were.
                compare(own.parent, root)
                verify(!own.visible)
                own.destroy()
            }
        }
    }
}
