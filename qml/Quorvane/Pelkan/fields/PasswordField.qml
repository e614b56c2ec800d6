import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A text field for secrets: the text shows as dots, nothing typed goes to the keyboard's
// prediction or is remembered, and a button beside it shows the text until tapped again.
TextField {
    id: field

    property bool showEchoModeToggle: true
    property bool passwordVisible: false

    label: qsTrId("quorvanepelkan-la-password")
    echoMode: passwordVisible ? TextInput.Normal : TextInput.Password
    inputMethodHints: Qt.ImhNoPredictiveText | Qt.ImhSensitiveData | Qt.ImhNoAutoUppercase
    rightPadding: Theme.horizontalPageMargin + (showEchoModeToggle ? Theme.iconSizeMedium + Theme.paddingSmall : 0)

    IconButton {
        visible: field.showEchoModeToggle
        x: field.width - field.rightPadding + Theme.paddingSmall
        y: field.topPadding + (field._editor.height - height) / 2
        width: Theme.iconSizeMedium
        height: Theme.iconSizeMedium
        iconSource: "image://theme/icon-m-visible"
        down: field.passwordVisible
        onClicked: field.passwordVisible = !field.passwordVisible
    }
}
