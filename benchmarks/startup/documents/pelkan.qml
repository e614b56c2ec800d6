import QtQuick 2.6
import Quorvane.Pelkan 1.0

// An application window, its page stack, and a page with a header and a 50-row list of
// ListItem rows, each with a Label.
ApplicationWindow {
    width: 540
    height: 960
    initialPage: Component {
        Page {
            PageHeader { id: header; title: "Hello" }
            ListView {
                objectName: "rows"
                anchors { top: header.bottom; left: parent.left; right: parent.right; bottom: parent.bottom }
                model: 50
                delegate: ListItem {
                    Label {
                        x: Theme.horizontalPageMargin
                        anchors.verticalCenter: parent.verticalCenter
                        text: "Row " + index
                    }
                }
            }
        }
    }
}
