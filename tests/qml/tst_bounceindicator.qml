import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// The bounce of a flickable without a menu: dragged past its top it grows, dragged within
// its content nothing shows, and letting go ends it.
Item {
    id: root
    width: 400
    height: 800

    ApplicationWindow {
        id: app
        anchors.fill: parent
        initialPage: Component {
            Page {
                property alias flickable: flickable
                property alias indicator: indicator
                Flickable {
                    id: flickable
                    anchors.fill: parent
                    contentHeight: 3000
                    boundsBehavior: Flickable.StopAtBounds
                    BounceIndicator { id: indicator }
                }
            }
        }
    }

    TestCase {
        name: "BounceIndicator"
        when: windowShown

        function test_drag_data() {
            return [
                { tag: "past the top", contentY: 0, active: true },
                { tag: "within the content", contentY: 1000, active: false },
            ]
        }

        function test_drag(data) {
            var page = app.pageStack.currentPage
            page.flickable.contentY = data.contentY
            var y = 100
            mousePress(page.flickable, 200, y)
            for (var i = 0; i < 20; ++i) {
                y += 10
                mouseMove(page.flickable, 200, y)
            }
            compare(page.indicator.active, data.active)
            compare(page.indicator.amount > 0, data.active)
            mouseRelease(page.flickable, 200, y)
            verify(!page.indicator.active)
        }
    }
}
