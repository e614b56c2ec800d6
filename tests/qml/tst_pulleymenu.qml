import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// The pull-down menu with a real drag: how far it is pulled picks the item, letting go
// runs it.
Item {
    id: root
    width: 400
    height: 1400

    property var picked: []

    Flickable {
        id: flickable
        anchors.fill: parent
        contentHeight: 1200

        PullDownMenu {
            id: menu
            MenuItem { text: "First"; onClicked: root.picked.push("First") }
            MenuItem { text: "Second"; onClicked: root.picked.push("Second") }
        }
    }

    TestCase {
        name: "PullDownMenu"
        when: windowShown

        function test_pull_data() {
            return [
                { tag: "a little: nothing", distance: 30, picked: [] },
                { tag: "past the nearest item", distance: menu.height - menu._contentColumn.children[1].y, picked: ["Second"] },
                { tag: "past both", distance: menu.height - menu._contentColumn.y, picked: ["First"] },
            ]
        }

        function test_pull(data) {
            root.picked = []
            var y = 20
            mousePress(flickable, 200, y)
            // Moves in small steps, as a finger does, until the menu is out that far (the
            // content follows the finger less than one to one past its edge).
            while (menu.dragDistance < data.distance && y < 1380) {
                y += 6
                mouseMove(flickable, 200, y)
                wait(5)
            }
            verify(menu.visible)
            mouseRelease(flickable, 200, y)
            tryCompare(flickable, "moving", false)
            compare(root.picked, data.picked)
            compare(menu.highlightedItem, null)
        }
    }
}
