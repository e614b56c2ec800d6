import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

Private.ControlBase {
    width: 540
    height: 960
    Rectangle { anchors.fill: parent; color: "black" }
    Text {
        anchors.centerIn: parent
        text: "Hello"
        color: parent.palette.highlightColor
        font.pixelSize: Theme.fontSizeLarge
    }
}
