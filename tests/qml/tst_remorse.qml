import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0

// Remorse on list rows (the popup over a page: tst_applicationwindow): a row's countdown follows the row through inserts,
// removes and moves, keeps its time, is cancelled by a tap on the row where it now is, runs
// its action once when it ends (also after its delegate was recycled), and ends with
// canceled() and a warning when its row leaves the model. The overlay hides the row under it.
Item {
    id: root
    width: 400; height: 600

    property var log: []
    // Made here, in a scope that outlives any delegate.
    function note(what) { return function() { root.log.push(what) } }
    function start(item, name, timeout) {
        var countdown = item.remorseAction("Deleting", note("ran " + name), timeout)
        countdown.canceled.connect(note("canceled " + name))
        return countdown
    }

    ListModel { id: rows }

    Row {
        anchors.fill: parent
        ListView {
            id: view
            width: parent.width / 2; height: parent.height; model: rows; cacheBuffer: 0
            delegate: ListItem {
                contentHeight: 100
                // Row content the overlay must hide: a different colour on every other row.
                Rectangle {
                    anchors.fill: parent
                    color: index % 2 ? Theme.highlightColor : Theme.primaryColor
                }
            }
        }
        ListView {
            id: numbers
            width: parent.width / 2; height: parent.height; model: 5
            delegate: ListItem { contentHeight: 100 }
        }
    }

    GestureTestCase {
        name: "Remorse"

        readonly property int timeout: 900

        property ListView list: view
        function row(i) { return list.itemAtIndex(i) }

        function init() {
            root.log = []
            rows.clear()
            for (var i = 0; i < 100; ++i)
                rows.append({ "name": "row" + i })
            view.positionViewAtBeginning()
            numbers.model = 5
        }

        function test_list_data() {
            return [
                { tag: "runs once after the countdown", at: 1, log: ["ran row1"] },
                { tag: "cancelled by a tap", at: 1, tap: true, log: ["canceled row1"] },
                { tag: "its delegate recycled meanwhile", act: function(t) {
                    view.contentY = 5000
                    t.tryVerify(function() { return row(1) === null })
                    view.contentY = 0
                    t.tryVerify(function() { return row(1) !== null })
                }, at: 1, log: ["ran row1"] },
                { tag: "a row inserted above, then a tap", act: function() { rows.insert(0, { "name": "new" }) },
                  at: 2, tap: true, log: ["canceled row1"] },
                { tag: "a row removed above", act: function() { rows.remove(0) }, at: 0, log: ["ran row1"] },
                { tag: "moved down", act: function() { rows.move(1, 4, 1) }, at: 4, log: ["ran row1"] },
                { tag: "moved down, then a tap", act: function() { rows.move(0, 3, 2) }, at: 4, tap: true, log: ["canceled row1"] },
                { tag: "its row removed", act: function() { rows.remove(1) }, left: 1, log: ["canceled row1"] },
                { tag: "the model cleared", act: function() { rows.clear() }, left: 1, log: ["canceled row1"] },
                // A model that says nothing of its rows: the countdown keeps its row, and ends
                // when the view is given another model.
                { tag: "a number model: runs", list: numbers, at: 1, log: ["ran row1"] },
                { tag: "a number model replaced", list: numbers, act: function() { numbers.model = 6 }, left: 1, log: ["canceled row1"] },
            ]
        }

        function test_list(data) {
            list = data.list || view
            var started = Date.now()
            var countdown = start(row(1), "row1", timeout)
            verify(row(1).remorseRunning)
            for (var i = 0; i < (data.left || 0); ++i)
                ignoreWarning(/RemorseCache: row 1 left the model during its countdown \("Deleting"\); its action does not run/)
            if (data.act)
                data.act(this)
            view.forceLayout() // the view moves its delegates on its next layout
            if (data.at !== undefined) {
                // The countdown is on its row, with the time it had.
                compare(countdown.row, data.at)
                tryVerify(function() { return row(data.at).remorseRunning })
                var shown = findItem(row(data.at), function(item) { return item instanceof RemorseItem })
                var left = timeout - (Date.now() - started)
                verify(Math.abs(countdown.remaining() - left) < 250, countdown.remaining() + " ms left, not " + left)
                tryCompare(shown, "secondsLeft", Math.ceil(countdown.remaining() / 1000))
                verify(shown.secondsLeft > 0)
                compare(shown.description, "Deleting in " + shown.secondsLeft + " s, tap to cancel")
                for (var r = 0; r < 5; ++r)
                    compare(row(r).remorseRunning, r === data.at, "row " + r)
                if (data.tap)
                    mouseClick(row(data.at), 50, 50)
            }
            wait(timeout + 200)
            compare(root.log, data.log)
            compare(list.RemorseCache.count, 0)
            for (var j = 0; j < 5; ++j)
                verify(!row(j) || !row(j).remorseRunning)
        }

        // Over any row the overlay looks the same: nothing of the row shows through.
        function test_overlayHidesTheRow() {
            list = view
            start(row(0), "row0", 60000)
            start(row(1), "row1", 60000)
            var images = [grabImage(row(0)), grabImage(row(1))]
            var width = row(0).width
            for (var x = width / 2; x < width; x += width / 8) {
                for (var y = 5; y < 100; y += 30)
                    compare(String(images[0].pixel(x, y)), String(images[1].pixel(x, y)), "at " + x + "," + y)
            }
            mouseClick(row(0), 50, 50)
            mouseClick(row(1), 50, 50)
            compare(root.log, ["canceled row0", "canceled row1"])
        }
    }
}
