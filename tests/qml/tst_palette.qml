import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The palette as QML code uses it: grouped property writes, and `undefined` to go back
// to the inherited colour.
Item {
    Private.ControlBase {
        id: page
        Private.ControlBase { id: button }
    }

    TestCase {
        name: "Palette"

        function test_groupedWritesAndReset() {
            page.palette.highlightColor = "#00ff00"
            compare(button.palette.highlightColor, "#00ff00")
            button.palette.highlightColor = "#0000ff"
            compare(button.palette.highlightColor, "#0000ff")
            compare(page.palette.highlightColor, "#00ff00")

            button.palette.highlightColor = undefined
            compare(button.palette.highlightColor, "#00ff00")
            page.palette.highlightColor = undefined
            compare(button.palette.highlightColor, Theme.highlightColor)
        }
    }
}
