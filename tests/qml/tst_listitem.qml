import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// List items with real presses: click, long press opening the context menu below the item
// and pushing the next rows aside, a tap on a menu item, a press elsewhere closing it, and
// a swipe over an item dropping its highlight, keys; and the row the theme lays out from its
// text, description and icon.
Item {
    id: root
    width: 800; height: 800

    property var log: []

    ListView {
        id: view
        width: 400; height: parent.height; model: 5
        delegate: ListItem {
            id: row
            objectName: "row" + index
            onClicked: root.log.push("clicked " + index)
            menu: Component {
                ContextMenu {
                    MenuItem { text: "Delete"; onClicked: root.log.push("delete " + index) }
                }
            }
            Text { text: "Row " + index; anchors.verticalCenter: parent.verticalCenter }
        }
    }

    ListItem { id: themed; x: 400; width: 400 }

    GestureTestCase {
        name: "ListItem"

        function row(i) { return view.itemAtIndex(i) }

        function init() {
            root.log = []
            for (var i = 0; i < 5; ++i)
                row(i).closeMenu()
        }

        function longPress(item) {
            mousePress(item, 50, 10)
            tryCompare(item, "menuOpen", true, 3000)
            mouseRelease(item, 50, 10)
        }

        function test_click() {
            mousePress(row(1), 50, 10)
            verify(row(1).highlighted)
            mouseRelease(row(1), 50, 10)
            compare(root.log, ["clicked 1"])
            verify(!row(1).highlighted)
        }

        function test_menu_data() {
            return [
                { tag: "a tap on its item runs it and closes it", tap: "item", log: ["delete 1"] },
                { tag: "a press on another row closes it", tap: "row", log: ["clicked 3"] },
            ]
        }

        function test_menu(data) {
            var below = row(2).y
            longPress(row(1))
            tryVerify(function() { return row(2).y > below }, 2000, "the rows below make room")
            compare(root.log, [])
            if (data.tap === "item")
                mouseClick(row(1), 50, row(1).contentHeight + 10)
            else
                mouseClick(row(3), 50, 10)
            tryCompare(row(1), "menuOpen", false)
            compare(root.log, data.log)
            tryCompare(row(2), "y", below)
        }

        function test_swipeDropsTheHighlight() {
            mousePress(row(1), 50, 10)
            verify(row(1).highlighted)
            for (var x = 55; x <= 100; x += 5)
                mouseMove(row(1), x, 10)
            verify(!row(1).highlighted)
            verify(row(1).down)
            mouseRelease(row(1), 100, 10)
        }

        // Return and Space click; the Menu key opens the menu with its item focused.
        function test_keys() {
            row(2).forceActiveFocus()
            keyClick(Qt.Key_Return)
            keyClick(Qt.Key_Space)
            keyClick(Qt.Key_Menu)
            verify(row(2).menuOpen)
            keyClick(Qt.Key_Return)
            tryCompare(row(2), "menuOpen", false)
            compare(root.log, ["clicked 2", "clicked 2", "delete 2"])
        }

        // Text at the start (after the icon, where there is one), the description under it,
        // both in the palette's colours, the highlight ones while the row is highlighted.
        function test_themedRow_data() {
            return [
                { tag: "text", text: "Inbox", height: Theme.itemSizeSmall, x: Theme.horizontalPageMargin },
                { tag: "text and description", text: "Inbox", description: "3 new", height: Theme.itemSizeMedium,
                  x: Theme.horizontalPageMargin },
                { tag: "with an icon", text: "Inbox", icon: "image://theme/icon-m-favorite", height: Theme.itemSizeSmall,
                  x: Theme.horizontalPageMargin + Theme.iconSizeMedium + Theme.paddingLarge },
                { tag: "mirrored", text: "Inbox", mirrored: true, height: Theme.itemSizeSmall, right: Theme.horizontalPageMargin },
            ]
        }

        function test_themedRow(data) {
            themed.LayoutMirroring.enabled = !!data.mirrored
            themed.text = data.text
            themed.description = data.description || ""
            themed.iconSource = data.icon || ""
            compare(themed.height, data.height)
            var label = findItem(themed, function(child) { return child.text === data.text && child.font !== undefined })
            verify(label, "the text is drawn")
            var at = label.mapToItem(themed, 0, 0)
            if (data.right !== undefined)
                compare(Math.round(themed.width - at.x - label.contentWidth - (label.width - label.contentWidth)), Math.round(data.right))
            else
                compare(Math.round(at.x), Math.round(data.x))
            compare(String(label.color), String(themed.palette.primaryColor))
            themed.highlighted = true
            compare(String(label.color), String(themed.palette.highlightColor))
            themed.highlighted = false
            themed.LayoutMirroring.enabled = false
        }
    }
}
