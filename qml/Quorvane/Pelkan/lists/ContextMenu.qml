import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The menu of a ListItem (or of any item that opens it below itself): MenuItems tapped
// to run them; running one closes the menu.
Column {
    id: menu

    readonly property bool _tapToPick: true
    readonly property Item highlightedItem: null

    signal closed()

    visible: false
    onVisibleChanged: if (!visible) closed()

    // Glass under the menu, beside it in its parent (a column positions its children).
    GlassBackground {
        parent: menu.parent
        x: menu.x
        y: menu.y
        z: menu.z - 0.5
        width: menu.width
        height: menu.height
        visible: menu.visible
        radius: 0
        color: Theme.rgba(Theme.highlightBackgroundColor, 0.15)
    }

    function _picked(menuItem) {
        visible = false
    }
}
