import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The menu of a ListItem (or of any item that opens it below itself): MenuItems tapped
// to run them; running one closes the menu.
Item {
    id: menu

    /*! The menu's MenuItems (and MenuLabels), top to bottom. */
    default property alias content: column.data

    /*! Emitted when the menu goes out of view (an item was run, or it was closed). */
    signal closed()

    visible: false
    implicitWidth: column.implicitWidth
    height: column.height
    onVisibleChanged: if (!visible) closed()

    Accessible.role: Accessible.PopupMenu

    // Glass under the menu, beside it in its parent, so that it is not clipped to the menu.
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

    Private.MenuColumn {
        id: column
        width: menu.width
        tapToPick: true
        onPicked: menu.visible = false
    }
}
