import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Controls with real taps and drags: buttons laid out in rows, switch, slider steps, a
// combo box choice, time picker wheels in 12- and 24-hour modes; and the value mixing and
// string-list models they are built on.
Item {
    id: root
    width: 480
    height: 1800

    ButtonLayout {
        id: buttons
        width: 400
        columnSpacing: 10
        rowSpacing: 5
        Item { id: b0; implicitWidth: 100; implicitHeight: 30 }
        Item { id: b1; implicitWidth: 120; implicitHeight: 30 }
        Item { id: b2; implicitWidth: 80; implicitHeight: 30 }
    }

    Column {
        y: 100
        width: root.width
        TextSwitch { id: toggle; text: "Wi-Fi" }
        Slider { id: slider; minimumValue: 0; maximumValue: 100; stepSize: 25 }
        ComboBox { id: combo; label: "Colour"; model: ["Red", "Green", "Blue"] }
        TimePicker { id: picker; hourMode: DateTime.TwentyFourHours }
    }

    Private.VariantInterpolator { id: mix }
    Private.StringListModel { id: strings; strings: ["a", "b", "c"] }
    ListView { id: view; width: 100; height: 400; model: strings; delegate: Text { height: 20; text: display } }

    TestCase {
        name: "Controls"
        when: windowShown

        // Rows of equal widths (the widest in the row), centred, stacked.
        function test_buttonLayout_data() {
            return [
                { tag: "all fit", width: 400, widths: [120, 120, 120], ys: [0, 0, 0] },
                { tag: "two and one", width: 300, widths: [120, 120, 80], ys: [0, 0, 35] },
                { tag: "one each", width: 200, widths: [100, 120, 80], ys: [0, 35, 70] },
                { tag: "narrower than a button", width: 90, widths: [90, 90, 80], ys: [0, 35, 70] },
                { tag: "forced break", width: 400, newLine: true, widths: [100, 120, 120], ys: [0, 35, 35] },
                { tag: "hidden one skipped", width: 300, hide: true, widths: [100, 100], ys: [0, 0] },
            ]
        }

        function test_buttonLayout(data) {
            b1.ButtonLayout.newLine = !!data.newLine
            b1.visible = !data.hide
            buttons.width = data.width
            var shown = [b0, b1, b2].filter(function(b) { return b.visible })
            tryVerify(function() { return String(shown.map(function(b) { return b.width })) === String(data.widths) },
                      1000, String(shown.map(function(b) { return b.width })))
            compare(shown.map(function(b) { return b.y }), data.ys)
            var rows = data.ys[data.ys.length - 1] / 35 + 1
            compare(buttons.rowCount, rows)
            compare(buttons.implicitHeight, rows * 30 + (rows - 1) * 5)
            var first = shown[0]
            var rowEnd = shown.filter(function(b) { return b.y === first.y }).pop()
            fuzzyCompare(first.x + (rowEnd.x + rowEnd.width - first.x) / 2, data.width / 2, 0.5) // centred
            b1.ButtonLayout.newLine = false
            b1.visible = true
        }

        function test_switch_data() {
            return [ { tag: "automatic", automatic: true, checked: true }, { tag: "left to the app", automatic: false, checked: false } ]
        }

        function test_switch(data) {
            toggle.checked = false
            toggle.automaticCheck = data.automatic
            var clicked = 0
            toggle.clicked.connect(function() { ++clicked })
            mouseClick(toggle)
            compare(toggle.checked, data.checked)
            compare(clicked, 1)
        }

        function test_slider_data() {
            return [
                { tag: "start", at: 0, value: 0 },
                { tag: "just under a step", at: 0.36, value: 25 },
                { tag: "just over half a step", at: 0.63, value: 75 },
                { tag: "past the end", at: 1.2, value: 100 },
            ]
        }

        function test_slider(data) {
            slider.value = 50
            var track = slider.width - slider.leftPadding - slider.rightPadding
            var x = slider.leftPadding + track * data.at
            mousePress(slider, slider.leftPadding + track / 2, slider.height / 2)
            mouseMove(slider, x, slider.height / 2)
            mouseRelease(slider, x, slider.height / 2)
            compare(slider.value, data.value)
        }

        function test_comboBox() {
            var activated = []
            combo.activated.connect(function(i) { activated.push(i) })
            compare(combo.value, "Red")
            mouseClick(combo, combo.width / 2, Theme.itemSizeSmall / 2)
            verify(combo.menuOpen)
            waitForRendering(combo) // the menu's column laid out
            // Second entry of the menu under the row.
            mouseClick(combo, combo.width / 2, combo.height - (combo.height - Theme.itemSizeSmall) / 2)
            verify(!combo.menuOpen)
            compare(combo.currentIndex, 1)
            compare(combo.value, "Green")
            compare(activated, [1])
        }

        function test_timePicker_data() {
            return [
                { tag: "24 hours", mode: DateTime.TwentyFourHours, wheel: 0, entry: 3, hour: 3, wheels: 2 },
                { tag: "12 hours", mode: DateTime.TwelveHours, wheel: 0, entry: 3, hour: 15, wheels: 3 },
                { tag: "12 hours: am to pm", mode: DateTime.TwelveHours, wheel: 2, entry: 1, hour: 14, wheels: 3 },
                { tag: "minutes", mode: DateTime.TwentyFourHours, wheel: 1, entry: 1, minute: 1, wheels: 2 },
            ]
        }

        function test_timePicker(data) {
            picker.hourMode = data.mode
            picker.hour = data.tag === "12 hours" ? 14 : 2 // 2 pm stays pm
            picker.minute = 0
            var wheels = []
            var row = picker.children[0]
            for (var i = 0; i < row.children.length; ++i)
                if (row.children[i].visible && row.children[i].labels !== undefined)
                    wheels.push(row.children[i])
            compare(wheels.length, data.wheels)
            compare(wheels[0].count, data.mode === DateTime.TwelveHours ? 12 : 24)
            var wheel = wheels[data.wheel]
            // The entry just under the current one, in view.
            wheel.forceLayout()
            // The wheel turns to the current entry first; a tap while it turns only stops it.
            tryCompare(wheel, "contentY", (wheel.currentIndex - 1) * wheel.itemHeight)
            var entry = wheel.itemAtIndex(data.entry)
            mouseClick(entry)
            if (data.hour !== undefined)
                compare(picker.hour, data.hour)
            if (data.minute !== undefined)
                compare(picker.minute, data.minute)
            tryCompare(wheel, "currentIndex", data.entry)
        }

        function test_interpolation_data() {
            return [
                { tag: "number", from: 10, to: 20, progress: 0.25, value: 12.5 },
                { tag: "number beyond the end", from: 0, to: 10, progress: 1.5, value: 15 },
                { tag: "colour", from: Qt.rgba(1, 0, 0, 1), to: Qt.rgba(0, 0, 1, 0), progress: 0.5, value: Qt.rgba(0.5, 0, 0.5, 0.5) },
                { tag: "point", from: Qt.point(0, 10), to: Qt.point(10, 30), progress: 0.5, value: Qt.point(5, 20) },
                { tag: "size", from: Qt.size(10, 10), to: Qt.size(20, 30), progress: 0.1, value: Qt.size(11, 12) },
                { tag: "rectangle", from: Qt.rect(0, 0, 10, 10), to: Qt.rect(10, 20, 30, 40), progress: 0.5, value: Qt.rect(5, 10, 20, 25) },
                { tag: "different kinds: from", from: 1, to: Qt.point(1, 1), progress: 0.5, value: 1, warns: true },
                { tag: "different kinds: to", from: 1, to: Qt.point(1, 1), progress: 1, value: Qt.point(1, 1), warns: true },
            ]
        }

        function test_interpolation(data) {
            if (data.warns)
                ignoreWarning(/cannot interpolate/)
            mix.to = undefined
            mix.from = data.from
            mix.to = data.to
            mix.progress = -1
            mix.progress = data.progress
            if (typeof data.value === "number")
                fuzzyCompare(mix.value, data.value, 1e-9)
            else if (data.tag === "colour")
                verify(Math.abs(mix.value.r - 0.5) < 0.01 && mix.value.g === 0 && Math.abs(mix.value.b - 0.5) < 0.01
                       && Math.abs(mix.value.a - 0.5) < 0.01, String(mix.value))
            else
                compare(mix.value, data.value)
        }

        function test_stringListModel_data() {
            return [
                { tag: "append", edit: function() { strings.append("d") }, shown: ["a", "b", "c", "d"] },
                { tag: "insert", edit: function() { strings.insert(1, "x") }, shown: ["a", "x", "b", "c"] },
                { tag: "remove two", edit: function() { strings.remove(0, 2) }, shown: ["c"] },
                { tag: "move down", edit: function() { strings.move(0, 2) }, shown: ["b", "c", "a"] },
                { tag: "move up", edit: function() { strings.move(2, 0) }, shown: ["c", "a", "b"] },
                { tag: "set", edit: function() { strings.set(1, "y") }, shown: ["a", "y", "c"] },
                { tag: "out of range: nothing", edit: function() { strings.remove(5) }, shown: ["a", "b", "c"], warns: true },
            ]
        }

        function test_stringListModel(data) {
            strings.strings = ["a", "b", "c"]
            if (data.warns)
                ignoreWarning(/out of range/)
            data.edit()
            view.forceLayout()
            compare(strings.count, data.shown.length)
            compare(view.count, data.shown.length)
            var seen = []
            for (var i = 0; i < view.count; ++i)
                seen.push(view.itemAtIndex(i).text)
            compare(seen, data.shown)
        }
    }
}
