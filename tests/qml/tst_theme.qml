import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

Item {
    TestCase {
        name: "Theme"

        function test_metrics_data() {
            return [
                { tag: "items", small: "itemSizeSmall", large: "itemSizeLarge" },
                { tag: "paddings", small: "paddingSmall", large: "paddingLarge" },
                { tag: "icons", small: "iconSizeSmall", large: "iconSizeLarge" },
                { tag: "fonts", small: "fontSizeSmall", large: "fontSizeLarge" }
            ]
        }

        function test_metrics(data) {
            verify(Theme[data.small] > 0)
            verify(Theme[data.small] < Theme[data.large])
        }

        function test_coverSizes() {
            verify(Theme.coverSizeSmall.width < Theme.coverSizeLarge.width)
            verify(Theme.coverSizeSmall.height < Theme.coverSizeLarge.height)
        }

        function test_helpers() {
            compare(Theme.rgba("#ff0000", 0.5), Qt.rgba(1, 0, 0, 0.5))
            compare(Theme.highlightText("ab", "b", "#ff0000"), "a<font color=\"#ffff0000\">b</font>")
        }

        function test_screenContextProperty() {
            compare(screen.width, Screen.width)
            compare(screen.sizeCategory, Screen.sizeCategory)
            verify(screen.width > 0 && screen.width <= screen.height)
        }
    }
}
