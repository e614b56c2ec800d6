import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

Item {
    Private.ControlBase {
        id: page
        Private.ControlBase { id: button }
    }

    Palette { id: free }

    TestCase {
        name: "Palette"

        function cleanup() {
            page.palette.highlightColor = undefined
            button.palette.highlightColor = undefined
            free.primaryColor = undefined
        }

        function test_followsTheme() {
            compare(free.primaryColor, Theme.primaryColor)
            free.primaryColor = "#123456"
            compare(free.primaryColor, "#123456")
            free.primaryColor = undefined
            compare(free.primaryColor, Theme.primaryColor)
        }

        function test_childControlsInherit() {
            page.palette.highlightColor = "#00ff00"
            compare(button.palette.highlightColor, "#00ff00")
            button.palette.highlightColor = "#0000ff"
            compare(button.palette.highlightColor, "#0000ff")
            compare(page.palette.highlightColor, "#00ff00")
        }

        function test_highlightedBinding() {
            var spy = Qt.createQmlObject("import QtTest 1.2; SignalSpy {}", page)
            spy.target = page
            spy.signalName = "highlightedChanged"
            page.highlighted = true
            compare(spy.count, 1)
            page.highlighted = false
            compare(spy.count, 2)
            spy.destroy()
        }
    }
}
