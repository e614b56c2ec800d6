import QtQuick 2.6
import Quorvane.Pelkan.private 1.0 as Private

// A menu below the content of a flickable, revealed by pushing the content up past its end:
//     ListView { PushUpMenu { MenuItem { text: "Back to the top"; onClicked: ... } } }
// Declared inside a Flickable, ListView or GridView it finds its flickable and places
// itself in the content. Each item takes its own height of finger travel to reach; letting
// go on one runs its clicked() once the content has settled at its edge.
Item {
    id: menu

    /*! The flickable whose content the menu belongs to: the one it is declared in, unless set. */
    property Flickable flickable: host.declaredIn
    /*! True while the menu is out and following the content. */
    readonly property bool active: host.active
    /*! Something is going on (loading, syncing): a line pulses at the content's edge. */
    property bool busy: false
    /*! How far the menu has been pulled out, in pixels. */
    readonly property real dragDistance: host.dragDistance
    /*! The item that letting go now would run, or null. */
    readonly property Item highlightedItem: host.highlightedItem
    /*! The menu's MenuItems and MenuLabels, top to bottom. */
    default property alias content: host.content

    width: flickable ? flickable.width : 0
    height: host.height
    y: host.restingY

    Accessible.role: Accessible.PopupMenu
    Accessible.name: qsTrId("quorvanepelkan-la-push_up_menu")

    Private.PulleyMenuBase {
        id: host
        pullDown: false
    }
}
