import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The workings of a pull-down or push-up menu, as the only child of the public menu item
// (PullDownMenu, PushUpMenu), which keeps its public face and places itself beyond one
// edge of its flickable's content. The native PulleyMenuLogic reads the menu's state by
// name from its parent, this item: an Item child reports the menu's effective visible and
// enabled, and its `active` is what the public menu shows.
//
// Past the edge the content follows the finger one to one until the whole menu is out
// (the logic sees to that), so each item takes its own height of finger travel; beyond the
// whole menu it follows at half pace. The item whose middle the revealed part reached last
// is highlighted; none once the content is pulled more than a large item's height beyond
// the whole menu. On letting go with the menu out the menu takes the content back to its
// edge itself, in a set time, and runs the highlighted item's clicked() only once the
// content rests there; a cancelled touch runs nothing. A flick that would stop just short
// of the menu snaps to the edge.
Item {
    id: host

    /*! The public menu item. */
    property Item menu: parent
    /*! True for a menu above the content, false for one below it. */
    property bool pullDown: true
    /*! The flickable the menu was declared in: the view itself for a ListView or GridView
        (whose declared children are its own), the Flickable around its contentItem otherwise. */
    readonly property Flickable declaredIn: {
        var above = menu ? menu.parent : null
        if (above instanceof Flickable)
            return above
        if (above && above.parent instanceof Flickable && above.parent.contentItem === above)
            return above.parent
        return null
    }
    readonly property Flickable flickable: menu ? menu.flickable : null
    /*! The menu's items. */
    property alias content: column.data
    readonly property real dragDistance: logic.dragDistance
    readonly property Item highlightedItem: column.highlightedItem
    /*! Where the public menu lies in the content: beyond the resting position's edge. */
    readonly property real restingY: pullDown ? internal.top - height : internal.bottom + (flickable ? flickable.height : 0)

    // Read (and `active` written) by the native logic.
    property bool active: false
    readonly property bool _pullDown: pullDown
    readonly property real _inactivePosition: pullDown ? internal.top : internal.bottom
    // How far the content may go the other way while it fits the view and no menu is there.
    readonly property real _maxDragPosition: _inactivePosition
    readonly property real _finalPosition: _inactivePosition
    readonly property real _snapThreshold: Theme.itemSizeSmall
    readonly property real _snapCalculationVelocity: 1000 * Theme.pixelRatio
    readonly property Item _contentColumn: column
    property bool _activationInhibited: false
    property bool _changingListView: false

    width: menu ? menu.width : 0
    height: column.height + Theme.paddingLarge * 2
    // Out of view beyond the content's edge until pulled; drawn only then. (It stays
    // visible to the logic, which ignores hidden menus.)
    opacity: dragDistance > 0 ? 1 : 0

    QtObject {
        id: internal

        readonly property Flickable view: host.flickable
        // The content's resting positions at its top and at its bottom.
        readonly property real top: view ? view.originY - view.topMargin : 0
        readonly property real bottom: !view ? 0
            : Math.max(top, view.originY + view.contentHeight + view.bottomMargin - view.height)
        // Picked on letting go; runs once the content rests at its edge.
        property Item pending: null
        // Let go with the menu out: the content is to be taken back.
        property bool settling: false

        // The picked item whose middle the revealed part has reached last.
        function itemAt(distance) {
            if (distance <= Theme.paddingLarge || distance > host.height + Theme.itemSizeLarge)
                return null
            var found = null
            for (var i = 0; i < column.children.length; ++i) {
                var item = column.children[i]
                if (!(item instanceof MenuItem) || !item.visible || !item.enabled)
                    continue
                var middle = column.y + item.y + item.height / 2
                if (host.pullDown && middle >= host.height - distance)
                    return item
                if (!host.pullDown && middle <= distance)
                    found = item
            }
            return found
        }

        function atRest() {
            return view && !view.dragging && !view.moving && !snap.running
                && Math.abs(view.contentY - host._inactivePosition) < 0.5
        }

        function run() {
            if (!pending || !atRest())
                return
            var item = pending
            pending = null
            Private.Util.playTouchFeedback()
            item.clicked()
        }

        // After the flickable has handled the letting go (and perhaps started a flick or
        // a rebound of its own), the menu takes the content back to its edge itself, so
        // that the content comes to rest there, in a set time, before anything runs.
        function settle() {
            if (!view || view.dragging || snap.running)
                return
            if (Math.abs(view.contentY - host._inactivePosition) < 0.5) {
                run()
                return
            }
            view.cancelFlick()
            snap.to = host._inactivePosition
            snap.duration = 300
            snap.restart()
        }

        function attach() {
            if (!view || !host.menu)
                return
            if (host.menu.parent !== view.contentItem)
                host.menu.parent = view.contentItem
            var slot = host.pullDown ? "pullDownMenu" : "pushUpMenu"
            // A flickable that holds both kinds of menus says which is which, so that
            // neither holds the content back from the other while it fits the view.
            if (view.hasOwnProperty(slot))
                view[slot] = host.menu
        }
    }

    onFlickableChanged: later.restart()
    Component.onCompleted: {
        if (!flickable)
            console.warn((pullDown ? "PullDownMenu" : "PushUpMenu")
                         + ": no flickable; declare the menu inside a Flickable, ListView or GridView, or set its flickable")
        internal.attach()
    }

    onDragDistanceChanged: {
        if (flickable && flickable.dragging)
            column.highlightedItem = internal.itemAt(dragDistance)
    }

    Connections {
        target: host.flickable
        function onDraggingChanged() {
            if (host.flickable.dragging) {
                // The finger takes over: what was picked before is dropped.
                snap.stop()
                internal.pending = null
                internal.settling = false
                return
            }
            // A cancelled touch picks nothing and leaves the content to the flickable.
            var out = logic.dragDistance > 0 && !logic.canceled
            internal.pending = out ? column.highlightedItem : null
            column.highlightedItem = null
            if (out) {
                internal.settling = true
                later.restart()
            }
        }
        function onMovementEnded() { internal.run() }
        function onFlickStarted() { logic.monitorFlick() }
    }

    // The next turn of the event loop: after the flickable has handled the letting go, or
    // after a change of flickable has settled. (A timer goes with the menu; a deferred call
    // would outlive it.)
    Timer {
        id: later
        interval: 0
        onTriggered: {
            internal.attach()
            if (internal.settling) {
                internal.settling = false
                internal.settle()
            }
        }
    }

    Private.PulleyMenuLogic {
        id: logic
        pullDownType: host.pullDown
        flickable: host.flickable
        onAnimateFlick: {
            snap.to = position
            snap.duration = Math.max(1, duration * 1000)
            host.flickable.cancelFlick()
            snap.restart()
        }
    }

    NumberAnimation {
        id: snap
        target: host.flickable
        property: "contentY"
        easing.type: Easing.OutQuad
        onRunningChanged: if (!running) internal.run()
    }

    // A glow of the highlight colour, strongest at the far end of the menu.
    OverlayGradient {
        anchors.fill: host
        color: Theme.highlightBackgroundColor
        direction: host.pullDown ? OpacityRamp.BottomToTop : OpacityRamp.TopToBottom
        slope: 0.3
    }

    Private.MenuColumn {
        id: column
        y: Theme.paddingLarge
        width: host.width
        // Out of sight, its items take no presses and no Tab.
        enabled: host.dragDistance > 0
    }

    // The busy line, at the content's edge in the view, shown whatever the menu does.
    Rectangle {
        parent: host.flickable
        visible: host.menu !== null && host.menu.busy
        y: host.pullDown ? 0 : (parent ? parent.height - height : 0)
        width: host.width
        height: Math.max(2, Theme.paddingSmall / 2)
        color: Theme.highlightColor
        SequentialAnimation on opacity {
            running: host.menu !== null && host.menu.busy
            loops: Animation.Infinite
            NumberAnimation { from: 1; to: 0.2; duration: 600 }
            NumberAnimation { from: 0.2; to: 1; duration: 600 }
        }
    }
}
