import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// Pull-down and push-up menus declared inside a Flickable, a ListView and a GridView, and on
// the gallery's list page, with real drags from the edge: how far the menu is out picks the
// item, letting go runs it once the content rests at its edge; pulled clearly past the whole
// menu, or with the touch cancelled, nothing runs. The window is as tall, against the
// pull-down menu, as a 960 px window against a label and four items at pixel ratio 2.
Item {
    id: root
    width: 600; height: Math.round((Theme.itemSizeSmall * 0.6 + 4 * Theme.itemSizeSmall * 0.75 + 2 * Theme.paddingLarge) / 0.7)

    property var log: []
    property int rows: 40
    readonly property var page: app.pageStack.currentPage

    function picked(name, menu) {
        var view = menu.flickable
        log.push({ name: name, view: view, contentY: view.contentY, moving: view.moving, dragging: view.dragging })
    }

    // The same menus in every view, made in it as its declared children are.
    Component {
        id: downMenu
        PullDownMenu {
            id: menu
            MenuLabel { text: "Label" }
            MenuItem { text: "First"; onClicked: root.picked(text, menu) }
            MenuItem { text: "Second"; onClicked: root.picked(text, menu) }
            MenuItem { text: "Third"; onClicked: root.picked(text, menu) }
            MenuItem { text: "Fourth"; onClicked: root.picked(text, menu) }
        }
    }
    Component {
        id: upMenu
        PushUpMenu {
            id: menu
            MenuItem { text: "Up"; onClicked: root.picked(text, menu) }
        }
    }

    ApplicationWindow {
        id: app
        anchors.fill: parent
        initialPage: Component {
            Page {
                property var views: [flickable, list, grid]
                property alias placeholder: placeholder
                Row {
                    anchors.fill: parent
                    Flickable {
                        id: flickable
                        width: parent.width / 3; height: parent.height; contentHeight: root.rows * 50
                        property Item pullDownMenu; property Item pushUpMenu
                        Component.onCompleted: [downMenu, upMenu].forEach(function(menu) { menu.createObject(contentItem) })
                    }
                    ListView {
                        id: list
                        width: parent.width / 3; height: parent.height; model: root.rows
                        header: Rectangle { width: list.width; height: 100; color: Theme.highlightBackgroundColor }
                        delegate: Item { width: list.width; height: 50 }
                        property Item pullDownMenu; property Item pushUpMenu
                        Component.onCompleted: [downMenu, upMenu].forEach(function(menu) { menu.createObject(list) })
                        ViewPlaceholder {
                            id: placeholder
                            enabled: root.rows === 0
                            text: "Nothing here"
                        }
                    }
                    GridView {
                        id: grid
                        width: parent.width / 3; height: parent.height; model: root.rows; cellWidth: width; cellHeight: 50
                        delegate: Item { width: 50; height: 50 }
                        property Item pullDownMenu; property Item pushUpMenu
                        Component.onCompleted: [downMenu, upMenu].forEach(function(menu) { menu.createObject(grid) })
                    }
                }
            }
        }
    }

    GestureTestCase {
        name: "PulleyMenu"

        function init() {
            root.log = []
            root.rows = 40
            for (var i = 0; i < 3; ++i)
                root.page.views[i].contentY = root.page.views[i].originY - root.page.views[i].topMargin
        }

        // How far the content must be out for the middle of a menu's nth child to show.
        function reveal(menu, nth) {
            var item = menu.content[nth === undefined ? menu.content.length - 1 : nth]
            var middle = Theme.paddingLarge + item.y + item.height / 2
            return (menu === menu.flickable.pullDownMenu ? menu.height - middle : middle) + 4
        }

        // One drag from the view's edge (from where the finger can go furthest) in 6 px
        // steps, until the menu is out that far (a number, or a function of the menu) or the
        // finger reaches the other edge.
        function pull(view, down, distance, input) {
            var menu = down ? view.pullDownMenu : view.pushUpMenu
            var far = typeof distance === "function" ? distance : function() { return distance }
            var steps = Math.floor((view.height - 2) / 6)
            swipe(view, input, view.width / 2, down ? 1 : view.height - 1, view.width / 2, down ? 1 + 6 * steps : view.height - 1 - 6 * steps,
                  { steps: steps, pace: 5, moving: function() { return menu.dragDistance >= far() }, released: function() {
                      verify(menu.active)
                      verify(menu.dragDistance >= far(), "out by " + menu.dragDistance + " of " + far())
                  } })
        }

        function test_pick_data() {
            var rows = []
            var views = ["Flickable", "ListView", "GridView"]
            for (var v = 0; v < 3; ++v) {
                rows.push({ tag: views[v] + ", down to the nearest item", view: v, down: true, nth: 4, picked: "Fourth" })
                rows.push({ tag: views[v] + ", down to the far item, in one drag", view: v, down: true, nth: 1, picked: "First" })
                rows.push({ tag: views[v] + ", up, touch", view: v, down: false, input: "touch", picked: "Up" })
            }
            return rows.concat([
                { tag: "the label is never picked", view: 0, down: true, nth: 0, picked: "First" },
                { tag: "down a little: nothing", view: 0, down: true, distance: function() { return Theme.paddingLarge / 2 }, picked: undefined },
                { tag: "the whole menu out and a bit: the far item", view: 0, down: true,
                  distance: function(menu) { return menu.height + Theme.itemSizeLarge / 2 }, rows: 3, picked: "First" },
                { tag: "up, one large item past the menu: still picked", view: 1, down: false,
                  distance: function(menu) { return menu.height + Theme.itemSizeLarge * 0.9 }, picked: "Up" },
                { tag: "up, clearly past the menu: nothing", view: 1, down: false,
                  distance: function(menu) { return menu.height + Theme.itemSizeLarge * 1.2 }, picked: undefined },
                { tag: "short content, down, touch", view: 1, down: true, nth: 2, rows: 2, input: "touch", picked: "Second" },
                { tag: "short content, up", view: 0, down: false, rows: 2, picked: "Up" },
                { tag: "short content, up, two fingers", view: 2, down: false, rows: 2, input: "two fingers", picked: "Up" },
                { tag: "touch cancelled: nothing", view: 1, down: true, nth: 3, input: "cancel", picked: undefined },
            ])
        }

        function test_pick(data) {
            if (data.rows !== undefined) {
                root.rows = data.rows
                init()
            }
            var view = root.page.views[data.view]
            var menu = data.down ? view.pullDownMenu : view.pushUpMenu
            var rest = data.down ? view.contentY : view.originY + Math.max(0, view.contentHeight - view.height)
            view.contentY = rest
            var distance = data.distance ? data.distance(menu) : reveal(menu, data.nth)
            pull(view, data.down, distance, data.input || "mouse")
            tryVerify(function() { return !view.moving && Math.abs(view.contentY - rest) < 0.5 }, 5000, "at " + view.contentY + " of " + rest + " " + view.moving + " log " + JSON.stringify(root.log))
            wait(50)
            if (data.picked === undefined) {
                compare(root.log.length, 0, JSON.stringify(root.log))
            } else {
                compare(root.log.length, 1)
                var run = root.log[0]
                compare(run.name, data.picked)
                compare(run.view, view)
                // Run once the content rested at its edge, never while it was still out.
                compare(run.contentY, rest)
                verify(!run.moving && !run.dragging)
            }
            compare(menu.highlightedItem, null)
            tryCompare(menu, "active", false)
        }

        // A flick towards the menu that would come to rest just short of the content's
        // edge ends at the edge; one that ends well short stays where it ends.
        function test_flickSnaps_data() {
            return [
                { tag: "just short: snaps to the edge", short: 0.5, snapped: true },
                { tag: "well short: stays", short: 4, snapped: false },
            ]
        }

        function test_flickSnaps(data) {
            var view = root.page.views[0]
            root.rows = 200
            var velocity = Math.min(2000 * Theme.pixelRatio, view.maximumFlickVelocity)
            var travel = velocity * velocity / (2 * view.flickDeceleration)
            view.contentY = view.originY + travel + data.short * Theme.itemSizeSmall
            view.flick(0, velocity)
            tryCompare(view, "moving", false, 5000)
            if (data.snapped)
                tryCompare(view, "contentY", view.originY)
            wait(100)
            if (!data.snapped)
                verify(view.contentY - view.originY > Theme.itemSizeSmall, "stopped at " + view.contentY)
            compare(root.log, [])
        }

        // An empty list shows its placeholder below its header, and both move with the
        // content while it is pulled.
        function test_placeholder() {
            root.rows = 0
            var view = root.page.views[1]
            var placeholder = root.page.placeholder
            var header = view.headerItem
            tryCompare(placeholder, "visible", true)
            function gap() { return placeholder.mapToItem(view, 0, 0).y - header.mapToItem(view, 0, header.height).y }
            verify(gap() >= 0, "over the header by " + -gap())
            compare(placeholder.mapToItem(view, 0, placeholder.height).y, view.height)
            var before = gap()
            var headerAt = header.mapToItem(view, 0, 0).y
            swipe(view, "mouse", view.width / 2, 1, view.width / 2, view.height / 2, { steps: 20, released: function() {
                verify(header.mapToItem(view, 0, 0).y > headerAt + Theme.itemSizeSmall)
                compare(gap(), before)
            } })
            tryCompare(view, "moving", false)
        }

        // The gallery's "Lists and menus" page as a user meets it: pulled down from the top,
        // its menu opens entirely and its far item, "Clear", counts down over the page once
        // the list is back; a tap cancels it.
        function test_galleryListsPage() {
            var page = app.pageStack.push(Qt.resolvedUrl("../../examples/gallery/qml/ListsPage.qml"), {}, PageStackAction.Immediate)
            var view = findItem(page, function(item) { return item instanceof ListView })
            var popup = findItem(page, function(item) { return item instanceof RemorsePopup })
            var menu = view.pullDownMenu
            var rows = view.count
            verify(menu && popup && rows > 0)
            view.contentY = view.originY - view.topMargin
            pull(view, true, function() { return menu.height }, "mouse") // the menu grows as it comes out
            tryCompare(popup, "active", true)
            compare(view.contentY, view.originY)
            mouseClick(popup, popup.width / 2, popup.height / 2)
            verify(!popup.active)
            wait(100)
            compare(view.count, rows)
        }

        function cleanup() {
            while (app.pageStack.depth > 1)
                app.pageStack.pop(PageStackAction.Immediate)
        }
    }
}
