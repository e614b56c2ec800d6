import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// Pull-down and push-up menus with real drags: how far the menu is out picks the item,
// letting go runs it; pulled past the whole menu, nothing runs.
Item {
    id: root
    width: 400
    height: 1400

    property var picked: []
    property int contentHeight: 3000

    Flickable {
        id: flickable
        anchors.fill: parent
        contentHeight: root.contentHeight
        // Set by the menus themselves.
        property Item pullDownMenu
        property Item pushUpMenu

        PullDownMenu {
            id: pullDown
            busy: true
            MenuItem { text: "First"; onClicked: root.picked.push("First") }
            MenuLabel { text: "A label is never picked" }
            MenuItem { text: "Second"; onClicked: root.picked.push("Second") }
        }
        PushUpMenu {
            id: pushUp
            MenuItem { text: "Third"; onClicked: root.picked.push("Third") }
            MenuItem { text: "Fourth"; onClicked: root.picked.push("Fourth") }
        }
    }

    TestCase {
        name: "PulleyMenu"
        when: windowShown

        function test_menusKnowTheirFlickable() {
            compare(flickable.pullDownMenu, pullDown)
            compare(flickable.pushUpMenu, pushUp)
        }

        function reveal(menu, nth) {
            // The distance at which the middle of the nth picked item comes out.
            var column = menu._contentColumn
            var item = column.children[nth]
            var middle = column.y + item.y + item.height / 2
            return (menu._pullDown ? menu.height - middle : middle) + 4
        }

        function test_pull_data() {
            return [
                { tag: "down a little: nothing", menu: pullDown, distance: function() { return 10 }, picked: [] },
                { tag: "down past the nearest item", menu: pullDown, distance: function() { return reveal(pullDown, 2) }, picked: ["Second"] },
                { tag: "down past the label", menu: pullDown, distance: function() { return reveal(pullDown, 1) }, picked: ["Second"] },
                { tag: "down past both", menu: pullDown, distance: function() { return reveal(pullDown, 0) }, picked: ["First"] },
                { tag: "down past the whole menu: nothing", menu: pullDown, distance: function() { return pullDown.height + 20 }, picked: [] },
                { tag: "down, content shorter than the view", menu: pullDown, content: 300,
                  distance: function() { return reveal(pullDown, 2) }, picked: ["Second"] },
                { tag: "up past the nearest item", menu: pushUp, distance: function() { return reveal(pushUp, 0) }, picked: ["Third"] },
                { tag: "up past both", menu: pushUp, distance: function() { return reveal(pushUp, 1) }, picked: ["Fourth"] },
                { tag: "up, content shorter than the view", menu: pushUp, content: 300,
                  distance: function() { return reveal(pushUp, 0) }, picked: ["Third"] },
            ]
        }

        function test_pull(data) {
            root.picked = []
            root.contentHeight = data.content || 3000
            var down = data.menu === pullDown
            flickable.contentY = down ? flickable.originY : data.menu._inactivePosition
            var target = data.distance()
            var y = down ? 20 : 1380
            mousePress(flickable, 200, y)
            mouseMove(flickable, 200, y + (down ? 6 : -6))
            // Small steps, as a finger moves, until the menu is out that far (past its edge
            // the content follows the finger less than one to one).
            while (data.menu.dragDistance < target && y > 10 && y < 1390) {
                y += down ? 6 : -6
                mouseMove(flickable, 200, y)
                wait(5)
            }
            verify(data.menu.opacity > 0)
            verify(data.menu.active)
            mouseRelease(flickable, 200, y)
            tryCompare(flickable, "moving", false)
            tryCompare(data.menu, "_snapping", false)
            compare(root.picked, data.picked)
            compare(data.menu.highlightedItem, null)
            tryCompare(data.menu, "active", false)
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
            root.contentHeight = 6000
            var velocity = Math.min(2 * pullDown._snapCalculationVelocity, flickable.maximumFlickVelocity)
            var travel = velocity * velocity / (2 * flickable.flickDeceleration)
            flickable.contentY = flickable.originY + travel + data.short * pullDown._snapThreshold
            flickable.flick(0, velocity)
            tryCompare(flickable, "moving", false, 5000)
            tryCompare(pullDown, "_snapping", false)
            if (data.snapped)
                compare(flickable.contentY, flickable.originY)
            else
                verify(flickable.contentY - flickable.originY > pullDown._snapThreshold,
                       "stopped at " + flickable.contentY)
            compare(root.picked, [])
        }
    }
}
