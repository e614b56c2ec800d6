import QtQuick 2.6
import Quorvane.Pelkan 1.0

// An application of two pages built from the toolkit's components, as QQmlApplicationEngine
// loads it (the application window makes its own window). It reports on its log, each line
// starting with "e2e:".
ApplicationWindow {
    id: app

    initialPage: Component { Page {} }
    pageStack.onDepthChanged: console.log("e2e: depth " + pageStack.depth)

    Connections {
        target: Qt.application
        function onStateChanged() { console.log("e2e: active " + (Qt.application.state === Qt.ApplicationActive)) }
    }

    Component.onCompleted: pageStack.push(Qt.createComponent("SecondPage.qml"), {}, PageStackAction.Immediate)
}
