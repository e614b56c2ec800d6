import QtQuick 2.6
import QtQuick.Controls 2.15

// The same application with Qt Quick Controls 2.
ApplicationWindow {
    width: 540
    height: 960
    visible: true
    StackView {
        anchors.fill: parent
        initialItem: Page {
            header: Label { text: "Hello"; font.pixelSize: 34; horizontalAlignment: Text.AlignRight; padding: 24 }
            ListView {
                anchors.fill: parent
                model: 50
                delegate: ItemDelegate { width: ListView.view.width; text: "Row " + index }
            }
        }
    }
}
