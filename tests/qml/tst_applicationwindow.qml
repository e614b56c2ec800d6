import QtQuick 2.6
import QtQuick.Window 2.2
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The application window: orientation chosen within what it and the current page allow,
// content turned and laid out in the turned size.
Item {
    id: root
    width: 400
    height: 600

    ApplicationWindow {
        id: app
        anchors.fill: parent
        allowedOrientations: Orientation.Portrait | Orientation.Landscape
    }

    Component {
        id: pageComponent
        Page {}
    }

    Component {
        id: windowComponent
        ApplicationWindow { anchors.fill: parent; initialPage: pageComponent }
    }

    Component {
        id: coverComponent
        Cover {}
    }
    Cover { id: coverItem }

    Component {
        id: remorsePage
        Page {
            property alias popup: popup
            Rectangle { anchors.fill: parent; color: "red" }
            RemorsePopup { id: popup }
        }
    }

    TestCase {
        name: "ApplicationWindow"
        when: windowShown

        function test_orientation_data() {
            return [
                { tag: "page allows portrait only", page: Orientation.Portrait, device: Orientation.Landscape, expected: Orientation.Portrait },
                { tag: "page allows all", page: Orientation.All, device: Orientation.Landscape, expected: Orientation.Landscape },
                { tag: "page allows landscape only", page: Orientation.Landscape, device: Orientation.Portrait, expected: Orientation.Landscape },
                { tag: "page allows only what the window does not", page: Orientation.PortraitInverted,
                  device: Orientation.Landscape, expected: Orientation.Landscape },
            ]
        }

        function test_orientation(data) {
            app.pageStack.clear()
            var page = app.pageStack.push(pageComponent, { "allowedOrientations": data.page }, PageStackAction.Immediate)
            app.deviceOrientation = data.device
            compare(app.orientation, data.expected)
            compare(page.orientation, data.expected)
            // Turned against the display, the content swaps its sides. (On this desktop the
            // display shows the screen's shape upright.)
            var turned = Screen.angleBetween(Screen.primaryOrientation, data.expected) % 180 !== 0
            compare(app.contentItem.width, turned ? app.height : app.width)
            compare(page.width, app.contentItem.width)
            tryCompare(app.contentItem, "rotation", Screen.angleBetween(Screen.primaryOrientation, data.expected))
        }

        // On a desktop the page is upright in the screen's shape, and says so; an orientation
        // the screen's shape is not turns the content.
        function test_orientationMatchesWhatShows_data() {
            var portraitScreen = Screen.height > Screen.width
            var shape = portraitScreen ? Orientation.Portrait : Orientation.Landscape
            var other = portraitScreen ? Orientation.Landscape : Orientation.Portrait
            return [
                { tag: "all allowed: the screen's shape", allowed: Orientation.All, expected: shape, turned: false },
                { tag: "only the other shape: turned", allowed: other, expected: other, turned: true },
            ]
        }

        function test_orientationMatchesWhatShows(data) {
            var made = windowComponent.createObject(root, { "allowedOrientations": data.allowed })
            var page = made.pageStack.currentPage
            compare(made.orientation, data.expected)
            compare(page.isPortrait, data.expected === Orientation.Portrait)
            tryVerify(function() { return made.contentItem.rotation % 180 === (data.turned ? 90 : 0) })
            compare(page.width > page.height, page.isLandscape)
            made.destroy()
        }

        // The home screen is told there is a cover whenever one is given, and not once it goes.
        function test_coverHint_data() {
            return [
                { tag: "a component", cover: coverComponent },
                { tag: "a cover item", cover: coverItem },
            ]
        }

        function test_coverHint(data) {
            var made = windowComponent.createObject(root, { "cover": data.cover })
            verify(made._haveCoverHint)
            made.cover = null
            verify(!made._haveCoverHint)
            made.cover = data.cover
            verify(made._haveCoverHint)
            made.destroy()
            wait(0)
        }

        // A popup counting down shows in the overlay over a frosted capture of the pages,
        // and goes home when done; the capture stops with it.
        function test_popupInOverlay() {
            app.deviceOrientation = Orientation.Portrait
            app.pageStack.clear()
            var page = app.pageStack.push(remorsePage, {}, PageStackAction.Immediate)
            var popup = page.popup
            popup.execute("Clearing", function() {}, 10000)
            compare(popup.parent, app.overlay)
            compare(popup.width, page.width)
            var source = popup.Private.OverlayBackground.source
            verify(source !== null)
            compare(popup.Private.OverlayBackground.background.backdrop, source)
            verify(source.active)
            popup.cancel()
            compare(popup.parent, page)
            verify(!source.active)
        }
    }
}
