import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// The quick-scroll button on a long list: it appears after a fast flick, not after a slow
// drag, hides a pause after the movement ends, and takes the view to the end it offers.
Item {
    id: root
    width: 400
    height: 600

    Flickable {
        id: flickable
        anchors.fill: parent
        contentHeight: 30000
    }
    QuickScroll {
        id: quick
        flickable: flickable
        pause: 300
    }

    TestCase {
        name: "QuickScroll"
        when: windowShown

        // pace: milliseconds between moves, as the events' time stamps say.
        function drag(fromY, toY, steps, pace) {
            mousePress(flickable, 200, fromY)
            for (var i = 1; i <= steps; ++i)
                mouseMove(flickable, 200, fromY + (toY - fromY) * i / steps, pace)
            mouseRelease(flickable, 200, toY, Qt.LeftButton, Qt.NoModifier, pace)
        }

        function test_quick_data() {
            return [
                { tag: "fast flick up the content: to the bottom", start: 10000, from: 550, to: 50, steps: 5, pace: 1,
                  active: true, end: 30000 - 600 },
                { tag: "fast flick down the content: to the top", start: 10000, from: 50, to: 550, steps: 5, pace: 1,
                  active: true, end: 0 },
                { tag: "a slow short drag: nothing", start: 10000, from: 300, to: 250, steps: 10, pace: 30,
                  active: false },
            ]
        }

        function test_quick(data) {
            flickable.contentY = data.start
            drag(data.from, data.to, data.steps, data.pace)
            if (!data.active) {
                tryCompare(flickable, "moving", false)
                verify(!quick.active)
                return
            }
            tryCompare(quick, "active", true)
            mouseClick(quick, quick.width / 2, quick.height / 2)
            tryCompare(flickable, "contentY", data.end)
            verify(!quick.active)
        }

        function test_hidesAfterAPause() {
            flickable.contentY = 10000
            drag(550, 50, 5, 1)
            tryCompare(quick, "active", true)
            tryCompare(flickable, "moving", false, 10000)
            tryCompare(quick, "active", false, 2000)
        }
    }
}
