import QtQuick 2.6
import Quorvane.Pelkan 1.0

/*!
    \qmltype ScrollDecorator
    \inqmlmodule Quorvane.Pelkan
    \brief A thin bar at the end edge of a Flickable showing where the view is in its content.

    Shown while the content moves. Declare it inside the flickable (also a ListView or
    GridView) or beside it with `flickable` set. It sits at the right, at the left when
    mirrored.
*/
Rectangle {
    id: decorator

    /*! The flickable whose position the bar shows; the one it is declared in until set. */
    property Flickable flickable: internal.enclosing(parent)

    QtObject {
        id: internal
        readonly property real ratio: decorator.flickable && decorator.flickable.contentHeight > 0
                                      ? Math.min(1, decorator.flickable.height / decorator.flickable.contentHeight) : 1
        // Declared inside a ListView or GridView, the item is put in the view's contentItem.
        function enclosing(item) {
            if (item && item.hasOwnProperty("contentY"))
                return item
            return item && item.parent && item.parent.hasOwnProperty("contentY") ? item.parent : null
        }
    }

    parent: flickable
    anchors.right: parent ? parent.right : undefined
    y: flickable ? (flickable.contentY - flickable.originY) / Math.max(1, flickable.contentHeight) * flickable.height : 0
    width: Math.max(2, Theme.paddingSmall / 2)
    height: flickable ? flickable.height * internal.ratio : 0
    color: Theme.highlightColor
    visible: internal.ratio < 1
    opacity: flickable && flickable.moving ? 1 : 0
    Behavior on opacity { OpacityAnimator { duration: 300 } }
}
