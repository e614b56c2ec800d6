import QtQuick 2.6
import QtQuick.Controls 2.15

Page {
    width: 540
    height: 960
    Label {
        anchors.centerIn: parent
        text: "Hello"
        font.pixelSize: 34
    }
}
