import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// What text components draw, read back from the window: a fading label fades its end only
// when the text does not fit, and a field's underline thickens and changes colour with
// focus and error. Run in both render loops.
Rectangle {
    id: root
    width: 400; height: 800 // no smaller than the files run after it: the test window keeps its size
    color: "black"

    Label {
        id: label
        width: 300; color: "white"
        font.pixelSize: 32
        truncationMode: TruncationMode.Fade
    }

    TextField {
        id: field
        y: 100; width: 400
        underline.color: "#0000ff"
        underline.highlightColor: "#00ff00"
        underline.errorColor: "#ff0000"
        underline.lineWidth: 1
        underline.focusLineWidth: 3
    }

    TestCase {
        name: "TextRendering"
        when: windowShown

        // The brightest pixel in a band of columns of the label, in rows top..bottom.
        function brightest(image, from, to, top, bottom) {
            var best = 0
            for (var x = Math.floor(from); x < to; ++x)
                for (var y = Math.floor(top); y < bottom; ++y)
                    best = Math.max(best, image.red(x, y))
            return best
        }

        function test_fade_data() {
            return [
                { tag: "fits: nothing fades", text: "MMMM", mode: TruncationMode.Fade, faded: false },
                { tag: "too long: the end fades", text: "MMMMMMMMMMMMMMMMMMMM", mode: TruncationMode.Fade, faded: true },
                { tag: "too long, eliding", text: "MMMMMMMMMMMMMMMMMMMM", mode: TruncationMode.Elide, faded: false },
                { tag: "two of three lines: the second fades", text: "MMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMMM",
                  mode: TruncationMode.Fade, lines: 2, faded: true },
            ]
        }

        function test_fade(data) {
            label.truncationMode = data.mode
            label.wrapMode = data.lines ? Text.Wrap : Text.NoWrap
            label.maximumLineCount = data.lines || 1
            label.text = data.text
            waitForRendering(label)
            var image = grabImage(root)
            var inked = Math.min(label.width, label.contentWidth)
            var line = label.height / (data.lines || 1)
            var lastTop = label.height - line
            if (data.lines) // the lines above the last stay whole to their end
                verify(brightest(image, inked * 0.92, inked - 1, 0, lastTop) > 200)
            var start = brightest(image, 0, inked * 0.2, lastTop, label.height)
            var end = brightest(image, inked * 0.92, inked - 1, lastTop, label.height)
            verify(start > 200, "start " + start)
            if (data.faded)
                verify(end < start * 0.4, "end " + end + " against " + start)
            else
                verify(end > start * 0.8, "end " + end + " against " + start)
        }

        // The line's rows, from the bottom of the underline item up: the colour seen there.
        function lineRows(image) {
            var rows = []
            var u = field.underline
            var bottom = Math.round(u.mapToItem(root, 0, u.height).y) - 1
            for (var y = bottom; y > bottom - 5; --y) {
                var x = Math.round(u.mapToItem(root, u.width / 2, 0).x)
                rows.push(image.pixel(x, y))
            }
            return rows
        }

        function test_underline_data() {
            return [
                { tag: "resting: one blue row", focus: false, error: false, colour: "#0000ff", rows: 1 },
                { tag: "focused: three green rows", focus: true, error: false, colour: "#00ff00", rows: 3 },
                { tag: "error while focused: red", focus: true, error: true, colour: "#ff0000", rows: 3 },
            ]
        }

        function test_underline(data) {
            if (data.focus)
                field.forceEditorFocus()
            else
                root.forceActiveFocus()
            field.errorHighlight = data.error
            waitForRendering(field)
            var rows = lineRows(grabImage(root))
            for (var i = 0; i < rows.length; ++i) {
                if (i < data.rows)
                    verify(Qt.colorEqual(rows[i], data.colour), i + ": " + rows[i])
                else
                    verify(Qt.colorEqual(rows[i], "black"), i + ": " + rows[i])
            }
        }
    }
}
