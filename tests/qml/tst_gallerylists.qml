import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// The gallery's "Lists and menus" page as a user meets it: pulled down from the top, its
// menu opens entirely and its far item runs once the list is back.
Item {
    id: root
    width: 540
    height: 960

    ApplicationWindow {
        id: app
        anchors.fill: parent
        initialPage: Qt.resolvedUrl("../../examples/gallery/qml/ListsPage.qml")
    }

    TestCase {
        name: "GalleryLists"
        when: windowShown

        function find(item, type) {
            if (item instanceof type)
                return item
            for (var i = 0; i < item.children.length; ++i) {
                var found = find(item.children[i], type)
                if (found)
                    return found
            }
            return null
        }

        function test_pullDownMenuOpens() {
            tryVerify(function() { return app.pageStack.currentPage !== null })
            var page = app.pageStack.currentPage
            var view = find(page, ListView)
            var menu = find(page, PullDownMenu)
            var popup = find(page, RemorsePopup)
            verify(view && menu && popup)
            compare(menu.flickable, view)
            var rows = view.count
            verify(rows > 0)

            mousePress(view, view.width / 2, 1)
            for (var y = 7; y < view.height && menu.dragDistance < menu.height; y += 6) {
                mouseMove(view, view.width / 2, y)
                wait(5)
            }
            verify(menu.active)
            verify(menu.dragDistance >= menu.height, "out by " + menu.dragDistance + " of " + menu.height)
            compare(menu.highlightedItem.text, "Clear")
            mouseRelease(view, view.width / 2, y)

            // "Clear" counts down over the page once the list is back; a tap cancels it.
            tryCompare(popup, "active", true)
            compare(view.contentY, view.originY)
            mouseClick(popup, popup.width / 2, popup.height / 2)
            verify(!popup.active)
            wait(100)
            compare(view.count, rows)
        }
    }
}
