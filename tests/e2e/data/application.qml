import QtQuick 2.6
import QtQuick.Window 2.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// An application with a cover in its own window and two cover actions. It reports what
// happens to it on its log, each line starting with "e2e:".
Window {
    id: root
    property bool category: true
    property int backgroundHeight: 0

    width: 270
    height: 480
    visible: true

    Private.Window {
        id: applicationWindow
        anchors.fill: parent
        publishCategory: root.category
        _backgroundRect: Qt.rect(0, 10, root.width, root.backgroundHeight)
        // Keep the cover on show while the application is in front.
        _coverIsPrimaryWindow: true

        Component.onCompleted: _setCover(coverWindow)
    }

    Private.CoverWindow {
        id: coverWindow
        width: 135
        height: 216

        cover: Cover {
            id: cover
            transparent: true

            CoverActionList {
                window: root
                CoverAction {
                    iconSource: "image://theme/icon-cover-pause"
                    onTriggered: console.log("e2e: action 0")
                }
                CoverAction {
                    iconSource: "image://theme/icon-cover-next"
                    onTriggered: console.log("e2e: action 1")
                }
            }
        }
    }
}
