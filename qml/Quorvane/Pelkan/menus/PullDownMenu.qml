import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A menu above the content of a Flickable (declare it inside the Flickable), revealed by
// pulling the content down. The item at the top of what has been revealed is highlighted;
// letting go with one highlighted runs its clicked() once the content has settled.
Item {
    id: menu

    property Flickable flickable: parent && parent.parent && parent.parent.hasOwnProperty("contentY") ? parent.parent : null
    property bool active: false
    readonly property real dragDistance: logic.dragDistance
    readonly property Item highlightedItem: _highlighted
    default property alias _items: column.data

    // Read by the native logic.
    readonly property real _inactivePosition: flickable ? flickable.originY : 0
    readonly property real _maxDragPosition: _inactivePosition - height
    readonly property Item _contentColumn: column
    property bool _activationInhibited: false
    readonly property bool _pullDown: true

    property Item _highlighted: null
    property Item _pending: null

    width: flickable ? flickable.width : 0
    height: column.height + Theme.paddingLarge * 2
    y: _inactivePosition - height
    visible: dragDistance > 0

    function _itemAt(distance) {
        // The top-most item whose middle has come into view.
        var revealedFrom = menu.height - distance
        for (var i = 0; i < column.children.length; ++i) {
            var item = column.children[i]
            if (item.visible && item.enabled && item.hasOwnProperty("clicked")
                    && column.y + item.y + item.height / 2 >= revealedFrom)
                return item
        }
        return null
    }

    onDragDistanceChanged: {
        if (flickable && flickable.dragging)
            _highlighted = dragDistance > Theme.paddingLarge ? _itemAt(dragDistance) : null
    }

    Connections {
        target: menu.flickable
        function onDraggingChanged() {
            if (menu.flickable.dragging)
                return
            // Let go: what was highlighted runs once the content is back.
            menu._pending = menu._highlighted
            menu._highlighted = null
            if (menu._pending && !menu.flickable.moving)
                menu._runPending()
        }
        function onMovementEnded() { menu._runPending() }
    }

    function _runPending() {
        var item = _pending
        _pending = null
        if (item)
            item.clicked()
    }

    Private.PulleyMenuLogic {
        id: logic
        pullDownType: true
        flickable: menu.flickable
    }

    Column {
        id: column
        y: Theme.paddingLarge
        width: menu.width
    }
}
