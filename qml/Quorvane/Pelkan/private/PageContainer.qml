import QtQuick 2.6

// Holds one page of a PageStack at its place in the stack: a page's index from the top
// (0 for the top, 1 for the page attached to its right) times the stack's size, moved by
// the stack's offset, along the current page's navigation axis.
Item {
    id: container

    property Item stack
    property Item page
    property int index // position in the stack, 0 at the bottom
    property Item attached // the container of the page attached to this one
    property Item owner // for an attached page: the container it is attached to
    property bool ownsPage // made by the stack, destroyed with the container
    property Item originalParent

    readonly property real _place: (index - stack._top) * (stack.horizontalNavigationStyle ? stack.width : stack.height)
                                   + stack._offset

    width: stack.width
    height: stack.height
    x: stack.horizontalNavigationStyle ? _place : 0
    y: stack.horizontalNavigationStyle ? 0 : _place
    // Only pages at least partly in view are drawn; an attached page only beside the
    // current page it is attached to.
    visible: Math.abs(_place) < (stack.horizontalNavigationStyle ? stack.width : stack.height)
             && (!owner || owner === stack._currentContainer)
}
