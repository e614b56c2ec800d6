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
    // The row in the view's model, and the view's cache of running remorse countdowns.
    readonly property int _row: DelegateModel.itemsIndex
    readonly property var _remorseCache: ListView.view ? ListView.view.RemorseCache : null
    property Item _remorseItem: null
    readonly property bool remorseRunning: _remorseItem !== null

    // "Deleting in 5 s, tap to cancel" over the item; action runs when the countdown ends,
    // also if the item has scrolled out of view meanwhile and its delegate is gone: make
    // it in a scope that outlives the delegate (the page's or the view's), not inline here.
    function remorseAction(text, action, timeout) {
        if (!_remorseCache) {
            console.warn("ListItem: remorse needs a ListView")
            return
        }
        _remorseCache.start(_row, timeout === undefined ? 5000 : timeout, action, text)
    }

    function _showRemorse() {
        var running = _remorseCache && _remorseCache.running(_row)
        if (running && !_remorseItem) {
            _remorseItem = remorseComponent.createObject(item, { "listItem": item, "cache": _remorseCache,
                                                                 "row": _row, "text": _remorseCache.text(_row) })
        } else if (!running && _remorseItem) {
            _remorseItem.destroy()
            _remorseItem = null
        }
    }

    Component.onCompleted: _follow(_remorseCache) // a countdown may be running for this row
    on_RowChanged: _showRemorse()

    property var _connectedCache: null
    function _follow(cache) {
        if (_connectedCache) {
            _connectedCache.started.disconnect(_showRemorse)
            _connectedCache.canceled.disconnect(_showRemorse)
            _connectedCache.countChanged.disconnect(_showRemorse)
        }
        _connectedCache = cache
        if (cache) {
            cache.started.connect(_showRemorse)
            cache.canceled.connect(_showRemorse)
            cache.countChanged.connect(_showRemorse)
        }
        _showRemorse()
    }
    on_RemorseCacheChanged: _follow(_remorseCache)
    Component.onDestruction: _follow(null)

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
