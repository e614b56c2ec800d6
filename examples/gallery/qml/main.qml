import QtQuick 2.6
import QtQuick.Window 2.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

Window {
    id: window

    // Which page the gallery opens on: theme, images, orientation, format, gestures, cover, text.
    property string initialPage: "theme"

    visible: true
    // A phone-shaped window in the display's portrait pixels.
    width: Math.min(screen.width, Screen.width)
    height: Math.min(screen.height, Screen.height)
    title: "Quorvane Pelkan gallery"
    color: Theme.colorScheme === Theme.LightOnDark ? "#10141c" : "#f4f6fa"

    Private.Window {
        id: applicationWindow
        anchors.fill: parent

        Row {
            id: tabs
            property string current: window.initialPage
            width: parent.width
            height: Theme.itemSizeSmall

            Repeater {
                model: [{ name: "theme", title: "Theme" }, { name: "images", title: "Images" },
                        { name: "orientation", title: "Orient." },
                        { name: "format", title: "Format" }, { name: "gestures", title: "Gestures" },
                        { name: "cover", title: "Cover" }, { name: "text", title: "Text" }]
                Item {
                    width: tabs.width / 7
                    height: tabs.height
                    Text {
                        anchors.centerIn: parent
                        text: modelData.title
                        color: tabs.current === modelData.name ? Theme.highlightColor : Theme.secondaryColor
                        font.pixelSize: Theme.fontSizeSmall * 0.85
                    }
                    MouseArea {
                        anchors.fill: parent
                        onClicked: tabs.current = modelData.name
                    }
                }
            }
        }

        Loader {
            anchors { top: tabs.bottom; left: parent.left; right: parent.right; bottom: parent.bottom }
            source: tabs.current === "orientation" ? "OrientationPage.qml"
                  : tabs.current === "format" ? "FormatPage.qml"
                  : tabs.current === "gestures" ? "GesturesPage.qml"
                  : tabs.current === "cover" ? "CoverPage.qml"
                  : tabs.current === "text" ? "TextPage.qml"
                  : tabs.current === "images" ? "ImagesPage.qml" : "ThemePage.qml"
            onLoaded: if (item.hasOwnProperty("applicationWindow")) item.applicationWindow = applicationWindow
        }
    }
}
