import QtQuick 2.6
import QtQuick.Window 2.2
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private
import PelkanTest 1.0

// Sliding views with real drags: where a release settles, the joined ends, the items the
// cache keeps alive (counted), the attached values during a slide, tabs, and which of
// the view and the page stack takes a swipe.
Item {
    id: root
    width: 400
    height: 800

    property int made: 0
    property int gone: 0

    Private.SlideableBase {
        id: view
        width: 400
        height: 300
        model: 100
        delegate: Rectangle {
            // What the view attaches, read back by the test.
            readonly property var slide: ({ index: Private.Slide.index, exposed: Private.Slide.exposed,
                                            isCurrent: Private.Slide.isCurrent, offset: Private.Slide.offset,
                                            view: Private.Slide.view, forward: Private.Slide.forward,
                                            backward: Private.Slide.backward })
            color: index % 2 ? "#333" : "#555"
            Component.onCompleted: ++root.made
            Component.onDestruction: ++root.gone
            MouseArea { anchors.fill: parent } // content that takes presses
        }
    }

    TabView {
        id: tabs
        y: 320
        height: 200
        model: ["One", "Two", "Three"]
        delegate: Item {}
    }

    // The same three items from each kind of source.
    Private.StringListModel { id: strings; strings: ["a", "b", "c"] }
    Component { id: textDelegate; Text { text: modelData } }
    Private.SlideableBase { id: fromNumber; y: 800; width: 100; height: 50; model: 3; delegate: textDelegate }
    Private.SlideableBase { id: fromList; y: 800; width: 100; height: 50; model: ["a", "b", "c"]; delegate: textDelegate }
    Private.SlideableBase { id: fromModel; y: 800; width: 100; height: 50; model: strings; delegate: textDelegate }
    Private.SlideableBase {
        id: fromChildren; y: 800; width: 100; height: 50
        Text { text: "a" }
        Text { text: "b" }
        Text { text: "c" }
    }

    ApplicationWindow {
        id: app
        y: 540
        width: 400
        height: 260
    }

    Component {
        id: pageWithView
        Page {
            property alias view: inner
            Private.SlideableBase {
                id: inner
                anchors.fill: parent
                model: 3
                delegate: Item {}
            }
        }
    }

    TestCase {
        name: "Slideable"
        when: windowShown

        function drag(target, fromX, toX, y, steps, pace, beforeRelease) {
            mousePress(target, fromX, y)
            for (var i = 1; i <= steps; ++i)
                mouseMove(target, fromX + (toX - fromX) * i / steps, y, pace)
            if (beforeRelease)
                beforeRelease()
            mouseRelease(target, toX, y, Qt.LeftButton, Qt.NoModifier, pace)
        }

        function init() {
            view.loops = false
            view.cacheSize = 2
            view.moveTo(5, TabViewAction.Immediate)
        }

        function test_settle_data() {
            return [
                { tag: "slow, past half: next", from: 350, to: 100, pace: 40, index: 6 },
                { tag: "slow, short of half: back", from: 350, to: 250, pace: 40, index: 5 },
                { tag: "quick flick, short: next", from: 350, to: 280, pace: 5, index: 6 },
                { tag: "quick flick back", from: 50, to: 120, pace: 5, index: 4 },
                { tag: "loops: before the first is the last", start: 0, loops: true, from: 50, to: 300, pace: 40, index: 99 },
                { tag: "no loop: the first stays", start: 0, from: 50, to: 300, pace: 40, index: 0 },
            ]
        }

        function test_settle(data) {
            view.loops = !!data.loops
            if (data.start !== undefined)
                view.moveTo(data.start, TabViewAction.Immediate)
            drag(view, data.from, data.to, 150, 10, data.pace)
            tryCompare(view, "moving", false)
            compare(view.currentIndex, data.index)
            compare(view.position, data.index)
            compare(view.currentItem.x, 0)
        }

        // Only the current item and cacheSize neighbours live, however far the view goes.
        function test_cache_data() {
            return [
                { tag: "none", cache: 0, alive: 1 },
                { tag: "two", cache: 2, alive: 3 },
                { tag: "five", cache: 5, alive: 6 },
            ]
        }

        function test_cache(data) {
            view.cacheSize = data.cache
            view.moveTo(50, TabViewAction.Immediate)
            compare(view.aliveCount, data.alive)
            drag(view, 350, 100, 150, 10, 40)
            tryCompare(view, "moving", false)
            compare(view.currentIndex, 51)
            compare(view.aliveCount, data.alive)
            tryCompare(root, "made", root.gone + data.alive) // released ones are destroyed
            verify(view.itemAt(51) !== null)
            compare(view.itemAt(51 + Math.ceil(data.cache / 2) + 1), null)
        }

        function test_attachedDuringSlide() {
            var current = view.currentItem
            drag(view, 350, 250, 150, 5, 40, function() {
                verify(view.dragging)
                var next = current.slide.forward
                verify(next !== null)
                compare(next.slide.index, 6)
                verify(next.slide.exposed)
                verify(current.slide.isCurrent && !next.slide.isCurrent)
                verify(current.slide.offset < 0 && current.slide.offset > -1, current.slide.offset)
                fuzzyCompare(next.slide.offset, current.slide.offset + 1, 1e-9)
                compare(next.slide.view, view)
                compare(next.slide.backward, current)
            })
            tryCompare(view, "moving", false)
        }

        function test_tabs_data() {
            return [
                { tag: "tap the third title", act: function() { mouseClick(tabs, 400 * 5 / 6, 20) }, index: 2 },
                { tag: "swipe to the second", act: function() { drag(tabs, 350, 100, tabs.view.y + tabs.view.height / 2, 10, 40) }, index: 1 },
            ]
        }

        function test_tabs(data) {
            tabs.moveTo(0, TabViewAction.Immediate)
            data.act()
            tryCompare(tabs, "moving", false)
            compare(tabs.currentIndex, data.index)
            compare(tabs.view.aliveCount, 1) // lazily made, one at a time
        }

        // At the view's first item the back swipe is the page stack's; further in, the view's.
        function test_backSwipe_data() {
            return [
                { tag: "first item: the page goes", index: 0, depth: 1, viewIndex: 0 },
                { tag: "second item: the view slides", index: 1, depth: 2, viewIndex: 0 },
            ]
        }

        function test_backSwipe(data) {
            var stack = app.pageStack
            stack.clear()
            stack.push(pageWithView, {}, PageStackAction.Immediate)
            var page = stack.push(pageWithView, {}, PageStackAction.Immediate)
            page.view.moveTo(data.index, TabViewAction.Immediate)
            var inner = page.view
            drag(stack, 20, 300, 130, 12, 16)
            tryCompare(stack, "busy", false)
            compare(stack.depth, data.depth)
            if (data.depth === 2) {
                tryCompare(inner, "moving", false)
                compare(inner.currentIndex, data.viewIndex)
            }
        }

        function test_sources_data() {
            return [
                { tag: "number", view: fromNumber, second: "1" },
                { tag: "list", view: fromList, second: "b" },
                { tag: "item model", view: fromModel, second: "b" },
                { tag: "children", view: fromChildren, second: "b" },
            ]
        }

        function test_sources(data) {
            compare(data.view.count, 3)
            data.view.moveTo(1, TabViewAction.Immediate)
            compare(data.view.currentItem.text, data.second)
            compare(data.view.currentItem.x, 0)
            compare(data.view.itemAt(2).x, data.view.width)
            data.view.moveTo(0, TabViewAction.Immediate)
        }

        // The index asked for holds however the declaration orders it against the model.
        function test_declarationOrder_data() {
            var rows = []
            var types = ["Private.SlideableBase", "SlideshowView", "TabView"]
            var orders = [
                { name: "model first", text: "model: 5; currentIndex: 2\ndelegate: Item {}" },
                { name: "index first", text: "currentIndex: 2; model: 5\ndelegate: Item {}" },
                { name: "delegate first", text: "delegate: Item {}\nmodel: 5; currentIndex: 2" },
                { name: "list, index first", text: "currentIndex: 2; model: ['a', 'b', 'c', 'd', 'e']\ndelegate: Item {}" },
                { name: "list, model first", text: "model: ['a', 'b', 'c', 'd', 'e']; currentIndex: 2\ndelegate: Item {}" },
            ]
            for (var t = 0; t < types.length; ++t) {
                for (var o = 0; o < orders.length; ++o)
                    rows.push({ tag: types[t] + ", " + orders[o].name, type: types[t], properties: orders[o].text })
            }
            return rows
        }

        function test_declarationOrder(data) {
            var view = Qt.createQmlObject("import QtQuick 2.6; import Quorvane.Pelkan 1.0; "
                                          + "import Quorvane.Pelkan.private 1.0 as Private; "
                                          + data.type + " { width: 100; height: 100; " + data.properties + " }", root)
            compare(view.currentIndex, 2)
            verify(view.currentItem !== null)
            compare(view.currentItem.Private.Slide.index, 2)
            view.destroy()
        }

        // Rows that come and go make the items again for the rows now there; a row that
        // changes updates its item.
        function test_modelEdits() {
            fromModel.moveTo(2, TabViewAction.Immediate)
            strings.remove(2)
            compare(fromModel.count, 2)
            compare(fromModel.currentIndex, 1)
            compare(fromModel.currentItem.text, "b")
            strings.insert(0, "z")
            compare(fromModel.itemAt(0).text, "z")
            // A changed row reaches the item made for it, which stays.
            var item = fromModel.itemAt(0)
            strings.set(0, "y")
            compare(fromModel.itemAt(0), item)
            compare(item.text, "y")
            strings.strings = ["a", "b", "c"]
        }

        // Touch: a second finger joining and leaving does not disturb the first; a touch the
        // system takes away settles on the nearer item.
        function test_touch_data() {
            return [
                { tag: "cancelled by the system", cancel: true, index: 6 },
                { tag: "a second finger comes and goes", secondFinger: true, index: 6 },
            ]
        }

        function test_touch(data) {
            var touch = touchEvent(view)
            touch.press(0, view, 350, 150).commit()
            for (var i = 1; i <= 10; ++i) {
                if (data.secondFinger && i === 4)
                    touch.stationary(0).press(1, view, 100, 200).commit()
                else if (data.secondFinger && i > 4 && i < 8)
                    touch.move(0, view, 350 - 30 * i, 150).move(1, view, 100, 200 + i).commit()
                else if (data.secondFinger && i === 8)
                    touch.move(0, view, 350 - 30 * i, 150).release(1, view, 100, 210).commit()
                else
                    touch.move(0, view, 350 - 30 * i, 150).commit()
            }
            verify(view.dragging)
            if (data.cancel)
                TouchSystem.cancel(root.Window.window)
            else
                touch.release(0, view, 50, 150).commit()
            tryCompare(view, "moving", false)
            compare(view.dragging, false)
            compare(view.currentIndex, data.index) // moved 300 of 400: the nearer item
        }
    }
}
