import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// What pull-down and push-up menus share: a menu beyond one edge of a Flickable's content
// (declare it inside the Flickable), revealed by dragging the content past that edge. The
// item nearest the far end of what has been revealed is highlighted; letting go with one
// highlighted runs its clicked() once the content has settled. Pulled past the whole menu,
// nothing is highlighted. A flick that would stop just short of the menu snaps to the edge.
Item {
    id: menu

    property Flickable flickable: parent && parent.parent && parent.parent.hasOwnProperty("contentY") ? parent.parent : null
    property bool active: false
    // Something is going on (loading, syncing): a line pulses at the content's edge.
    property bool busy: false
    readonly property real dragDistance: logic.dragDistance
    readonly property Item highlightedItem: _highlighted
    default property alias _items: column.data

    // Read by the native logic.
    property bool _pullDown: true
    readonly property real _contentEnd: flickable ? flickable.originY + Math.max(flickable.contentHeight, flickable.height) : 0
    readonly property real _inactivePosition: !flickable ? 0
        : _pullDown ? flickable.originY : _contentEnd - flickable.height
    // How far the content may go the other way while it fits the view and no menu is there.
    readonly property real _maxDragPosition: _inactivePosition
    readonly property real _finalPosition: _inactivePosition
    readonly property real _snapThreshold: Theme.itemSizeSmall
    readonly property real _snapCalculationVelocity: 1000 * Theme.pixelRatio
    readonly property Item _contentColumn: column
    property bool _activationInhibited: false
    property bool _changingListView: false

    readonly property bool _snapping: snap.running
    property Item _highlighted: null
    property Item _pending: null

    width: flickable ? flickable.width : 0
    height: column.height + Theme.paddingLarge * 2
    y: _pullDown ? _inactivePosition - height : _contentEnd
    // Out of view beyond the content's edge until pulled; drawn only then. (It stays
    // visible to the logic, which ignores hidden menus.)
    opacity: dragDistance > 0 ? 1 : 0

    // The item whose middle the revealed part has reached last; none once the whole menu
    // and more is out.
    function _itemAt(distance) {
        if (distance <= Theme.paddingLarge || distance > menu.height)
            return null
        var found = null
        for (var i = 0; i < column.children.length; ++i) {
            var item = column.children[i]
            if (!item.visible || !item.enabled || !item.hasOwnProperty("clicked"))
                continue
            var middle = column.y + item.y + item.height / 2
            if (_pullDown && middle >= menu.height - distance)
                return item
            if (!_pullDown && middle <= distance)
                found = item
        }
        return found
    }

    onDragDistanceChanged: {
        if (flickable && flickable.dragging)
            _highlighted = _itemAt(dragDistance)
    }

    function _runPending() {
        var item = _pending
        _pending = null
        if (item) {
            Private.Util.playTouchFeedback()
            item.clicked()
        }
    }

    Connections {
        target: menu.flickable
        function onDraggingChanged() {
            if (menu.flickable.dragging) {
                snap.stop() // the finger takes over
                return
            }
            // Let go: what was highlighted runs once the content is back.
            menu._pending = menu._highlighted
            menu._highlighted = null
            if (menu._pending && !menu.flickable.moving)
                menu._runPending()
        }
        function onMovementEnded() { menu._runPending() }
        function onFlickStarted() { logic.monitorFlick() }
    }

    // A flickable that holds both kinds of menus says which is which, so that neither
    // holds the content back from the other while it fits the view.
    Component.onCompleted: {
        if (flickable && flickable.hasOwnProperty(_pullDown ? "pullDownMenu" : "pushUpMenu"))
            flickable[_pullDown ? "pullDownMenu" : "pushUpMenu"] = menu
    }

    Private.PulleyMenuLogic {
        id: logic
        pullDownType: menu._pullDown
        flickable: menu.flickable
        onAnimateFlick: {
            snap.to = position
            snap.duration = Math.max(1, duration * 1000)
            menu.flickable.cancelFlick()
            snap.restart()
        }
    }

    NumberAnimation {
        id: snap
        target: menu.flickable
        property: "contentY"
        easing.type: Easing.OutQuad
    }

    // A glow of the highlight colour, strongest at the far end of the menu.
    OverlayGradient {
        anchors.fill: parent
        color: Theme.highlightBackgroundColor
        direction: menu._pullDown ? OpacityRamp.BottomToTop : OpacityRamp.TopToBottom
        slope: 0.3
    }

    Column {
        id: column
        y: Theme.paddingLarge
        width: menu.width
    }

    // The busy line, at the content's edge in the view, shown whatever the menu does.
    Rectangle {
        parent: menu.flickable
        visible: menu.busy
        y: menu._pullDown ? 0 : (menu.flickable ? menu.flickable.height - height : 0)
        width: menu.width
        height: Math.max(2, Theme.paddingSmall / 2)
        color: Theme.highlightColor
        SequentialAnimation on opacity {
            running: menu.busy
            loops: Animation.Infinite
            NumberAnimation { from: 1; to: 0.2; duration: 600 }
            NumberAnimation { from: 0.2; to: 1; duration: 600 }
        }
    }
}
