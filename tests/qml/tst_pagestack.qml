import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// A swipe between pages, end to end: a small stack in QML bound to the native flick
// differences, driven by a finger's worth of mouse moves.
Item {
    width: 400
    height: 400

    PageStackBase {
        id: stack
        property int index: 0
        property var trace: []

        anchors.fill: parent
        depth: index + 1
        backNavigation: index > 0
        forwardNavigation: index < 2
        // Each page sits still in a container; the container follows the finger.
        _currentContainer: pages.count > index ? pages.itemAt(index) : null
        currentPage: pages.count > index ? pages.itemAt(index).children[0] : null

        on_LeftFlickDifferenceChanged: trace.push("left " + _leftFlickDifference)
        on_RightFlickDifferenceChanged: trace.push("right " + _rightFlickDifference)
        onReleased: {
            if (_leftFlickDifference > width / 3)
                index--
            else if (_rightFlickDifference > width / 3)
                index++
        }

        Repeater {
            id: pages
            model: 3
            Item {
                width: stack.width
                height: stack.height
                x: (index - stack.index) * stack.width + stack._leftFlickDifference - stack._rightFlickDifference
                MouseArea { anchors.fill: parent }
            }
        }
    }

    TestCase {
        name: "PageStackSwipe"
        when: windowShown

        function swipe(fromX, toX) {
            mousePress(stack, fromX, 200)
            var steps = 12
            for (var i = 1; i <= steps; ++i)
                mouseMove(stack, fromX + (toX - fromX) * i / steps, 200)
            mouseRelease(stack, toX, 200)
        }

        function test_swipes() {
            compare(stack.index, 0)
            swipe(350, 50)
            compare(stack.index, 1, "a left swipe goes forward")
            compare(stack._rightFlickDifference, 0, "released differences go back to 0")
            swipe(50, 350)
            compare(stack.index, 0, "a right swipe goes back")
            swipe(200, 160)
            compare(stack.index, 0, "a short swipe does not move")
        }

        function test_fingerTravelIsTheDifference() {
            stack.index = 0
            stack.trace = []
            mousePress(stack, 300, 200)
            for (var x = 275; x >= 100; x -= 25)
                mouseMove(stack, x, 200)
            // Captured at 275, grabbed at 250: the page has followed the finger since.
            compare(stack._rightFlickDifference, 150)
            mouseRelease(stack, 100, 200)
            compare(stack.index, 1)
            stack.index = 0
        }

        function test_backSwipeDisabledOnFirstPage() {
            stack.index = 0
            swipe(50, 350)
            compare(stack.index, 0)
        }
    }
}
