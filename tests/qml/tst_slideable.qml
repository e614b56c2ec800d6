import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Sliding views with real drags: where a release settles, the joined ends, the items the
// cache keeps alive (counted), the attached values during a slide, tabs, which of the view
// (or a slider's drag filter) and the page stack takes a swipe, the sources and model edits
// a view follows.
Item {
    id: root
    width: 400; height: 800

    property int made: 0
    property int gone: 0

    Private.SlideableBase {
        id: view
        width: 400; height: 300; model: 100
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
        y: 320; height: 200
        model: ["One", "Two", "Three"]
        delegate: Item {}
    }

    Private.StringListModel { id: strings; strings: ["a", "b", "c"] }
    ListView { id: list; y: 800; width: 100; height: 80; model: strings; delegate: Text { height: 20; text: display } }
    Private.SlideableBase {
        id: fromChildren; y: 800; width: 100; height: 50
        Text { text: "a" }
        Text { text: "b" }
        Text { text: "c" }
    }

    ApplicationWindow {
        id: app
        y: 540; width: 400; height: 260
    }

    Component {
        id: pageWithView
        Page {
            property alias view: inner
            Private.SlideableBase {
                id: inner
                anchors.fill: parent; model: 3
                delegate: Item {}
            }
        }
    }
    // A slider whose drag filter claims the orientations given.
    Component {
        id: pageWithSlider
        Page {
            property alias slider: slider
            MouseArea { id: slider; y: 100; width: parent.width; height: 60 }
        }
    }

    GestureTestCase {
        name: "Slideable"

        function init() {
            strings.strings = ["a", "b", "c"]
            view.loops = false
            view.cacheSize = 2
            view.moveTo(5, TabViewAction.Immediate)
        }

        // Where a release settles; a second finger joining and leaving does not disturb the
        // first, a touch the system takes away settles on the nearer item.
        function test_settle_data() {
            return [
                { tag: "slow, past half: next", from: 350, to: 100, pace: 40, index: 6 },
                { tag: "slow, short of half: back", from: 350, to: 250, pace: 40, index: 5 },
                { tag: "quick flick, short: next", from: 350, to: 280, pace: 5, index: 6 },
                { tag: "quick flick back", from: 50, to: 120, pace: 5, index: 4 },
                { tag: "loops: before the first is the last", start: 0, loops: true, from: 50, to: 300, pace: 40, index: 99 },
                { tag: "no loop: the first stays", start: 0, from: 50, to: 300, pace: 40, index: 0 },
                { tag: "touch, cancelled by the system past half", input: "cancel", from: 350, to: 50, index: 6 },
                { tag: "touch, a second finger comes and goes", input: "second finger", from: 350, to: 50, index: 6 },
            ]
        }

        function test_settle(data) {
            view.loops = !!data.loops
            if (data.start !== undefined)
                view.moveTo(data.start, TabViewAction.Immediate)
            swipe(view, data.input || "mouse", data.from, 150, data.to, 150, { pace: data.pace,
                  released: function() { verify(view.dragging || !data.input) } })
            tryCompare(view, "moving", false)
            compare(view.dragging, false)
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
            swipe(view, "mouse", 350, 150, 100, 150, { pace: 40 })
            tryCompare(view, "moving", false)
            compare(view.currentIndex, 51)
            compare(view.aliveCount, data.alive)
            tryCompare(root, "made", root.gone + data.alive) // released ones are destroyed
            verify(view.itemAt(51) !== null)
            compare(view.itemAt(51 + Math.ceil(data.cache / 2) + 1), null)
        }

        function test_attachedDuringSlide() {
            var current = view.currentItem
            swipe(view, "mouse", 350, 150, 250, 150, { steps: 5, pace: 40, released: function() {
                var next = current.slide.forward
                verify(next !== null)
                compare(next.slide.index, 6)
                verify(next.slide.exposed)
                verify(current.slide.isCurrent && !next.slide.isCurrent)
                verify(current.slide.offset < 0 && current.slide.offset > -1, current.slide.offset)
                fuzzyCompare(next.slide.offset, current.slide.offset + 1, 1e-9)
                compare(next.slide.view, view)
                compare(next.slide.backward, current)
            } })
            tryCompare(view, "moving", false)
        }

        function test_tabs_data() {
            return [
                { tag: "tap the third title", act: function() { mouseClick(tabs, 400 * 5 / 6, 20) }, index: 2 },
                { tag: "swipe to the second", act: function(t) {
                    var y = tabs.view.y + tabs.view.height / 2
                    t.swipe(tabs, "mouse", 350, y, 100, y, { pace: 40 }) }, index: 1 },
            ]
        }

        function test_tabs(data) {
            tabs.moveTo(0, TabViewAction.Immediate)
            data.act(this)
            tryCompare(tabs, "moving", false)
            compare(tabs.currentIndex, data.index)
            compare(tabs.view.aliveCount, 1) // lazily made, one at a time
        }

        // At the view's first item the back swipe is the page stack's; further in, the view's.
        // A slider keeps a sideways drag when its drag filter claims it; the page goes otherwise.
        function test_backSwipe_data() {
            return [
                { tag: "first item: the page goes", index: 0, depth: 1 },
                { tag: "second item: the view slides", index: 1, depth: 2 },
                { tag: "slider claiming sideways drags", orientations: Qt.Horizontal, depth: 2 },
                { tag: "slider claiming up and down only", orientations: Qt.Vertical, depth: 1 },
            ]
        }

        function test_backSwipe(data) {
            var stack = app.pageStack
            stack.clear()
            stack.push(pageWithView, {}, PageStackAction.Immediate)
            var top = stack.push(data.orientations ? pageWithSlider : pageWithView, {}, PageStackAction.Immediate)
            var inner = top.view
            if (data.orientations)
                top.slider.Private.DragFilter.orientations = data.orientations
            else
                inner.moveTo(data.index, TabViewAction.Immediate)
            swipe(stack, "mouse", 20, 130, 300, 130, { steps: 12, pace: 16 })
            tryCompare(stack, "busy", false)
            compare(stack.depth, data.depth)
            if (inner && data.depth === 2) {
                tryCompare(inner, "moving", false)
                compare(inner.currentIndex, 0)
            }
        }

        // The index asked for holds however the declaration orders it against the model, and
        // items lie side by side whatever the source.
        function test_sources_data() {
            var rows = []
            var orders = [
                { name: "model first", text: "model: 5; currentIndex: 2\ndelegate: Text { text: modelData }", current: "2" },
                { name: "index first", text: "currentIndex: 2; model: 5\ndelegate: Text { text: modelData }", current: "2" },
                { name: "delegate first", text: "delegate: Text { text: modelData }\nmodel: 5; currentIndex: 2", current: "2" },
                { name: "list, index first", text: "currentIndex: 2; model: ['a', 'b', 'c', 'd', 'e']\ndelegate: Text { text: modelData }",
                  current: "c" },
                { name: "list, model first", text: "model: ['a', 'b', 'c', 'd', 'e']; currentIndex: 2\ndelegate: Text { text: modelData }",
                  current: "c" },
                { name: "item model", text: "model: strings; currentIndex: 2; delegate: Text { text: modelData }", current: "c" },
            ]
            ;["Private.SlideableBase", "SlideshowView", "TabView"].forEach(function(type) {
                orders.forEach(function(order) {
                    rows.push({ tag: type + ", " + order.name, type: type, properties: order.text, current: order.current })
                })
            })
            return rows.concat({ tag: "children", view: fromChildren, current: "c" })
        }

        function test_sources(data) {
            var made = data.view || Qt.createQmlObject("import QtQuick 2.6; import Quorvane.Pelkan 1.0; "
                                                       + "import Quorvane.Pelkan.private 1.0 as Private; "
                                                       + data.type + " { width: 100; height: 100; " + data.properties + " }", root)
            made.moveTo(data.view ? 2 : made.currentIndex, TabViewAction.Immediate)
            compare(made.currentIndex, 2)
            compare(made.currentItem.Private.Slide.index, 2)
            if (data.type !== "TabView") {
                compare(made.currentItem.text, data.current)
                compare(made.currentItem.x, 0)
                compare(made.itemAt(1).x, -made.width)
            }
            if (!data.view)
                made.destroy()
        }

        // Model edits as a list view shows them: the items are made again for the rows now
        // there, the current one follows its row, a changed row updates the item made for it.
        function test_modelEdits_data() {
            return [
                { tag: "append", edit: function() { strings.append("d") }, shown: ["a", "b", "c", "d"] },
                { tag: "insert", edit: function() { strings.insert(1, "x") }, shown: ["a", "x", "b", "c"] },
                { tag: "remove two", edit: function() { strings.remove(0, 2) }, shown: ["c"] },
                { tag: "move down", edit: function() { strings.move(0, 2) }, shown: ["b", "c", "a"] },
                { tag: "move up", edit: function() { strings.move(2, 0) }, shown: ["c", "a", "b"] },
                { tag: "set: the item stays", edit: function() { strings.set(2, "y") }, shown: ["a", "b", "y"], kept: true },
                { tag: "out of range: nothing", edit: function() { strings.remove(5) }, shown: ["a", "b", "c"], warns: true, kept: true },
                { tag: "the current row removed", edit: function() { strings.remove(2) }, shown: ["a", "b"], current: 1 },
            ]
        }

        function test_modelEdits(data) {
            var made = Qt.createQmlObject("import Quorvane.Pelkan.private 1.0; import QtQuick 2.6; SlideableBase { "
                                          + "width: 100; height: 50; model: strings; currentIndex: 2; delegate: Text { text: modelData } }", root)
            var item = made.currentItem
            if (data.warns)
                ignoreWarning(/out of range/)
            data.edit()
            list.forceLayout()
            compare(strings.count, data.shown.length)
            compare(made.count, data.shown.length)
            if (data.current !== undefined)
                compare(made.currentIndex, data.current)
            if (data.kept)
                compare(made.currentItem, item)
            var listed = [], slid = []
            for (var i = 0; i < data.shown.length; ++i) {
                listed.push(list.itemAtIndex(i).text)
                made.moveTo(i, TabViewAction.Immediate)
                slid.push(made.currentItem.text)
            }
            compare(listed, data.shown)
            compare(slid, data.shown)
            made.destroy()
        }
    }
}
