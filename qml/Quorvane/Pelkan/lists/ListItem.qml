import QtQuick 2.6
import QtQml.Models 2.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private
import Quorvane.Pelkan.private 1.0 // for the RemorseCache attached to the view

// A row of a list: highlighted while pressed (until a swipe over it begins), clicked on
// release, and with a `menu` (a ContextMenu, or a component making one) opened below it by
// a long press or openMenu(), pushing the rows below aside. A press outside closes it.
Item {
    id: item

    property real contentHeight: Theme.itemSizeSmall
    property var menu
    property bool showMenuOnPressAndHold: true
    readonly property bool highlighted: (mouseArea.pressed && !detector.dragging) || menuOpen
    readonly property bool menuOpen: _menuItem !== null && _menuItem.visible
    readonly property bool down: mouseArea.pressed
    default property alias content: mouseArea.data

    property Item _menuItem: null

    // Remorse: a countdown the view keeps for this row, shown over the row while it runs.
    /*! True while a remorse countdown runs for this row. */
    readonly property bool remorseRunning: remorse.countdown !== null && remorse.countdown.row >= 0
    /*! Shows "Deleting in 5 s, tap to cancel" over the row (text "Deleting") and runs action
        when the countdown ends, after timeout ms (5000 if left out), unless a tap cancels it.
        The countdown is kept by the view: it follows the row while rows are inserted,
        removed or moved, and outlives this delegate; make action in a scope that outlives
        the delegate (the page's or the view's), not inline here. Returns the countdown, whose
        triggered() and canceled() tell how it ended (canceled() also when the row leaves the
        model), or null outside a ListView. */
    function remorseAction(text, action, timeout) {
        var cache = remorse.cache()
        if (!cache) {
            console.warn("ListItem: remorse needs a ListView")
            return null
        }
        remorse.countdown = cache.start(remorse.row, timeout === undefined ? 5000 : timeout, action, text || "")
        return remorse.countdown
    }
    QtObject {
        id: remorse
        readonly property int row: item.DelegateModel.itemsIndex
        // The countdown shown; the view's cache deletes it when it ends.
        property QtObject countdown: null
        property Item overlay: null
        function cache() {
            var view = item.ListView.view
            return view ? view.RemorseCache : null
        }
        function follow() {
            var running = cache()
            countdown = running && row >= 0 ? running.at(row) : null
        }
        onRowChanged: refollow.restart()
        Component.onCompleted: follow() // a countdown may be running for this row already
        onCountdownChanged: {
            if (overlay)
                overlay.destroy()
            overlay = countdown ? remorseComponent.createObject(item, { "countdown": countdown }) : null
        }
    }
    // Once the model's change has reached the cache too: the view may hand its delegates
    // their new rows first. (A timer goes with the delegate; a deferred call would not.)
    Timer {
        id: refollow
        interval: 0
        onTriggered: remorse.follow()
    }
    Component {
        id: remorseComponent
        RemorseItem {}
    }

    signal clicked()
    signal pressAndHold()

    width: parent ? parent.width : 0
    height: contentHeight + (menuOpen ? _menuItem.height : 0)

    function openMenu() {
        if (!menu)
            return null
        if (!_menuItem)
            _menuItem = menu instanceof Item ? menu : menu.createObject(item)
        if (!_menuItem)
            return null
        _menuItem.parent = item
        _menuItem.y = Qt.binding(function() { return item.contentHeight })
        _menuItem.width = Qt.binding(function() { return item.width })
        _menuItem.visible = true
        if (!_closer)
            _closer = closerComponent.createObject(item)
        return _menuItem
    }

    function closeMenu() {
        if (_menuItem)
            _menuItem.visible = false
    }

    Private.DragDetectorItem {
        id: detector
        width: item.width
        height: item.contentHeight

        MouseArea {
            id: mouseArea
            anchors.fill: parent
            onClicked: item.clicked()
            onPressAndHold: {
                item.pressAndHold()
                if (item.showMenuOnPressAndHold && item.menu)
                    item.openMenu()
            }

            // Below the content (declared first); not drawn at all while not highlighted.
            Rectangle {
                anchors.fill: parent
                visible: item.highlighted
                color: Theme.highlightBackgroundColor
                opacity: 0.3
            }
        }
    }

    // Made while the menu is open only: a thousand rows need not carry one each.
    property Item _closer: null
    onMenuOpenChanged: {
        if (!menuOpen && _closer) {
            _closer.destroy()
            _closer = null
        }
    }
    Component {
        id: closerComponent
        InverseMouseArea {
            anchors.fill: parent
            onPressedOutside: item.closeMenu()
        }
    }
}
