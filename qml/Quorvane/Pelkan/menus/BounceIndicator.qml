import QtQuick 2.6
import Quorvane.Pelkan 1.0

// Where a flickable has no menu, a glow at the edge of its content that grows while the
// content is dragged past that edge (from the native bounce effect's difference) and fades
// when the finger lets go. Declare it inside the Flickable, ListView or GridView, in an
// ApplicationWindow.
Item {
    id: indicator

    /*! The flickable whose edges glow: the one it is declared in, unless set. */
    property Flickable flickable: {
        var above = parent
        if (above instanceof Flickable)
            return above
        if (above && above.parent instanceof Flickable && above.parent.contentItem === above)
            return above.parent
        return null
    }
    /*! True while the content is dragged past an edge. */
    readonly property bool active: effect.active
    /*! 0 to 1: how far past the edge, against a large item's height, while dragged past it. */
    readonly property real amount: active ? Math.min(1, Math.abs(effect.difference) / Theme.itemSizeLarge) : 0

    QtObject {
        id: internal
        readonly property bool atTop: !indicator.flickable || indicator.flickable.contentY <= indicator.flickable.originY + 1
    }

    BounceEffect {
        id: effect
        flickable: indicator.flickable
    }

    OverlayGradient {
        parent: indicator.flickable
        width: parent ? parent.width : 0
        height: Theme.paddingLarge * 2 * indicator.amount
        y: internal.atTop ? 0 : (parent ? parent.height - height : 0)
        opacity: indicator.active ? 1 : 0
        Behavior on opacity { OpacityAnimator { duration: 200 } }
        color: Theme.highlightColor
        // Strongest at the view's edge.
        direction: internal.atTop ? OpacityRamp.BottomToTop : OpacityRamp.TopToBottom
    }
}
