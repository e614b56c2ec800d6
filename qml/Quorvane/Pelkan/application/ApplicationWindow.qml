import QtQuick 2.6
import QtQuick.Window 2.2 as QtWindow
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The root of an application: a page stack starting at initialPage, the application's
// cover, and the orientations it allows (intersected with the current page's). The
// content turns with the chosen orientation and lays itself out in the turned size.
// Works as the root of a QQuickView and of a QQmlApplicationEngine, for which it makes
// the window it lives in.
Private.Window {
    id: window

    property var initialPage
    // A Cover, or a component or URL making one; shown by the home screen.
    property var cover
    property alias pageStack: stack
    property int allowedOrientations: defaultAllowedOrientations
    default property alias content: contentArea.data
    readonly property alias contentItem: contentArea
    // Above the pages, turned with them: where popups go. What lies under it can be shown
    // frosted behind them (OverlayBackground.enabled), from one capture of the page stack.
    readonly property alias overlay: overlayLayer
    // Frames per second and frame times over the window (also for every window when
    // PELKAN_FRAME_RATE is set).
    property bool showFrameRate: false
    property QtWindow.Window _host: null
    property Private.CoverWindow _coverWindow: null

    readonly property int _pageOrientations: stack.currentPage && stack.currentPage.allowedOrientations !== undefined
                                             ? stack.currentPage.allowedOrientations : Orientation.All
    _allowedOrientations: (allowedOrientations & _pageOrientations) || allowedOrientations
    _backgroundColor: Theme.colorScheme === Theme.LightOnDark ? "#10141c" : "#f4f6fa"
    focus: true

    Item {
        id: contentArea
        // Orientation values are those of Qt::ScreenOrientation: turned by the angle between
        // the display's orientation and the chosen one. The device's compositor keeps the
        // display as it is built and leaves turning to applications; elsewhere the system
        // has turned the display already, to the orientation the screen reports.
        readonly property int displayOrientation: Qt.platform.pluginName === "wayland"
                                                  ? QtWindow.Screen.primaryOrientation : QtWindow.Screen.orientation
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
            color: window._backgroundColor
        }
    }

    Component {
        id: coverWindowComponent
        Private.CoverWindow {}
    }

    function _makeCover() {
        if (!cover)
            return
        var coverWindow = coverWindowComponent.createObject(null, { "width": Theme.coverSizeLarge.width,
                                                                     "height": Theme.coverSizeLarge.height })
        var item = cover
        if (!(cover instanceof Item)) {
            var component = typeof cover === "string" || cover instanceof String ? Qt.createComponent(cover) : cover
            item = component.createObject(coverWindow.contentItem)
            if (!item) {
                console.warn("ApplicationWindow: cannot create the cover:", component.errorString())
                coverWindow.destroy()
                return
            }
        }
        coverWindow.cover = item
        _coverWindow = coverWindow
        _setCover(coverWindow)
    }

    function _ensureWindow() {
        // Still without a parent once loading is over (QQmlApplicationEngine, not a view
        // that sets one after creating it): it makes a window of its own.
        if (window.parent)
            return
        _host = hostComponent.createObject(null, { "width": window.width, "height": window.height })
        window.parent = _host.contentItem
        window.width = Qt.binding(function() { return _host.width })
        window.height = Qt.binding(function() { return _host.height })
    }

    Component.onCompleted: {
        if (initialPage)
            stack.push(initialPage, {}, PageStackAction.Immediate)
        _makeCover()
        Qt.callLater(_ensureWindow)
        if (showFrameRate)
            Qt.callLater(function() { Private.Util.showFrameRate(window, true) })
    }
    Component.onDestruction: {
        if (_coverWindow)
            _coverWindow.destroy()
    }
}
