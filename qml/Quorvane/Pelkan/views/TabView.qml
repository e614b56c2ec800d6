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

    /*! The tabs: a list of titles, or a model with a "title" role. */
    property alias model: pages.model
    /*! Makes a tab's page when it is first shown; sees index, modelData and the roles. */
    property alias delegate: pages.delegate
    /*! The tab shown; whatever order it is declared in against the model. */
    property alias currentIndex: pages.currentIndex
    /*! The page of the current tab. */
    readonly property alias currentItem: pages.currentItem
    /*! How many tabs there are. */
    readonly property alias count: pages.count
    /*! How many pages besides the current one are kept alive (0: only the current). */
    property alias cacheSize: pages.cacheSize
    /*! Whether a swipe changes tab (a tap on a title always does). */
    property alias interactive: pages.interactive
    /*! True while the pages slide. */
    readonly property alias moving: pages.moving
    /*! The sliding view of the pages, for Slide and drag settings. */
    readonly property Item view: pages

    /*! Shows tab index, sliding there (TabViewAction.Animated, the default) or at once
        (TabViewAction.Immediate). */
    function moveTo(index, operationType) {
        pages.moveTo(index, operationType === undefined ? TabViewAction.Animated : operationType)
    }

    width: parent ? parent.width : 0
    height: parent ? parent.height : 0

    Item {
        id: bar
        width: tabs.width
        height: Theme.itemSizeSmall
        readonly property real tabWidth: width / Math.max(1, pages.count)

        Row {
            Repeater {
                model: pages.model
                Private.ButtonBase {
                    id: tab
                    width: bar.tabWidth
                    height: bar.height
                    text: typeof title !== "undefined" ? title : modelData
                    accessibleRole: Accessible.PageTab
                    highlighted: index === pages.currentIndex
                    onClicked: tabs.moveTo(index)
                    Text {
                        anchors.centerIn: tab
                        width: Math.min(implicitWidth, tab.width - Theme.paddingMedium)
                        elide: Text.ElideRight
                        text: tab.text
                        color: tab.down || tab.visualFocus || tab.highlighted ? tab.palette.highlightColor : tab.palette.primaryColor
                        font.pixelSize: Theme.fontSizeMedium
                    }
                }
            }
        }

        // Follows the pages as they slide.
        Rectangle {
            y: bar.height - height
            x: pages.position * bar.tabWidth
            width: bar.tabWidth
            height: Math.max(2, Math.round(Theme.paddingSmall / 2))
            color: Theme.highlightColor
        }
    }

    Private.SlideableBase {
        id: pages
        anchors { top: bar.bottom; left: tabs.left; right: tabs.right; bottom: tabs.bottom }
        cacheSize: 0
    }
}
