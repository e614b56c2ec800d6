import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Three tabs under a header: a list, a note that keeps what was typed while other tabs are
// shown (Slide.keepAlive), and settings. Tab pages are made when first shown; a swipe or a
// tap on a title changes tab, and at the first tab a swipe goes back a page.
Page {
    id: page

    PageHeader { id: header; title: "Tabs" }

    TabView {
        anchors { top: header.bottom; left: parent.left; right: parent.right; bottom: parent.bottom }
        model: ["Recent", "Note", "Settings"]
        delegate: Loader {
            // The note is kept when it leaves the view; the others are made again.
            Private.Slide.keepAlive: index === 1
            sourceComponent: [recent, note, settings][index]
        }
    }

    Component {
        id: recent
        ListView {
            clip: true
            model: 40
            delegate: ListItem {
                Label {
                    x: Theme.horizontalPageMargin
                    anchors.verticalCenter: parent.verticalCenter
                    text: "Opened file " + (index + 1)
                }
            }
            ScrollDecorator {}
        }
    }

    Component {
        id: note
        Column {
            TextArea {
                label: "Kept while you look at other tabs"
                placeholderText: "Write something"
            }
        }
    }

    Component {
        id: settings
        Column {
            TextSwitch { text: "Show hidden files" }
            TextSwitch { text: "Sort folders first"; checked: true }
            Slider { label: "Preview size"; minimumValue: 1; maximumValue: 5; stepSize: 1; value: 3; valueText: value }
        }
    }
}
