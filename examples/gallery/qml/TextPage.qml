import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A text field as the keyboard sees it: what its Enter key shows, the text including what
// is still being composed, and the suggestions it remembers.
Column {
    id: page
    spacing: Theme.paddingMedium
    topPadding: Theme.paddingLarge

    property string sent
    // Read back through these: in script, `EnterKey` names QtQuick's attached type (the
    // first import), while bindings reach this toolkit's (the last import).
    readonly property string enterText: field.text.length > 0 ? "Send" : ""
    readonly property bool enterEnabled: field.text.length > 0

    Rectangle {
        x: Theme.horizontalPageMargin
        width: page.width - 2 * Theme.horizontalPageMargin
        height: Theme.itemSizeSmall
        radius: Theme.paddingSmall
        color: "transparent"
        border.color: field.activeFocus ? Theme.highlightColor : Theme.secondaryColor

        TextInput {
            id: field
            anchors { fill: parent; margins: Theme.paddingMedium }
            verticalAlignment: TextInput.AlignVCenter
            color: Theme.primaryColor
            font.pixelSize: Theme.fontSizeMedium
            focus: true

            EnterKey.text: page.enterText
            EnterKey.type: Qt.EnterKeySend
            EnterKey.iconSource: "image://theme/icon-m-forward"
            EnterKey.enabled: page.enterEnabled
            EnterKey.onClicked: {
                autoFill.insert(field.text)
                autoFill.save()
                page.sent = field.text
                field.text = ""
            }

            Private.PreeditText { id: preedit }
            Private.AutoFill {
                id: autoFill
                key: "gallery destination"
                maximumSuggestions: 4
                Component.onCompleted: {
                    if (suggestions.length === 0) {
                        insert("Helsinki harbour")
                        insert("Hamburg")
                        insert("Harwich")
                    }
                }
            }
        }
    }

    Text {
        x: Theme.horizontalPageMargin
        color: Theme.secondaryColor
        font.pixelSize: Theme.fontSizeSmall
        text: "Enter key: " + (page.enterText || "(default)") + (page.enterEnabled ? "" : ", disabled")
              + "\nWith composition: " + preedit.text
              + (page.sent ? "\nSent: " + page.sent : "")
    }

    Repeater {
        model: autoFill.suggestions
        Text {
            x: Theme.horizontalPageMargin
            height: Theme.itemSizeSmall * 0.8
            verticalAlignment: Text.AlignVCenter
            text: modelData
            color: Theme.highlightColor
            font.pixelSize: Theme.fontSizeMedium
            MouseArea {
                anchors.fill: parent
                onClicked: field.text = modelData
            }
        }
    }
}
