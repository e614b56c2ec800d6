import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A page of a thousand rows in a column: only those in the view, plus the margin, are drawn,
// and culled rows keep their place; the quick-scroll button appears after a fast flick, not
// after a slow drag, hides a pause after the movement ends and takes the view to the end it
// offers; dragged past its top the bounce grows, within its content nothing shows.
Item {
    id: root
    width: 400; height: 600

    ApplicationWindow {
        id: app
        anchors.fill: parent
        initialPage: Component {
            Page {
                property alias flickable: flickable
                property alias cull: cull
                property alias rows: rows
                property alias bounce: bounce
                property alias quick: quick
                Flickable {
                    id: flickable
                    anchors.fill: parent; contentHeight: column.height; boundsBehavior: Flickable.StopAtBounds
                    Column {
                        id: column
                        width: parent.width
                        Private.VisibilityCull { id: cull }
                        Repeater {
                            id: rows
                            model: 1000
                            Rectangle { width: column.width; height: 50; color: index % 2 ? "#224" : "#446" }
                        }
                    }
                    BounceIndicator { id: bounce }
                }
                QuickScroll { id: quick; flickable: flickable; pause: 300 }
            }
        }
    }

    GestureTestCase {
        name: "Scrolling"

        readonly property Item page: app.pageStack.currentPage
        readonly property Item flickable: page ? page.flickable : null

        function init() {
            tryVerify(function() { return page !== null })
            tryCompare(flickable, "moving", false, 10000)
        }

        function test_cull_data() {
            return [
                { tag: "top", contentY: 0, margin: 0, drawn: 12 },
                { tag: "top, with a margin", contentY: 0, margin: 100, drawn: 14 },
                { tag: "middle, between rows", contentY: 5025, margin: 0, drawn: 13 },
                { tag: "end", contentY: 50000 - 600, margin: 0, drawn: 12 },
            ]
        }

        function test_cull(data) {
            page.cull.margin = data.margin
            flickable.contentY = data.contentY
            tryCompare(page.cull, "drawnCount", data.drawn)
            compare(page.rows.itemAt(999).y, 999 * 50) // culled rows keep their place
            compare(flickable.contentHeight, 50000)
            // What is drawn at the top of the view is the row there.
            compare(String(grabImage(root).pixel(200, 1)), String(Math.floor(data.contentY / 50) % 2 ? "#222244" : "#444466"))
        }

        // pace: milliseconds between moves, as the events' time stamps say.
        function test_quickScroll_data() {
            return [
                { tag: "fast flick up the content: to the bottom", from: 550, to: 50, steps: 5, pace: 1, end: 50000 - 600 },
                { tag: "fast flick down the content: to the top", from: 50, to: 550, steps: 5, pace: 1, end: 0 },
                { tag: "a slow short drag: nothing", from: 300, to: 250, steps: 10, pace: 30 },
                { tag: "it hides a pause after the movement ends", from: 550, to: 50, steps: 5, pace: 1, hides: true },
            ]
        }

        function test_quickScroll(data) {
            var quick = page.quick
            flickable.contentY = 10000
            swipe(flickable, "mouse", 200, data.from, 200, data.to, { steps: data.steps, pace: data.pace })
            if (data.end === undefined && !data.hides) {
                tryCompare(flickable, "moving", false)
                verify(!quick.active)
                return
            }
            tryCompare(quick, "active", true)
            if (data.hides) {
                tryCompare(flickable, "moving", false, 10000)
                tryCompare(quick, "active", false, 2000)
                return
            }
            mouseClick(quick, quick.width / 2, quick.height / 2)
            tryCompare(flickable, "contentY", data.end)
            verify(!quick.active)
        }

        function test_bounce_data() {
            return [
                { tag: "past the top", contentY: 0, active: true },
                { tag: "within the content", contentY: 1000, active: false },
            ]
        }

        function test_bounce(data) {
            var bounce = page.bounce
            flickable.contentY = data.contentY
            swipe(flickable, "mouse", 200, 100, 200, 300, { steps: 20, released: function() {
                compare(bounce.active, data.active)
                compare(bounce.amount > 0, data.active)
            } })
            verify(!bounce.active)
        }
    }
}
