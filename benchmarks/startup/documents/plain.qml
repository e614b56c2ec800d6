import QtQuick 2.6
import QtQuick.Window 2.2

// The floor: the same screen from Qt Quick's own items and no toolkit (a window, a page
// item, a header text and a 50-row list of Item + Text rows), in the toolkit's sizes.
Window {
    width: 540
    height: 960
    visible: true
    Item {
        anchors.fill: parent
        Text {
            id: header
            anchors { left: parent.left; right: parent.right; leftMargin: 24; rightMargin: 24 }
            height: 120
            horizontalAlignment: Text.AlignRight
            verticalAlignment: Text.AlignVCenter
            text: "Hello"
            font.pixelSize: 34
        }
        ListView {
            objectName: "rows"
            anchors { top: header.bottom; left: parent.left; right: parent.right; bottom: parent.bottom }
            model: 50
            delegate: Item {
                width: ListView.view.width
                height: 80
                Text {
                    x: 24
                    anchors.verticalCenter: parent.verticalCenter
                    text: "Row " + index
                    font.pixelSize: 26
                }
            }
        }
    }
}
