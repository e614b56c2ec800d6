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

    function _picked(menuItem) {
        visible = false
    }
}
