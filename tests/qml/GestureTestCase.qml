import QtQuick 2.6
import QtQuick.Window 2.2
import QtTest 1.2
import PelkanTest 1.0

// A test case that drags as a user does. swipe() presses on item at (x0, y0), moves in even
// steps towards (x1, y1) and lets go there; input "mouse", "touch", "cancel" (the system takes
// the touch away instead of a release), "second finger" (one comes down after the fourth move
// and lifts after the seventh) or "two fingers" (the second lifts after the first). Options:
// steps (10), pace (ms between moves, the mouse events' time stamps), moving(i) before each
// move (true ends the moves there), released() just before the finger lifts. findItem()
// gives the first item in a tree (its root first, then depth first) that matches.
TestCase {
    when: windowShown

    function findItem(item, matches) {
        if (matches(item))
            return item
        for (var i = 0; i < item.children.length; ++i) {
            var found = findItem(item.children[i], matches)
            if (found)
                return found
        }
        return null
    }

    function swipe(item, input, x0, y0, x1, y1, options) {
        var o = options || {}
        var steps = o.steps || 10
        var touch = input === "mouse" ? null : touchEvent(item)
        var second = [item.width / 4, item.height / 2]
        var fingers = 1
        if (touch)
            touch.press(0, item, x0, y0).commit()
        else
            mousePress(item, x0, y0)
        var x = x0, y = y0
        for (var i = 1; i <= steps && !(o.moving && o.moving(i) === true); ++i) {
            x = x0 + (x1 - x0) * i / steps
            y = y0 + (y1 - y0) * i / steps
            if (!touch) {
                mouseMove(item, x, y, o.pace)
            } else {
                if (o.pace)
                    wait(o.pace)
                if ((input === "second finger" || input === "two fingers") && i === 4) {
                    touch.stationary(0).press(1, item, second[0], second[1]).commit()
                    fingers = 2
                }
                touch.move(0, item, x, y)
                if (input === "second finger" && i === 7) {
                    touch.release(1, item, second[0], second[1])
                    fingers = 1
                } else if (fingers === 2) {
                    touch.stationary(1)
                }
                touch.commit()
            }
        }
        if (o.released)
            o.released()
        if (input === "cancel")
            TouchSystem.cancel(item.Window.window)
        else if (fingers === 2)
            touch.release(0, item, x, y).stationary(1).commit().release(1, item, second[0], second[1]).commit()
        else if (touch)
            touch.release(0, item, x, y).commit()
        else
            mouseRelease(item, x, y, Qt.LeftButton, Qt.NoModifier, o.pace)
    }
}
