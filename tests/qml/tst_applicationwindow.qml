import QtQuick 2.6
import QtQuick.Window 2.2
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The application window: orientation chosen within what it and the current page allow,
// content turned and laid out in the turned size.
Item {
    id: root
    width: 400; height: 600

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

        // The chosen orientation, within what the window and its page allow; with the device
        // left alone it is the screen's shape on this desktop, where the page is upright.
        function test_orientation_data() {
            var shape = Screen.height > Screen.width ? Orientation.Portrait : Orientation.Landscape
            var other = shape === Orientation.Portrait ? Orientation.Landscape : Orientation.Portrait
            return [
                { tag: "page allows portrait only", page: Orientation.Portrait, device: Orientation.Landscape, expected: Orientation.Portrait },
                { tag: "page allows all", page: Orientation.All, device: Orientation.Landscape, expected: Orientation.Landscape },
                { tag: "page allows landscape only", page: Orientation.Landscape, device: Orientation.Portrait, expected: Orientation.Landscape },
                { tag: "page allows only what the window does not", page: Orientation.PortraitInverted,
                  device: Orientation.Landscape, expected: Orientation.Landscape },
                { tag: "device as it shows: the screen's shape", page: Orientation.All, expected: shape },
                { tag: "device as it shows, only the other shape allowed", page: other, expected: other },
            ]
        }

        function test_orientation(data) {
            var made = windowComponent.createObject(root, { "allowedOrientations": Orientation.Portrait | Orientation.Landscape })
            var page = made.pageStack.push(pageComponent, { "allowedOrientations": data.page }, PageStackAction.Immediate)
            if (data.device)
                made.deviceOrientation = data.device
            compare(made.orientation, data.expected)
            compare(page.isPortrait, data.expected === Orientation.Portrait)
            // Turned against the display (which shows the screen's shape upright here), the
            // content swaps its sides.
            var turned = Screen.angleBetween(Screen.primaryOrientation, data.expected) % 180 !== 0
            compare(made.contentItem.width, turned ? made.height : made.width)
            compare(page.width, made.contentItem.width)
            tryCompare(made.contentItem, "rotation", Screen.angleBetween(Screen.primaryOrientation, data.expected))
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

        // A remorse popup counts down in the overlay over a frosted capture of the pages, runs
        // its action unless tapped, and goes home when done; the capture stops with it.
        function test_remorsePopup_data() {
            return [
                { tag: "runs after the countdown", log: ["cleared"] },
                { tag: "cancelled by a tap", tap: true, log: [] },
            ]
        }

        function test_remorsePopup(data) {
            app.deviceOrientation = Orientation.Portrait
            app.pageStack.clear()
            var page = app.pageStack.push(remorsePage, {}, PageStackAction.Immediate)
            var popup = page.popup
            var log = []
            popup.execute("Clearing", function() { log.push("cleared") }, 300)
            compare(popup.description, "Clearing in 1 s, tap to cancel")
            verify(popup.visible)
            compare(popup.parent, app.overlay)
            compare(popup.width, page.width)
            var source = popup.Private.OverlayBackground.source
            verify(source !== null)
            compare(popup.Private.OverlayBackground.background.backdrop, source)
            verify(source.active)
            if (data.tap)
                mouseClick(popup, 20, 20)
            wait(600) // past the countdown
            tryVerify(function() { return log.length === data.log.length }) // a busy machine may be late
            compare(log, data.log)
            tryCompare(popup, "visible", false)
            compare(popup.parent, page)
            verify(!source.active)
        }
    }
}
