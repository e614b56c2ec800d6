import QtQuick 2.6
import QtQuick.Window 2.2
import Quorvane.Pelkan 1.0

Window {
    id: window
    visible: true
    // A phone-shaped window in the display's portrait pixels.
    width: Math.min(screen.width, Screen.width)
    height: Math.min(screen.height, Screen.height)
    title: "Quorvane Pelkan gallery"
    color: Theme.colorScheme === Theme.LightOnDark ? "#10141c" : "#f4f6fa"

    ThemePage {
        anchors.fill: parent
    }
}
