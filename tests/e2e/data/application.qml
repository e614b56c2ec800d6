import QtQuick 2.6
import QtQuick.Window 2.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// An application with a page stack, a cover in its own window and two cover actions. It
// reports what happens to it on its log, each line starting with "e2e:".
Window {
    id: root
    property bool category: true
    property int depth: 2
    property int backgroundHeight: 0
    // With 2, a second action list on the same window, enabled after the first: its
    // action 0 empties it, its action 1 destroys it.
    property int lists: 1

    width: 270
    height: 480
    visible: true
    onActiveChanged: console.log("e2e: active " + active)

    Private.Window {
        id: applicationWindow
        anchors.fill: parent
        focus: true
        publishCategory: root.category
        _backgroundRect: Qt.rect(0, 10, root.width, root.backgroundHeight)
        // Keep the cover on show while the application is in front.
        _coverIsPrimaryWindow: true

        PageStackBase {
            id: stack
            anchors.fill: parent
            focus: true
            depth: root.depth

            function pop() {
                console.log("e2e: pop from depth " + depth)
                depth = depth - 1
                return null
            }
        }

        Component.onCompleted: _setCover(coverWindow)
    }

    Private.CoverWindow {
        id: coverWindow
        width: 135
        height: 216

        cover: Cover {
            id: cover
            transparent: true
            onStatusChanged: console.log("e2e: cover status " + status)

            CoverActionList {
                id: actions
                window: root
                CoverAction {
                    iconSource: "image://theme/icon-cover-pause"
                    onTriggered: {
                        console.log("e2e: action 0")
                        actions.enabled = false
                    }
                }
                CoverAction {
                    iconSource: "image://theme/icon-cover-next"
                    onTriggered: console.log("e2e: action 1")
                }
            }

            Loader {
                id: second
                active: root.lists > 1
                sourceComponent: CoverActionList {
                    id: extras
                    window: root
                    CoverAction {
                        iconSource: "image://theme/icon-cover-refresh"
                        onTriggered: {
                            console.log("e2e: emptying the second list")
                            extras.actions = []
                        }
                    }
                    CoverAction {
                        iconSource: "image://theme/icon-cover-cancel"
                        onTriggered: {
                            console.log("e2e: destroying the second list")
                            second.active = false
                        }
                    }
                }
            }
        }
    }
}
