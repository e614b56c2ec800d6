import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Tabs: a bar of titles over pages slid sideways. `model` gives the tabs (a list of titles,
// or a model with a "title" role); `delegate` makes a tab's page when it is first shown
// (it sees index, modelData and the roles). Pages that leave the view are destroyed unless
// their root sets Slide.keepAlive, which keeps their state. A tap on a title or a swipe
// changes tab; moveTo(index, TabViewAction.Immediate) does it from code.
Item {
    id: tabs

    property alias model: pages.model
    property alias delegate: pages.delegate
    property alias currentIndex: pages.currentIndex
    readonly property alias currentItem: pages.currentItem
    readonly property alias count: pages.count
    property alias cacheSize: pages.cacheSize
    property alias interactive: pages.interactive
    readonly property alias moving: pages.moving
    readonly property Item view: pages

    function moveTo(index, operationType) {
        pages.moveTo(index, operationType === undefined ? TabViewAction.Animated : operationType)
    }

    width: parent ? parent.width : 0
    height: parent ? parent.height : 0

    Item {
        id: bar
        width: parent.width
        height: Theme.itemSizeSmall
        readonly property real tabWidth: width / Math.max(1, pages.count)

        Row {
            Repeater {
                model: pages.model
                MouseArea {
                    width: bar.tabWidth
                    height: bar.height
                    onClicked: tabs.moveTo(index)
                    Text {
                        anchors.centerIn: parent
                        width: Math.min(implicitWidth, parent.width - Theme.paddingMedium)
                        elide: Text.ElideRight
                        text: typeof title !== "undefined" ? title : modelData
                        color: parent.pressed || index === pages.currentIndex ? Theme.highlightColor : Theme.primaryColor
                        font.pixelSize: Theme.fontSizeMedium
                    }
                }
            }
        }

        // Follows the pages as they slide.
        Rectangle {
            y: parent.height - height
            x: pages.position * bar.tabWidth
            width: bar.tabWidth
            height: Math.max(2, Math.round(Theme.paddingSmall / 2))
            color: Theme.highlightColor
        }
    }

    Private.SlideableBase {
        id: pages
        anchors { top: bar.bottom; left: parent.left; right: parent.right; bottom: parent.bottom }
        cacheSize: 0
    }
}
