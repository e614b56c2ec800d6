import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// TouchBlocker and InverseMouseArea with real presses (DragFilter: tst_slideable).
Item {
    id: root
    width: 400; height: 600

    MouseArea {
        id: below
        objectName: "below"
        property int clicks: 0
        x: 0; y: 0; width: 200; height: 200
        onClicked: clicks++
    }
    TouchBlocker {
        id: blocker
        x: 0; y: 0; width: 200; height: 200
    }

    MouseArea {
        id: button
        property int clicks: 0
        x: 0; y: 400; width: 100; height: 100
        onClicked: clicks++
    }
    Rectangle {
        id: menu
        x: 200; y: 200; width: 200; height: 200
        InverseMouseArea {
            id: outside
            anchors.fill: parent
            insideItems: [opener]
            property var seen: []
            onPressedOutside: seen.push("pressed " + Math.round(x) + "," + Math.round(y))
            onClickedOutside: seen.push("clicked")
            onCanceledOutside: seen.push("canceled")
        }
    }
    Item { id: opener; x: 300; y: 500; width: 100; height: 100 }

    GestureTestCase {
        name: "TouchHelpers"

        function test_blocker_data() {
            return [
                { tag: "mouse, enabled", input: "mouse", enabled: true, clicks: 0 },
                { tag: "touch, enabled", input: "touch", enabled: true, clicks: 0 },
                { tag: "mouse, disabled", input: "mouse", enabled: false, clicks: 1 },
                { tag: "touch, disabled", input: "touch", enabled: false, clicks: 1 },
            ]
        }

        function test_blocker(data) {
            below.clicks = 0
            blocker.enabled = data.enabled
            swipe(root, data.input, 100, 100, 100, 100, { steps: 1 })
            mouseWheel(root, 100, 100, 0, -120)
            compare(below.clicks, data.clicks)
        }

        function test_inverse_data() {
            return [
                { tag: "mouse outside, on a button", input: "mouse", x: 50, y: 450, seen: ["pressed -150,250", "clicked"], clicks: 1 },
                { tag: "touch outside, on a button", input: "touch", x: 50, y: 450, seen: ["pressed -150,250", "clicked"], clicks: 1 },
                { tag: "inside", input: "mouse", x: 300, y: 300, seen: [], clicks: 0 },
                { tag: "on an item that counts as inside", input: "touch", x: 350, y: 550, seen: [], clicks: 0 },
                { tag: "disabled", input: "mouse", x: 50, y: 450, disabled: true, seen: [], clicks: 1 },
                { tag: "dragged outside: no click", input: "mouse", x: 50, y: 450, toX: 150, seen: ["pressed -150,250"], clicks: 0 },
            ]
        }

        function test_inverse(data) {
            button.clicks = 0
            outside.seen = []
            outside.enabled = !data.disabled
            swipe(root, data.input, data.x, data.y, data.toX || data.x, data.y, { steps: 1 })
            compare(outside.seen, data.seen)
            compare(button.clicks, data.clicks, "the press is not taken")
            verify(!outside.pressed)
            outside.enabled = true
        }
    }
}
