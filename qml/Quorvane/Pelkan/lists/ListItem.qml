import QtQuick 2.6
import QtQml.Models 2.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private
import Quorvane.Pelkan.private 1.0 // for the RemorseCache attached to the view

/*!
    \qmltype ListItem
    \inqmlmodule Quorvane.Pelkan
    \brief A row of a list: `text`, an optional `description` and icon, or content of its own.

    Highlighted while pressed (until a swipe over it begins), clicked on release or by Space,
    Enter and Return while focused. A long press opens its `menu` (a ContextMenu, or a
    component making one) below it, pushing the rows below aside; a press outside closes it.
    From the keyboard the Menu key (or Shift+F10) opens it with its first item focused.
    With `text` (and `description`, `iconSource`) the row lays itself out as the theme says:
    the icon at the start, the words beside it in the palette's colours, highlighted while
    the row is. Declared children are the row's content instead, for rows of their own.
*/
Private.ButtonBase {
    id: item

    /*! The height of the row itself, without an open menu. */
    property real contentHeight: description !== "" ? Theme.itemSizeMedium : Theme.itemSizeSmall
    /*! A ContextMenu opened below the row by a long press or openMenu(), or a component
        making one. */
    property var menu
    /*! Whether a long press opens the menu. */
    property bool showMenuOnPressAndHold: true
    /*! A theme icon ("image://theme/icon-m-favorite") or an image URL drawn at the row's start. */
    property string iconSource
    /*! True while the menu is open. */
    readonly property bool menuOpen: internal.menuItem !== null && internal.menuItem.visible
    /*! What the row holds: declared children go here, sized as the row without its menu. */
    default property alias content: contentArea.data

    // Remorse: a countdown the view keeps for this row, shown over the row while it runs.
    /*! True while a remorse countdown runs for this row. */
    readonly property bool remorseRunning: remorse.countdown !== null && remorse.countdown.row >= 0
    /*! Shows "Deleting in 5 s, tap to cancel" over the row (text "Deleting") and runs action
        when the countdown ends, after timeout ms (5000 if left out), unless a tap cancels it.
        The countdown is kept by the view: it follows the row while rows are inserted,
        removed or moved, and outlives this delegate; make action in a scope that outlives
        the delegate (the page's or the view's), not inline here. Returns the countdown, whose
        triggered() and canceled() tell how it ended (canceled() also when the row leaves the
        model), or null outside a ListView. */
    function remorseAction(text, action, timeout) {
        var cache = remorse.cache()
        if (!cache) {
            console.warn("ListItem: remorse needs a ListView")
            return null
        }
        remorse.countdown = cache.start(remorse.row, timeout === undefined ? 5000 : timeout, action, text || "")
        return remorse.countdown
    }
    QtObject {
        id: remorse
        // -1 for a row outside a view
        readonly property int row: item.DelegateModel.itemsIndex !== undefined ? item.DelegateModel.itemsIndex : -1
        // The countdown shown; the view's cache deletes it when it ends.
        property QtObject countdown: null
        property Item overlay: null
        function cache() {
            var view = item.ListView.view
            return view ? view.RemorseCache : null
        }
        function follow() {
            var running = cache()
            countdown = running && row >= 0 ? running.at(row) : null
        }
        onRowChanged: refollow.restart()
        Component.onCompleted: follow() // a countdown may be running for this row already
        onCountdownChanged: {
            if (overlay)
                overlay.destroy()
            overlay = countdown ? remorseComponent.createObject(item, { "countdown": countdown }) : null
        }
    }
    // Once the model's change has reached the cache too: the view may hand its delegates
    // their new rows first. (A timer goes with the delegate; a deferred call would not.)
    Timer {
        id: refollow
        interval: 0
        onTriggered: remorse.follow()
    }
    Component {
        id: remorseComponent
        RemorseItem {}
    }

    /*! Opens the menu below the row and returns it; null without a menu. */
    function openMenu() {
        if (!menu)
            return null
        if (!internal.menuItem)
            internal.menuItem = menu instanceof Item ? menu : menu.createObject(item)
        if (!internal.menuItem)
            return null
        internal.menuItem.parent = item
        internal.menuItem.y = Qt.binding(function() { return item.contentHeight })
        internal.menuItem.width = Qt.binding(function() { return item.width })
        internal.menuItem.visible = true
        if (!internal.closer)
            internal.closer = closerComponent.createObject(item)
        return internal.menuItem
    }

    /*! Closes the menu. */
    function closeMenu() {
        if (internal.menuItem)
            internal.menuItem.visible = false
    }

    accessibleRole: Accessible.ListItem
    width: parent ? parent.width : 0
    height: contentHeight + (menuOpen ? internal.menuItem.height : 0)
    highlighted: (down && !internal.swiped) || menuOpen || visualFocus

    onPressed: {
        internal.pressX = pressX
        internal.pressY = pressY
        internal.swiped = false
    }
    // A press that turns into a swipe (the page's, or the list's before it scrolls) no
    // longer shows as a press.
    onPressXChanged: internal.checkSwipe()
    onPressYChanged: internal.checkSwipe()
    onPressAndHold: if (showMenuOnPressAndHold && menu) openMenu()
    // The Menu key (or Shift+F10) opens the menu from the keyboard, its first item focused.
    Keys.onPressed: {
        var menuKey = event.key === Qt.Key_Menu || (event.key === Qt.Key_F10 && (event.modifiers & Qt.ShiftModifier))
        if (!menuKey || !menu || !openMenu()) {
            event.accepted = false
            return
        }
        for (var first = item.nextItemInFocusChain(true), above = first; above; above = above.parent) {
            if (above === internal.menuItem) {
                first.forceActiveFocus(Qt.TabFocusReason)
                break
            }
        }
    }
    onMenuOpenChanged: {
        if (!menuOpen && internal.closer) {
            internal.closer.destroy()
            internal.closer = null
        }
    }
    onTextChanged: internal.makeLabels()
    onIconSourceChanged: internal.makeLabels()
    Component.onCompleted: internal.makeLabels()

    QtObject {
        id: internal

        property Item menuItem: null
        // Made while the menu is open only: a thousand rows need not carry one each.
        property Item closer: null
        property Item labels: null
        property real pressX
        property real pressY
        property bool swiped: false

        function checkSwipe() {
            if (item.pressed && !swiped)
                swiped = Math.abs(item.pressX - pressX) > Qt.styleHints.startDragDistance
                         || Math.abs(item.pressY - pressY) > Qt.styleHints.startDragDistance
        }
        // Rows of their own content never make the theme's layout.
        function makeLabels() {
            if (!labels && (item.text !== "" || item.iconSource !== ""))
                labels = labelsComponent.createObject(contentArea)
        }
    }

    // Below the content (declared first); not drawn at all while not highlighted.
    Rectangle {
        width: item.width
        height: item.contentHeight
        visible: item.highlighted
        color: item.palette.highlightBackgroundColor
        opacity: 0.3
    }

    Item {
        id: contentArea
        width: item.width
        height: item.contentHeight
    }

    Component {
        id: labelsComponent
        Item {
            anchors.fill: parent

            Image {
                id: icon
                anchors { left: parent.left; leftMargin: Theme.horizontalPageMargin; verticalCenter: parent.verticalCenter }
                width: item.iconSource !== "" ? Theme.iconSizeMedium : 0
                height: Theme.iconSizeMedium
                sourceSize: Qt.size(width, height)
                visible: item.iconSource !== ""
                source: item.iconSource.indexOf("image://theme/") !== 0 ? item.iconSource
                      : item.iconSource + (item.iconSource.indexOf("?") < 0 ? "?" : "")
                        + (item.highlighted ? item.palette.highlightColor : item.palette.primaryColor)
            }
            Column {
                anchors { left: icon.right; leftMargin: item.iconSource !== "" ? Theme.paddingLarge : 0
                          right: parent.right; rightMargin: Theme.horizontalPageMargin
                          verticalCenter: parent.verticalCenter }
                Text {
                    width: parent.width
                    text: item.text
                    color: item.highlighted ? item.palette.highlightColor : item.palette.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                    elide: Text.ElideRight
                }
                Text {
                    width: parent.width
                    visible: text !== ""
                    text: item.description
                    color: item.highlighted ? item.palette.secondaryHighlightColor : item.palette.secondaryColor
                    font.pixelSize: Theme.fontSizeSmall
                    elide: Text.ElideRight
                }
            }
        }
    }

    Component {
        id: closerComponent
        InverseMouseArea {
            anchors.fill: parent
            onPressedOutside: item.closeMenu()
        }
    }
}
