import QtQuick 2.6
import Quorvane.Pelkan 1.0

// One screen of an application, placed by a PageStack. The stack sets status as pages come
// and go (Inactive, Activating, Active, Deactivating, in that order); orientation follows
// the application window's, within the orientations this page allows.
Item {
    id: page

    property int status: PageStatus.Inactive
    readonly property int orientation: _window ? _window._pageOrientation : Orientation.Portrait
    readonly property bool isPortrait: orientation === Orientation.Portrait || orientation === Orientation.PortraitInverted
    readonly property bool isLandscape: !isPortrait
    property int allowedOrientations: Orientation.All
    property bool backNavigation: true
    property bool forwardNavigation: true
    property int navigationStyle: PageNavigation.Horizontal
    // Whether a swipe may take this page off the stack; false keeps it while it is busy.
    property bool canNavigateForward: forwardNavigation

    // Set by the stack that holds the page.
    property Item pageStack: null
    property Item _window: null
    property Item _container: null
    // Opaque backgrounds keep the page below from showing through while pages move.
    property color backgroundColor: "transparent"

    width: parent ? parent.width : 0
    height: parent ? parent.height : 0
    focus: status === PageStatus.Active

    // Takes presses nothing on the page takes, so that a swipe starts anywhere on it and
    // nothing below the page reacts.
    MouseArea {
        anchors.fill: parent
        z: -1

        Rectangle {
            anchors.fill: parent
            color: page.backgroundColor
            visible: page.backgroundColor.a > 0
        }
    }
}
