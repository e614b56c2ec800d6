import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Controls with real keys, taps and drags: keys of each control (also mirrored), Tab order,
// presses, press-and-hold, checkable and repeating buttons, the slider under a finger in a
// flickable, the palette a page hands down; buttons laid out in rows, time picker wheels in
// 12- and 24-hour modes, and the value mixing behind animations.
Item {
    id: root
    width: 480; height: 1800

    ButtonLayout {
        id: buttons
        width: 400; columnSpacing: 10; rowSpacing: 5
        Item { id: b0; implicitWidth: 100; implicitHeight: 30 }
        Item { id: b1; implicitWidth: 120; implicitHeight: 30 }
        Item { id: b2; implicitWidth: 80; implicitHeight: 30 }
    }

    Page {
        id: page
        y: 100; width: root.width; height: 1200
        Column {
            id: controls
            width: root.width
            LayoutMirroring.childrenInherit: true
            PageHeader { id: header; title: "Controls" }
            Private.ButtonBase { id: plain; width: 100; height: 50 }
            Button { id: button; text: "Send" }
            TextSwitch { id: toggle; text: "Wi-Fi" }
            Slider { id: slider; minimumValue: 0; maximumValue: 100; stepSize: 25 }
            ComboBox { id: combo; label: "Colour"; model: ["Red", "Green", "Blue"] }
            TimePicker { id: picker; hourMode: DateTime.TwentyFourHours }
            IconButton { id: iconButton; text: "Close"; iconSource: "image://theme/icon-m-close" }
            BusyIndicator { id: busy }
        }
    }

    // A closed pulley menu lies out of sight over the flickable above: Tab passes its items
    // by and they take no presses from the slider there.
    Flickable {
        id: pulleyFlick
        y: 1720; width: root.width; height: 80; contentHeight: 80
        PullDownMenu { MenuItem { id: pulleyItem; text: "Hidden" } }
    }

    Flickable {
        id: flick
        y: 1400; width: root.width; height: 300; contentHeight: 2000
        Slider { id: flickSlider; y: 100; minimumValue: 0; maximumValue: 100; stepSize: 25 }
    }

    Private.VariantInterpolator { id: mix }

    GestureTestCase {
        name: "Controls"

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

        // The keys of a focused control, with what each must do; also right to left.
        function test_keys_data() {
            var rows = [
                { tag: "button: Space", control: "button", key: Qt.Key_Space, clicked: 1 },
                { tag: "button: Return", control: "button", key: Qt.Key_Return, clicked: 1 },
                { tag: "button: Enter", control: "button", key: Qt.Key_Enter, clicked: 1 },
                { tag: "button: a letter does nothing", control: "button", key: Qt.Key_A, clicked: 0 },
                { tag: "switch: Space flips it", control: "toggle", key: Qt.Key_Space, clicked: 1, checked: true },
                { tag: "switch left to the app: Space", control: "toggle", key: Qt.Key_Space, manual: true, clicked: 1, checked: false },
                { tag: "slider: Right", control: "slider", key: Qt.Key_Right, value: 75 },
                { tag: "slider: Left", control: "slider", key: Qt.Key_Left, value: 25 },
                { tag: "slider: Up", control: "slider", key: Qt.Key_Up, value: 75 },
                { tag: "slider: Down", control: "slider", key: Qt.Key_Down, value: 25 },
                { tag: "slider: Page Up", control: "slider", key: Qt.Key_PageUp, value: 75 },
                { tag: "slider: Home", control: "slider", key: Qt.Key_Home, value: 0 },
                { tag: "slider: End", control: "slider", key: Qt.Key_End, value: 100 },
                { tag: "combo: Space opens it", control: "combo", key: Qt.Key_Space, clicked: 1, menuOpen: true },
                { tag: "combo: Down picks the next", control: "combo", key: Qt.Key_Down, currentIndex: 1 },
                { tag: "combo: Up at the first stays", control: "combo", key: Qt.Key_Up, currentIndex: 0 },
            ]
            // Mirrored, the arrows along the track swap; nothing else changes.
            var mirrored = rows.map(function(row) {
                var copy = JSON.parse(JSON.stringify(row))
                copy.tag = "mirrored " + row.tag
                copy.mirrored = true
                if (row.key === Qt.Key_Right || row.key === Qt.Key_Left)
                    copy.value = 100 - row.value
                return copy
            })
            return rows.concat(mirrored)
        }

        function test_keys(data) {
            var control = { button: button, toggle: toggle, slider: slider, combo: combo }[data.control]
            controls.LayoutMirroring.enabled = !!data.mirrored
            compare(control.mirrored, !!data.mirrored)
            toggle.checked = false
            toggle.automaticCheck = !data.manual
            slider.value = 50
            combo.currentIndex = 0
            var seen = { clicked: 0, moved: 0, activated: [] }
            var count = function(name) { return function(i) { name === "activated" ? seen.activated.push(i) : ++seen[name] } }
            var connections = [[control.clicked, count("clicked")], [control.moved, count("moved")],
                               [control.activated, count("activated")]].filter(function(c) { return !!c[0] })
            connections.forEach(function(c) { c[0].connect(c[1]) })
            control.forceActiveFocus()
            keyClick(data.key)
            connections.forEach(function(c) { c[0].disconnect(c[1]) })
            if (data.clicked !== undefined)
                compare(seen.clicked, data.clicked)
            if (data.checked !== undefined)
                compare(toggle.checked, data.checked)
            if (data.value !== undefined) {
                compare(slider.value, data.value)
                compare(seen.moved, data.value === 50 ? 0 : 1)
            }
            if (data.menuOpen !== undefined)
                compare(combo.menuOpen, data.menuOpen)
            if (data.currentIndex !== undefined) {
                compare(combo.currentIndex, data.currentIndex)
                compare(seen.activated, data.currentIndex ? [data.currentIndex] : [])
            }
            combo.menuOpen && mouseClick(combo, combo.width / 2, Theme.itemSizeSmall / 2)
            controls.LayoutMirroring.enabled = false
        }

        // Tab and Shift+Tab walk the controls in order, shown as focused; a tap does not take
        // the focus, focus given otherwise shows nothing; a closed pulley menu is passed by.
        function test_tab() {
            button.forceActiveFocus()
            verify(!button.visualFocus)
            var order = [button, toggle, slider, combo]
            for (var i = 1; i < order.length; ++i) {
                keyClick(Qt.Key_Tab)
                verify(order[i].activeFocus && order[i].visualFocus, "Tab to " + i)
                verify(!order[i - 1].visualFocus)
            }
            keyClick(Qt.Key_Backtab)
            verify(slider.activeFocus && slider.visualFocus)
            mouseClick(button)
            verify(slider.activeFocus)
            for (i = 0; i < 30; ++i) {
                keyClick(Qt.Key_Tab)
                verify(!pulleyItem.activeFocus, "Tab " + i + " reached a closed pulley menu")
            }
        }

        // Presses of a button: what a click, a held press, a checkable button, a repeating
        // one and a finger that leaves give.
        function test_press_data() {
            var hold = Qt.styleHints.mousePressAndHoldInterval + 200
            return [
                { tag: "click", clicked: 1 },
                { tag: "held, handled: no click", hold: hold, handler: true, held: 1, clicked: 0 },
                { tag: "held, not handled: a click", hold: hold, clicked: 1 },
                { tag: "checkable", checkable: true, clicked: 1, toggled: 1 },
                { tag: "repeating", repeat: true, hold: 650, atLeast: 3 }, // every 100 ms after 300 ms, and the release
                { tag: "finger leaves", leave: true, clicked: 0, canceled: 1 },
            ]
        }

        function test_press(data) {
            var seen = { clicked: 0, pressAndHold: 0, toggled: 0, canceled: 0 }
            var counters = {}
            Object.keys(seen).forEach(function(name) {
                if (name === "pressAndHold" && !data.handler)
                    return
                counters[name] = function() { ++seen[name] }
                plain[name].connect(counters[name])
            })
            plain.checkable = !!data.checkable
            plain.checked = false
            plain.autoRepeat = !!data.repeat
            mousePress(plain)
            verify(plain.pressed && plain.down)
            if (data.leave)
                mouseMove(plain, plain.width * 3, plain.height / 2)
            if (data.hold)
                wait(data.hold)
            mouseRelease(plain, data.leave ? plain.width * 3 : plain.width / 2, plain.height / 2)
            Object.keys(counters).forEach(function(name) { plain[name].disconnect(counters[name]) })
            verify(!plain.pressed && !plain.down)
            if (data.atLeast)
                verify(seen.clicked >= data.atLeast, seen.clicked + " clicks")
            else
                compare(seen.clicked, data.clicked)
            compare(seen.pressAndHold, data.held || 0)
            compare(seen.toggled, data.toggled || 0)
            compare(plain.checked, !!data.toggled)
            compare(seen.canceled, data.canceled || 0)
        }

        // A tap sets the slider where it lands (also after an earlier press elsewhere); a
        // sideways drag moves it and is released, one up or down scrolls the page instead.
        function test_sliderPointer_data() {
            var rows = []
            ;["mouse", "touch"].forEach(function(input) {
                rows.push({ tag: input + ": taps", input: input, taps: [0.2, 0.8], value: 75, released: 2 },
                          { tag: input + ": drag sideways", input: input, from: 0.5, to: 0.9, value: 100, released: 1 },
                          { tag: input + ": drag down scrolls", input: input, from: 0.5, down: 200, value: 50, released: 0, scrolls: true })
            })
            return rows
        }

        function test_sliderPointer(data) {
            flick.contentY = 0
            flickSlider.value = 50
            var track = flickSlider.width - flickSlider.leftPadding - flickSlider.rightPadding
            var at = function(p) { return flickSlider.leftPadding + track * p }
            var y = flickSlider.height / 2
            var released = 0
            var count = function() { ++released }
            flickSlider.released.connect(count)
            if (data.taps)
                data.taps.forEach(function(p) { swipe(flickSlider, data.input, at(p), y, at(p), y, { steps: 1 }) })
            else
                swipe(flickSlider, data.input, at(data.from), y, at(data.to !== undefined ? data.to : data.from), y + (data.down || 0))
            flickSlider.released.disconnect(count)
            compare(flickSlider.value, data.value)
            compare(released, data.released)
            if (data.scrolls)
                verify(flick.contentY < 0 || flick.dragging || flick.moving, "the page scrolled")
            else
                compare(flick.contentY, 0)
        }

        // A colour set on the page reaches each control on it, and a reset goes back to the theme.
        function test_palette_data() {
            return ["button", "iconButton", "toggle", "slider", "combo", "busy", "header", "picker"].map(function(name) {
                return { tag: name, control: name }
            })
        }

        function test_palette(data) {
            var control = { button: button, iconButton: iconButton, toggle: toggle, slider: slider, combo: combo,
                            busy: busy, header: header, picker: picker }[data.control]
            page.palette.highlightColor = "#123456"
            compare(String(control.palette.highlightColor), "#123456")
            if (data.control === "button")
                compare(String(button.highlightColor), "#123456")
            page.palette.highlightColor = undefined
            compare(String(control.palette.highlightColor), String(Theme.highlightColor))
        }

        // A tap opens the menu under the row; a tap on its second entry picks it.
        function test_comboBox() {
            var activated = []
            combo.activated.connect(function(i) { activated.push(i) })
            compare(combo.value, "Red")
            mouseClick(combo, combo.width / 2, Theme.itemSizeSmall / 2)
            verify(combo.menuOpen)
            waitForRendering(combo) // the menu's column laid out
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
            wheel.forceLayout()
            // The wheel turns to the current entry first (a tap while it turns only stops it).
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
    }
}
