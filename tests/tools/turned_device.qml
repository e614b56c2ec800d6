import QtQuick 2.6
import QtQuick.Window 2.2 as QtWindow
import Quorvane.Pelkan 1.0

// pelkan-qml-runner turned_device.qml deviceOrientation=4: exits with 0 when, a few frames
// after its window shows, the device is still turned as the command line says and the
// content has followed it.
ApplicationWindow {
    id: window

    allowedOrientations: Orientation.All
    initialPage: Component { Page {} }
    onOrientationChanged: console.log("orientation", orientation)

    Timer {
        property int frames: 0
        interval: 50
        repeat: true
        running: true
        onTriggered: {
            var host = window.QtWindow.Window.window
            if (!host || !host.visible || ++frames < 5)
                return
            running = false
            var kept = window.deviceOrientation === Orientation.PortraitInverted
                    && window.orientation === Orientation.PortraitInverted
            if (!kept)
                console.warn("deviceOrientation", window.deviceOrientation, "orientation", window.orientation)
            Qt.exit(kept ? 0 : 1)
        }
    }
}
