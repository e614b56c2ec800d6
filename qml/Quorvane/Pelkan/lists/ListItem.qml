import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A row of a list: highlighted while pressed (until a swipe over it begins), clicked on
// release, and with a `menu` (a ContextMenu, or a component making one) opened below it by
// a long press or openMenu(), pushing the rows below aside. A press outside closes it.
Item {
    id: item

    property real contentHeight: Theme.itemSizeSmall
    property var menu
    property bool showMenuOnPressAndHold: true
    readonly property bool highlighted: (mouseArea.pressed && !detector.dragging) || menuOpen
    readonly property bool menuOpen: _menuItem !== null && _menuItem.visible
    readonly property bool down: mouseArea.pressed
    default property alias content: contentArea.data

    property Item _menuItem: null

    signal clicked()
    signal pressAndHold()

    width: parent ? parent.width : 0
    height: contentHeight + (menuOpen ? _menuItem.height : 0)

    function openMenu() {
        if (!menu)
            return null
        if (!_menuItem)
            _menuItem = menu instanceof Item ? menu : menu.createObject(item)
        if (!_menuItem)
            return null
        _menuItem.parent = item
        _menuItem.y = Qt.binding(function() { return item.contentHeight })
        _menuItem.width = Qt.binding(function() { return item.width })
        _menuItem.visible = true
        return _menuItem
    }

    function closeMenu() {
        if (_menuItem)
            _menuItem.visible = false
    }

    Private.DragDetectorItem {
        id: detector
        width: item.width
        height: item.contentHeight

        MouseArea {
            id: mouseArea
            anchors.fill: parent
            onClicked: item.clicked()
            onPressAndHold: {
                item.pressAndHold()
                if (item.showMenuOnPressAndHold && item.menu)
                    item.openMenu()
            }

            Rectangle {
                anchors.fill: parent
                color: Theme.highlightBackgroundColor
                opacity: item.highlighted ? 0.3 : 0
            }
            Item {
                id: contentArea
                anchors.fill: parent
            }
        }
    }

    InverseMouseArea {
        anchors.fill: parent
        enabled: item.menuOpen
        onPressedOutside: item.closeMenu()
    }
}
