import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A long form: the focused field stays above the keyboard as the page scrolls; a password,
// a search with remembered suggestions, a multi-line note, switches, a slider, a choice, a
// time, and the buttons that act on it all, laid out as many to a row as fit.
Page {
    id: page

    property string summary: "Nothing sent yet"

    Flickable {
        anchors.fill: parent
        contentHeight: form.height + Theme.paddingLarge

        ScrollDecorator {}

        Column {
            id: form
            width: parent.width

            PageHeader { title: "Form"; description: page.summary }

            SectionHeader { text: "Account" }
            TextField {
                id: name
                label: "Name"
                placeholderText: "Your name"
                EnterKey.iconSource: "image://theme/icon-m-forward"
                EnterKey.onClicked: email.forceEditorFocus()
            }
            TextField {
                id: email
                label: errorHighlight ? "Not an e-mail address" : "E-mail"
                placeholderText: "name@example.org"
                inputMethodHints: Qt.ImhEmailCharactersOnly
                validator: RegExpValidator { regExp: /^$|^[^@\s]+@[^@\s]+\.[^@\s]+$/ }
                EnterKey.onClicked: password.forceEditorFocus()
            }
            PasswordField {
                id: password
                EnterKey.iconSource: "image://theme/icon-m-forward"
                EnterKey.onClicked: destination.forceEditorFocus()
            }

            SectionHeader { text: "Trip" }
            SearchField {
                id: destination
                placeholderText: "Where to?"
                autoFillKey: "gallery-destination"
                EnterKey.text: text.length > 0 ? "Go" : ""
                EnterKey.onClicked: page.summary = "Going to " + text
                Component.onCompleted: {
                    if (suggestions.length === 0) {
                        remember("Helsinki harbour")
                        remember("Hamburg")
                        remember("Harwich")
                    }
                }
            }
            ComboBox {
                id: travelClass
                label: "Class"
                model: ["Economy", "Business", "Deck"]
            }
            TimePicker {
                id: departure
                anchors.horizontalCenter: parent.horizontalCenter
                hour: 9
                minute: 30
            }
            Label {
                x: Theme.horizontalPageMargin
                width: parent.width - 2 * Theme.horizontalPageMargin
                color: Theme.secondaryHighlightColor
                text: "Departure " + departure.timeText + ", " + travelClass.value
            }

            SectionHeader { text: "Preferences" }
            TextSwitch { id: window; text: "Window seat"; checked: true }
            TextSwitch { text: "Vegetarian meal"; description: "Served first" }
            Slider {
                id: luggage
                label: "Luggage"
                minimumValue: 0
                maximumValue: 40
                stepSize: 5
                value: 20
                valueText: value + " kg"
            }
            TextArea {
                label: "Notes"
                placeholderText: "Anything we should know"
            }
            Label {
                x: Theme.horizontalPageMargin
                width: parent.width - 2 * Theme.horizontalPageMargin
                truncationMode: TruncationMode.Fade
                maximumLineCount: 2
                wrapMode: Text.Wrap
                color: Theme.secondaryColor
                font.pixelSize: Theme.fontSizeSmall
                text: "Fares are per person and include one piece of hand luggage. Changes after departure are "
                      + "not possible; a cancelled booking is refunded in full up to one day before the trip."
            }

            ButtonLayout {
                width: parent.width
                rowSpacing: Theme.paddingMedium
                columnSpacing: Theme.paddingMedium
                preferredWidth: Theme.itemSizeExtraLarge * 1.5
                Button {
                    id: send
                    text: "Send"
                    enabled: name.text !== "" && !email.errorHighlight
                    onClicked: {
                        destination.remember()
                        page.summary = "Sent for " + name.text + " at " + departure.timeText
                    }
                }
                Button { text: "Clear"; onClicked: { name.text = ""; email.text = ""; password.text = "" } }
                Button { text: "Help"; ButtonLayout.newLine: true; onClicked: coach.visible = true }
            }
        }
    }

    // Help points at the Send button: everything else dims until a tap.
    DimmedRegion {
        id: coach
        anchors.fill: parent
        z: 100
        visible: false
        holes: [send]
        radius: send.height / 2

        // Above the button, wherever the form has scrolled to.
        onVisibleChanged: {
            if (visible)
                coachText.y = Math.max(Theme.paddingLarge, send.mapToItem(coach, 0, 0).y - coachText.height - Theme.paddingLarge)
        }

        Label {
            id: coachText
            x: Theme.horizontalPageMargin
            width: parent.width - 2 * Theme.horizontalPageMargin
            wrapMode: Text.Wrap
            horizontalAlignment: Text.AlignHCenter
            text: "Fill in your name and a valid e-mail address, then send"
        }
        MouseArea {
            anchors.fill: parent
            onClicked: coach.visible = false
        }
    }
}
