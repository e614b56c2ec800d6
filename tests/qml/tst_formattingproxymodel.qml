import QtQuick 2.6
import QtTest 1.2
import Quorvane.Pelkan 1.0

// A FormattingProxyModel in a view passes the source's roles through next to the formatted
// ones, also over a ListModel that names its roles only once its first row arrives.
Item {
    id: root
    width: 400
    height: 400

    ListModel { id: files }
    FormattingProxyModel {
        id: proxy
        formats: [{ role: "sizeText", source: "size", operation: "formatFileSize" }]
    }
    ListView {
        id: view
        anchors.fill: parent
        delegate: Text {
            height: 40
            text: model.name + ": " + model.sizeText
        }
    }

    TestCase {
        name: "FormattingProxyModel"
        when: windowShown

        function fill() {
            files.append({ "name": "a.jpg", "size": 2048 })
            files.append({ "name": "b.txt", "size": 10 })
        }

        function test_sourceRoles_data() {
            return [
                { tag: "source empty when attached, filled later", fillFirst: false },
                { tag: "source filled when attached", fillFirst: true },
            ]
        }

        function test_sourceRoles(data) {
            view.model = null
            proxy.sourceModel = null
            files.clear()
            if (data.fillFirst)
                fill()
            proxy.sourceModel = files
            view.model = proxy
            if (!data.fillFirst)
                fill()
            tryCompare(view, "count", 2)
            view.forceLayout()
            compare(view.itemAtIndex(0).text, "a.jpg: " + Format.formatFileSize(2048, 1))
            compare(view.itemAtIndex(1).text, "b.txt: " + Format.formatFileSize(10, 1))
        }
    }
}
