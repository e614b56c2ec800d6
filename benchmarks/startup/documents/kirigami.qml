import QtQuick 2.6
import org.kde.kirigami 2.10 as Kirigami

// The same application with Kirigami.
Kirigami.ApplicationWindow {
    width: 540
    height: 960
    visible: true
    pageStack.initialPage: page
    Component {
        id: page
        Kirigami.ScrollablePage {
            title: "Hello"
            ListView {
                objectName: "rows"
                model: 50
                delegate: Kirigami.BasicListItem { label: "Row " + index }
            }
        }
    }
}
