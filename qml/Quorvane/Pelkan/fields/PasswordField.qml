import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A text field for secrets: the text shows as dots, nothing typed goes to the keyboard's
// prediction or is remembered, and a button beside it shows the text until tapped again.
TextField {
    id: field

    /*! Whether the button that shows the text is there. */
    property bool showEchoModeToggle: true
    /*! Whether the text shows as it is instead of as dots. */
    property bool passwordVisible: false

    label: qsTrId("quorvanepelkan-la-password")
    echoMode: passwordVisible ? TextInput.Normal : TextInput.Password
    inputMethodHints: Qt.ImhNoPredictiveText | Qt.ImhSensitiveData | Qt.ImhNoAutoUppercase
    // The toggle sits after the text: at the right, at the left right to left.
    leftPadding: internal.mirrored ? internal.toggleSide : Theme.horizontalPageMargin
    rightPadding: internal.mirrored ? Theme.horizontalPageMargin : internal.toggleSide

    QtObject {
        id: internal
        readonly property bool mirrored: field.LayoutMirroring.enabled
        readonly property real toggleSide: Theme.horizontalPageMargin
                                           + (field.showEchoModeToggle ? Theme.iconSizeMedium + Theme.paddingSmall : 0)
    }

    IconButton {
        visible: field.showEchoModeToggle
        x: internal.mirrored ? field.leftPadding - width - Theme.paddingSmall : field.width - field.rightPadding + Theme.paddingSmall
        y: field.topPadding + (field.editor.height - height) / 2
        width: Theme.iconSizeMedium
        height: Theme.iconSizeMedium
        iconSource: "image://theme/icon-m-visible"
        down: field.passwordVisible
        Accessible.role: Accessible.CheckBox
        Accessible.checkable: true
        Accessible.checked: field.passwordVisible
        Accessible.name: qsTrId("quorvanepelkan-la-show-password")
        onClicked: field.passwordVisible = !field.passwordVisible
    }
}
