import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A field for searching: a search icon before the text, a clear button after it while
// there is text (mirrored right to left), no underline label, and what was searched for remembered (on Enter) and
// offered back while typing.
//
// Searches are remembered by default, one list per application and kind of page: the
// `autoFillKey` is "<application name>.<page type>.search" (the page type being the name
// of the page's QML type, such as NotesPage), so the search fields of every NotesPage share
// their searches and those of other pages do not see them. Set `autoFillKey` to a key of
// your own to share a list differently, or to "" to remember nothing.
//
// Put it in a ListView's header to search over the list: it keeps its focus while the list
// refills as the user types.
TextField {
    id: field

    placeholderText: qsTrId("quorvanepelkan-ph-search")
    inputMethodHints: Qt.ImhNoAutoUppercase
    leftPadding: Theme.horizontalPageMargin + Theme.iconSizeMedium + Theme.paddingSmall
    rightPadding: Theme.horizontalPageMargin + Theme.iconSizeMedium + Theme.paddingSmall
    autoFillKey: defaults.key

    Component.onCompleted: defaults.key = defaults.pageKindKey()

    QtObject {
        id: defaults

        property string key
        // Right to left the search icon sits at the right and the clear button at the left.
        readonly property bool mirrored: field.LayoutMirroring.enabled

        function pageKindKey() {
            var kind = ""
            for (var item = field.parent; item; item = item.parent) {
                // A page: what a page stack places (its status, orientations and stack).
                if (item.status !== undefined && item.allowedOrientations !== undefined
                        && item.pageStack !== undefined) {
                    kind = String(item).replace(/\(.*$/, "").replace(/_QML(TYPE)?_\d+$/, "")
                    break
                }
            }
            var application = Qt.application.name !== "" ? Qt.application.name : "application"
            return application + "." + (kind !== "" ? kind + "." : "") + "search"
        }
    }

    Image {
        x: defaults.mirrored ? field.width - field.rightPadding + Theme.paddingSmall
                             : field.leftPadding - width - Theme.paddingSmall
        y: field.topPadding + (field.editor.height - height) / 2
        width: Theme.iconSizeMedium
        height: Theme.iconSizeMedium
        sourceSize: Qt.size(width, height)
        source: "image://theme/icon-m-search?" + (field.focused ? Theme.highlightColor : Theme.primaryColor)
    }

    IconButton {
        visible: field.text !== ""
        x: defaults.mirrored ? field.leftPadding - width - Theme.paddingSmall
                             : field.width - field.rightPadding + Theme.paddingSmall
        y: field.topPadding + (field.editor.height - height) / 2
        width: Theme.iconSizeMedium
        height: Theme.iconSizeMedium
        iconSource: "image://theme/icon-m-close"
        Accessible.role: Accessible.Button
        Accessible.name: qsTrId("quorvanepelkan-la-clear-search")
        onClicked: {
            field.text = ""
            field.forceEditorFocus()
        }
    }
}
