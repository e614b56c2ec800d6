import QtQuick 2.6

// The column that holds a menu's items, and all a MenuItem knows of its menu: a MenuItem
// whose parent is a MenuColumn is highlighted while it is the column's highlightedItem,
// and, where the menu picks on a tap, reports the tap through picked() before it emits
// its own clicked().
Column {
    /*! Items are run by a tap (context menus); otherwise the menu runs them itself. */
    property bool tapToPick: false
    /*! The item that letting go of the content would run (pulley menus), or null. */
    property Item highlightedItem: null

    /*! A tap on item is about to run it (tap-to-pick menus only). */
    signal picked(Item item)
}
