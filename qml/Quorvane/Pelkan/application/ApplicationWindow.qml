import QtQuick 2.6
import QtQuick.Window 2.2 as QtWindow
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The root of an application: a page stack starting at initialPage, the application's
// cover, and the orientations it allows (intersected with the current page's). The
// content turns with the chosen orientation and lays itself out in the turned size.
// Works as the root of a QQuickView and of a QQmlApplicationEngine, for which it makes
// the window it lives in. The window's background is the palette's backgroundColor.
Private.Window {
    id: window

    /*! The first page: a component, a URL or a page item. */
    property var initialPage
    /*! A Cover, or a component or URL making one; shown by the home screen while the
        application is in the background. The home screen is told whether there is one;
        it can be set, replaced and cleared at any time. */
    property var cover
    /*! The stack of the application's pages. */
    property alias pageStack: stack
    /*! The orientations the application allows; the current page narrows them further. */
    property int allowedOrientations: defaultAllowedOrientations
    /*! Items declared in the window go over the page stack, turned with it. */
    default property alias content: contentArea.data
    /*! What turns with the orientation: the page stack, the overlay and the content. */
    readonly property alias contentItem: contentArea
    /*! Above the pages, turned with them: where popups go. What lies under it can be shown
        frosted behind them (OverlayBackground.enabled), from one capture of the page stack. */
    readonly property alias overlay: overlayLayer
    /*! Frames per second and frame times over the window (also for every window when
        PELKAN_FRAME_RATE is set). */
    property bool showFrameRate: false

    _allowedOrientations: (allowedOrientations & internal.pageOrientations) || allowedOrientations
    // A toolkit application: the home screen pairs its cover with it.
    publishCategory: true
    // Right to left for a right-to-left language: every page, control and layout in it mirrors.
    LayoutMirroring.enabled: Qt.application.layoutDirection === Qt.RightToLeft
    LayoutMirroring.childrenInherit: true
    _backgroundColor: palette.backgroundColor
    focus: true

    onCoverChanged: {
        if (internal.complete)
            internal.makeCover()
    }

    QtObject {
        id: internal

        property bool complete: false
        property QtWindow.Window host: null
        property Private.CoverWindow coverWindow: null
        readonly property int pageOrientations: stack.currentPage && stack.currentPage.allowedOrientations !== undefined
                                                ? stack.currentPage.allowedOrientations : Orientation.All

        // Makes the cover window for the cover now set, in place of the one before; none
        // for no cover. The window item tells the home screen whether there is one.
        function makeCover() {
            var previous = coverWindow
            coverWindow = null
            if (window.cover) {
                var made = coverWindowComponent.createObject(null, { "width": Theme.coverSizeLarge.width,
                                                                     "height": Theme.coverSizeLarge.height })
                var item = window.cover
                if (!(item instanceof Item)) {
                    var component = typeof item === "string" || item instanceof String ? Qt.createComponent(item) : item
                    item = component.createObject(made.contentItem)
                    if (!item) {
                        console.warn("ApplicationWindow: cannot create the cover:", component.errorString())
                        made.destroy()
                        made = null
                    }
                }
                if (made) {
                    made.cover = item
                    coverWindow = made
                }
            }
            window._setCover(coverWindow)
            if (previous)
                previous.destroy() // a cover item of the application's own only leaves it
        }

        function ensureWindow() {
            // Still without a parent once loading is over (QQmlApplicationEngine, not a view
            // that sets one after creating it): it makes a window of its own.
            if (window.parent)
                return
            host = hostComponent.createObject(null, { "width": window.width, "height": window.height })
            window.parent = host.contentItem
            window.width = Qt.binding(function() { return internal.host.width })
            window.height = Qt.binding(function() { return internal.host.height })
        }
    }

    Item {
        id: contentArea
        // Orientation values are those of Qt::ScreenOrientation: turned by the angle between
        // the display's orientation and the chosen one. The device's compositor keeps the
        // display as it is built and leaves turning to applications; elsewhere the system
        // has turned the display already: it shows the screen's shape upright, in the
        // orientation the screen reports where that fits the shape (as the window item
        // reads the device's orientation there).
        readonly property int displayOrientation: {
            var shape = QtWindow.Screen.primaryOrientation
            if (Qt.platform.pluginName === "wayland")
                return shape
            var reported = QtWindow.Screen.orientation
            var portrait = function(o) { return o === Qt.PortraitOrientation || o === Qt.InvertedPortraitOrientation }
            return portrait(reported) === portrait(shape) ? reported : shape
        }
        readonly property int angle: window.orientation !== Orientation.None && displayOrientation !== 0
                                     ? QtWindow.Screen.angleBetween(displayOrientation, window.orientation) : 0
        readonly property bool turned: angle % 180 !== 0
        anchors.centerIn: parent
        width: turned ? window.height : window.width
        height: turned ? window.width : window.height
        rotation: angle
        Behavior on rotation {
            RotationAnimation { direction: RotationAnimation.Shortest; duration: 250; easing.type: Easing.InOutQuad }
        }

        PageStack {
            id: stack
            anchors.fill: parent
            applicationWindow: window
        }

        // Captures only while a popup shows it.
        Private.OverlayBackgroundSource {
            sourceItem: stack
        }

        Item {
            id: overlayLayer
            anchors.fill: parent
            z: 1000
        }
    }

    onShowFrameRateChanged: Private.Util.showFrameRate(window, showFrameRate)

    Component {
        id: hostComponent
        QtWindow.Window {
            visible: true
            color: window.palette.backgroundColor
        }
    }

    Component {
        id: coverWindowComponent
        Private.CoverWindow {}
    }

    Component.onCompleted: {
        if (initialPage)
            stack.push(initialPage, {}, PageStackAction.Immediate)
        internal.complete = true
        internal.makeCover()
        Qt.callLater(internal.ensureWindow)
        if (showFrameRate)
            Qt.callLater(function() { Private.Util.showFrameRate(window, true) })
    }
    Component.onDestruction: {
        if (internal.coverWindow)
            internal.coverWindow.destroy()
    }
}
