import QtQuick 2.6
import QtQuick.Controls 2.15

// The same application with Qt Quick Controls 2: a StackView, a page with a ToolBar
// header and a 50-row list of ItemDelegate rows, in the toolkit's sizes.
ApplicationWindow {
    width: 540
    height: 960
    visible: true
    StackView {
        id: stack
        anchors.fill: parent
        initialItem: page
    }
    Component {
        id: page
        Page {
            header: ToolBar {
                height: 120
                Label { anchors { right: parent.right; rightMargin: 24; verticalCenter: parent.verticalCenter }
                        text: "Hello"; font.pixelSize: 34 }
            }
            ListView {
                objectName: "rows"
                anchors.fill: parent
                model: 50
                delegate: ItemDelegate { width: ListView.view.width; height: 80; text: "Row " + index; font.pixelSize: 26 }
            }
        }
    }
}
