import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype Page
    \inqmlmodule Quorvane.Pelkan
    \brief One screen of an application, placed by a PageStack.

    The stack sets `status` as pages come and go (Inactive, Activating, Active, Deactivating,
    in that order); `orientation` follows the application window's, within the orientations
    the page allows. A page is a control: colours set on its `palette` reach every control on
    it, and it is a focus scope, so a field the application focuses (also while the page
    becomes active) keeps the focus when the page gets it.
*/
Private.ControlBase {
    id: page

    /*! Where the page is in its stack's moves: PageStatus.Inactive, Activating, Active or
        Deactivating. Set by the stack. */
    property int status: PageStatus.Inactive
    /*! The orientation the page is shown in (an Orientation value). */
    readonly property int orientation: applicationWindow ? applicationWindow._pageOrientation : Orientation.Portrait
    /*! Whether the page is shown upright or upside down. */
    readonly property bool isPortrait: orientation === Orientation.Portrait || orientation === Orientation.PortraitInverted
    /*! Whether the page is shown sideways. */
    readonly property bool isLandscape: !isPortrait
    /*! The orientations this page may be shown in (Orientation flags); the window's allowed
        orientations are narrowed to these while it is the current page. */
    property int allowedOrientations: Orientation.All
    /*! Whether a back swipe (or the Back key) may pop the page. */
    property bool backNavigation: true
    /*! Whether a forward swipe may reach the page attached after it. */
    property bool forwardNavigation: true
    /*! PageNavigation.Horizontal (swipes sideways) or PageNavigation.Vertical. */
    property int navigationStyle: PageNavigation.Horizontal
    /*! Whether a swipe may take this page off the stack; false keeps it while it is busy. */
    property bool canNavigateForward: forwardNavigation
    /*! The stack holding the page, or null; set by the stack. */
    property Item pageStack: null
    /*! The ApplicationWindow the page is shown in, or null while it is in none. */
    readonly property Item applicationWindow: pageStack && pageStack.applicationWindow ? pageStack.applicationWindow : null
    /*! A colour the page is filled with, so that the page below does not show through while
        pages move; transparent until set. */
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
