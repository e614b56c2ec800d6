import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A field for searching: a search icon before the text, a clear button after it while
// there is text, no underline label, and what was searched for remembered under
// `autoFillKey` (by default one key per application page kind: set your own) and offered
// back while typing.
TextField {
    id: field

    placeholderText: qsTrId("quorvanepelkan-ph-search")
    inputMethodHints: Qt.ImhNoAutoUppercase
    leftPadding: Theme.horizontalPageMargin + Theme.iconSizeMedium + Theme.paddingSmall
    rightPadding: Theme.horizontalPageMargin + Theme.iconSizeMedium + Theme.paddingSmall

    Image {
        x: field.leftPadding - width - Theme.paddingSmall
        y: field.topPadding + (field._editor.height - height) / 2
        width: Theme.iconSizeMedium
        height: Theme.iconSizeMedium
        sourceSize: Qt.size(width, height)
        source: "image://theme/icon-m-search?" + (field.focused ? Theme.highlightColor : Theme.primaryColor)
    }

    IconButton {
        visible: field.text !== ""
        x: field.width - field.rightPadding + Theme.paddingSmall
        y: field.topPadding + (field._editor.height - height) / 2
        width: Theme.iconSizeMedium
        height: Theme.iconSizeMedium
        iconSource: "image://theme/icon-m-close"
        onClicked: {
            field.text = ""
            field.forceEditorFocus()
        }
    }
}
