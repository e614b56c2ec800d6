import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0

// Remorse on list items and over a page: the action runs once when the countdown ends,
// never after a cancel, also when the item's delegate was recycled meanwhile; removing
// one row takes only its own countdown along.
Item {
    id: root
    width: 400
    height: 600

    property var log: []
    // Made here, in a scope that outlives any delegate.
    function logLater(name) { return function() { root.log.push("ran " + name) } }

    ListModel { id: rows }

    ListView {
        id: view
        anchors.fill: parent
        model: rows
        cacheBuffer: 0
        delegate: ListItem {
            contentHeight: 100
            property string name: model.name
            function remove() {
                remorseAction("Deleting", root.logLater(model.name), 400)
            }
        }
    }

    RemorsePopup {
        id: popup
    }

    TestCase {
        name: "Remorse"
        when: windowShown

        function row(i) { return view.itemAtIndex(i) }

        function init() {
            root.log = []
            rows.clear()
            for (var i = 0; i < 100; ++i)
                rows.append({ "name": "row" + i })
            view.positionViewAtBeginning()
        }

        function test_list_data() {
            return [
                { tag: "runs once after the countdown", act: function(t) {}, log: ["ran row1"] },
                { tag: "cancelled by a tap", act: function(t) { t.mouseClick(row(1), 50, 50) }, log: [] },
                { tag: "its delegate recycled meanwhile", act: function(t) {
                    view.contentY = 5000
                    t.tryVerify(function() { return row(1) === null })
                    view.contentY = 0
                    t.tryVerify(function() { return row(1) !== null && row(1).remorseRunning })
                }, log: ["ran row1"] },
                { tag: "another row removed meanwhile", act: function(t) {
                    row(2).remove()
                    rows.remove(1)
                }, log: ["ran row2"] },
            ]
        }

        function test_list(data) {
            row(1).remove()
            verify(row(1).remorseRunning)
            data.act(this)
            wait(800)
            compare(root.log, data.log)
            compare(view.RemorseCache.count, 0)
            verify(!row(1).remorseRunning)
        }

        function test_popup_data() {
            return [
                { tag: "runs after the countdown", cancel: false, log: ["cleared"] },
                { tag: "cancelled by a tap", cancel: true, log: [] },
            ]
        }

        function test_popup(data) {
            popup.execute("Clearing", function() { root.log.push("cleared") }, 300)
            verify(popup.visible)
            if (data.cancel)
                mouseClick(popup, 20, 20)
            wait(600)
            compare(root.log, data.log)
            verify(!popup.visible)
        }
    }
}
