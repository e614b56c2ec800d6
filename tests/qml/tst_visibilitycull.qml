import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan.private 1.0 as Private

// A thousand rows in a column: only those in the view, plus the margin, are drawn, and
// culled rows keep their place.
Item {
    id: root
    width: 400
    height: 600

    Flickable {
        id: flickable
        anchors.fill: parent
        contentHeight: column.height

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
    }

    TestCase {
        name: "VisibilityCull"
        when: windowShown

        function test_cull_data() {
            return [
                { tag: "top", contentY: 0, margin: 0, drawn: 12 },
                { tag: "top, with a margin", contentY: 0, margin: 100, drawn: 14 },
                { tag: "middle, between rows", contentY: 5025, margin: 0, drawn: 13 },
                { tag: "end", contentY: 50000 - 600, margin: 0, drawn: 12 },
            ]
        }

        function test_cull(data) {
            cull.margin = data.margin
            flickable.contentY = data.contentY
            tryCompare(cull, "drawnCount", data.drawn)
            // Culled rows keep their place in the column.
            compare(rows.itemAt(999).y, 999 * 50)
            compare(column.height, 50000)
            // What is drawn at the top of the view is the row there.
            var image = grabImage(root)
            var row = Math.floor(data.contentY / 50)
            compare(String(image.pixel(200, 1)), String(row % 2 ? "#222244" : "#444466"))
        }
    }
}
