import QtQuick 2.6
import Quorvane.Pelkan 1.0

Item {
    id: row
    property alias text: label.text
    property bool checked
    signal toggled

    height: Theme.itemSizeSmall

    Rectangle {
        id: box
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.iconSizeSmall
        height: width
        radius: Theme.paddingSmall
        color: row.checked ? Theme.highlightColor : "transparent"
        border.color: row.checked ? Theme.highlightColor : Theme.secondaryColor
        border.width: 2
    }
    Text {
        id: label
        anchors { left: box.right; leftMargin: Theme.paddingMedium; verticalCenter: parent.verticalCenter }
        color: row.checked ? Theme.highlightColor : Theme.primaryColor
        font.pixelSize: Theme.fontSizeMedium
    }
    MouseArea {
        anchors.fill: parent
        onClicked: row.toggled()
    }
}
