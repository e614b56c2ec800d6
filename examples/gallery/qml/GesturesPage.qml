import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Swipe between pages of a small page stack (back to the right, forward to the left),
// and pull the list below down to open its menu.
Item {
    id: page

    // A minimal stack on the native gesture base: the pages follow the flick differences,
    // and a release past a third of the width completes the move.
    PageStackBase {
        id: stack
        property int index: 0
        readonly property var colours: ["#2e5d8f", "#7a3e8e", "#2f7a55", "#8f5a2e"]

        width: parent.width
        height: parent.height * 0.42
        clip: true
        // Sideways drags here belong to this small stack, not to the application's.
        Private.DragFilter.orientations: Qt.Horizontal
        depth: index + 1
        forwardNavigation: index < colours.length - 1
        backNavigation: index > 0
        // Each page sits still in a container; the container follows the finger.
        _currentContainer: pages.count > index ? pages.itemAt(index) : null
        currentPage: pages.count > index ? pages.itemAt(index).children[0] : null

        function pop() { if (index > 0) index-- }

        onReleased: {
            if (_leftFlickDifference > width / 3 && index > 0)
                index--
            else if (_rightFlickDifference > width / 3 && index < colours.length - 1)
                index++
        }

        Repeater {
            id: pages
            model: stack.colours
            Item {
                width: stack.width
                height: stack.height
                x: (index - stack.index) * stack.width + stack._leftFlickDifference - stack._rightFlickDifference
                Behavior on x { enabled: !stack.pressed; NumberAnimation { duration: 180 } }

                Rectangle {
                    anchors.fill: parent
                    color: modelData
                    MouseArea { anchors.fill: parent } // page content takes the press
                    Text {
                        anchors.centerIn: parent
                        text: "Page " + (index + 1) + "\n" + (index > 0 ? "← swipe right for back" : "")
                              + (index < stack.colours.length - 1 ? "\nswipe left for forward →" : "")
                        horizontalAlignment: Text.AlignHCenter
                        color: Theme.primaryColor
                        font.pixelSize: Theme.fontSizeMedium
                    }
                }
            }
        }
    }

    Text {
        id: status
        anchors { top: stack.bottom; topMargin: Theme.paddingSmall; right: parent.right; rightMargin: Theme.horizontalPageMargin }
        color: Theme.highlightColor
        font.pixelSize: Theme.fontSizeSmall
        text: "Pull the list down for its menu"
    }

    Flickable {
        id: list
        anchors { top: status.bottom; topMargin: Theme.paddingSmall; left: parent.left; right: parent.right; bottom: parent.bottom }
        clip: true
        contentHeight: column.height
        property Item pullDownMenu: menu
        property Item pushUpMenu: null

        onDraggingChanged: if (!dragging) { logic.monitorFlick(); if (menu.active && menu.selected >= 0) menu.trigger() }

        NumberAnimation { id: snap; target: list; property: "contentY" }

        Item {
            id: menu
            property bool active: false
            property real _inactivePosition: 0
            property real _snapThreshold: height / 2
            property real _snapCalculationVelocity: 300
            property bool _pullDown: true
            property real _finalPosition: -height
            property bool _activationInhibited: false
            property bool _changingListView: false
            property Item _contentColumn: entries
            property real _maxDragPosition: 0
            readonly property var actions: ["Refresh", "Sort by name", "Settings"]
            // The entry lined up with the top edge of the list while pulled.
            property int selected: active ? Math.min(actions.length - 1, Math.floor((logic.dragDistance - Theme.paddingLarge) / Theme.itemSizeSmall)) : -1

            function trigger() { status.text = "Menu: " + actions[actions.length - 1 - selected] }

            y: -height
            width: list.width
            height: entries.height + Theme.paddingLarge

            Column {
                id: entries
                width: parent.width
                Repeater {
                    model: menu.actions
                    Text {
                        width: entries.width
                        height: Theme.itemSizeSmall
                        horizontalAlignment: Text.AlignHCenter
                        verticalAlignment: Text.AlignVCenter
                        text: modelData
                        color: menu.actions.length - 1 - index === menu.selected ? Theme.highlightColor : Theme.primaryColor
                        font.pixelSize: Theme.fontSizeMedium
                    }
                }
            }

            Private.PulleyMenuLogic {
                id: logic
                flickable: list
                pullDownType: true
                onAnimateFlick: { snap.duration = duration * 1000; snap.to = position; snap.restart() }
            }
        }

        BounceEffect { id: bounce; flickable: list }

        Column {
            id: column
            width: parent.width
            Repeater {
                model: 30
                Text {
                    x: Theme.horizontalPageMargin
                    height: Theme.itemSizeSmall
                    verticalAlignment: Text.AlignVCenter
                    text: "Item " + (index + 1)
                    color: Theme.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                }
            }
        }
    }
}
