import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The subjects of the gallery, one row each; the last answer of the dialog below them.
Page {
    id: page

    property string answer: "not asked yet"
    readonly property var subjects: [
        { name: "theme", title: "Theme" }, { name: "images", title: "Images" },
        { name: "orientation", title: "Orientation" }, { name: "format", title: "Formatting" },
        { name: "gestures", title: "Gestures" }, { name: "cover", title: "Cover" },
        { name: "form", title: "Forms and controls" },
        { name: "photos", title: "Photo slideshow" }, { name: "tabs", title: "Tabs" }, { name: "lists", title: "Lists and menus" },
        { name: "search", title: "Searching a list" },
        { name: "backgrounds", title: "Backgrounds" }
    ]

    function openDialog(operationType) {
        var dialog = pageStack.push(Qt.resolvedUrl("QuestionDialog.qml"), {}, operationType)
        dialog.accepted.connect(function() { page.answer = "accepted: " + dialog.name })
        dialog.rejected.connect(function() { page.answer = "rejected" })
    }

    onStatusChanged: {
        if (status === PageStatus.Active && !pageStack.nextPage)
            pageStack.pushAttached(Qt.resolvedUrl("AboutPage.qml"))
    }

    // More subjects than fit a phone's screen: the list scrolls.
    Flickable {
        anchors.fill: parent
        contentHeight: rows.height

        ScrollDecorator {}

        Column {
            id: rows
            width: page.width

            PageHeader { title: "Gallery"; description: "Swipe left for more" }

            Repeater {
                model: page.subjects
                MouseArea {
                    id: row
                    objectName: "subject-" + modelData.name
                    width: page.width
                    height: Theme.itemSizeSmall
                    onClicked: {
                        if (modelData.name === "lists")
                            page.pageStack.push(Qt.resolvedUrl("ListsPage.qml"))
                        else if (modelData.name === "form")
                            page.pageStack.push(Qt.resolvedUrl("FormPage.qml"))
                        else if (modelData.name === "photos")
                            page.pageStack.push(Qt.resolvedUrl("PhotosPage.qml"), { "photos": page.applicationWindow.photos })
                        else if (modelData.name === "tabs")
                            page.pageStack.push(Qt.resolvedUrl("TabsPage.qml"))
                        else if (modelData.name === "backgrounds")
                            page.pageStack.push(Qt.resolvedUrl("BackgroundsPage.qml"))
                        else if (modelData.name === "search")
                            page.pageStack.push(Qt.resolvedUrl("SearchPage.qml"))
                        else
                            page.pageStack.push(Qt.resolvedUrl("SubjectPage.qml"),
                                                { "name": modelData.name, "title": modelData.title,
                                                  "application": page.applicationWindow })
                    }
                    Rectangle {
                        anchors.fill: parent
                        color: Theme.highlightBackgroundColor
                        opacity: row.pressed ? 0.3 : 0
                    }
                    Text {
                        anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
                        text: modelData.title
                        color: row.pressed ? Theme.highlightColor : Theme.primaryColor
                        font.pixelSize: Theme.fontSizeMedium
                    }
                }
            }

            MouseArea {
                id: dialogRow
                objectName: "subject-dialog"
                width: page.width
                height: Theme.itemSizeSmall
                onClicked: page.openDialog()
                Text {
                    anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
                    text: "Dialog (" + page.answer + ")"
                    color: dialogRow.pressed ? Theme.highlightColor : Theme.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                }
            }
        }
    }
}
