import QtQuick 2.6
import Quorvane.Pelkan 1.0

// One subject of the gallery under a page header.
Page {
    id: page

    property string name
    property string title: name.charAt(0).toUpperCase() + name.slice(1)
    property Item application

    PageHeader { id: header; title: page.title }

    Loader {
        anchors { top: header.bottom; left: parent.left; right: parent.right; bottom: parent.bottom }
        source: {
            switch (page.name) {
            case "images": return "ImagesPage.qml"
            case "orientation": return "OrientationPage.qml"
            case "format": return "FormatPage.qml"
            case "gestures": return "GesturesPage.qml"
            case "cover": return "CoverPage.qml"
            default: return "ThemePage.qml"
            }
        }
        onLoaded: if (item.hasOwnProperty("applicationWindow")) item.applicationWindow = page.application
    }
}
