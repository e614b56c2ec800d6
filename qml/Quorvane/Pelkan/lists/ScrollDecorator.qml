import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A thin bar at the right of a Flickable showing where the view is in its content, while
// the content moves. Declare it beside the flickable (or inside it) and set `flickable`.
Rectangle {
    id: decorator

    property Flickable flickable: parent && parent.hasOwnProperty("contentY") ? parent : null
    readonly property real _ratio: flickable && flickable.contentHeight > 0
                                   ? Math.min(1, flickable.height / flickable.contentHeight) : 1

    parent: flickable
    x: flickable ? flickable.width - width : 0
    y: flickable ? (flickable.contentY - flickable.originY) / Math.max(1, flickable.contentHeight) * flickable.height : 0
    width: Math.max(2, Theme.paddingSmall / 2)
    height: flickable ? flickable.height * _ratio : 0
    color: Theme.highlightColor
    visible: _ratio < 1
    opacity: flickable && flickable.moving ? 1 : 0
    Behavior on opacity { OpacityAnimator { duration: 300 } }
}
