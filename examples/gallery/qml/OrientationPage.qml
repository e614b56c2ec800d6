import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The application window's orientation choice: tick the orientations the application
// allows and turn the device (or set the device orientation below) to see which one wins.
Flickable {
    id: page

    property QtObject applicationWindow

    readonly property var names: ({ 0: "None", 1: "Portrait", 2: "Landscape", 4: "Portrait inverted", 8: "Landscape inverted" })
    readonly property var angles: ({ 1: 0, 2: 90, 4: 180, 8: 270 })

    contentHeight: column.height + Theme.paddingLarge

    Column {
        id: column
        x: Theme.horizontalPageMargin
        width: parent.width - 2 * Theme.horizontalPageMargin
        spacing: Theme.paddingSmall

        SectionHeader { text: "Chosen orientation" }

        Item {
            width: parent.width
            height: Theme.itemSizeExtraLarge * 1.5

            Rectangle {
                id: preview
                anchors.centerIn: parent
                width: Theme.itemSizeExtraLarge * 0.7
                height: Theme.itemSizeExtraLarge * 1.2
                radius: Theme.paddingMedium
                color: "transparent"
                border.color: Theme.secondaryColor
                border.width: 2
                rotation: applicationWindow ? page.angles[applicationWindow.orientation] || 0 : 0

                Text {
                    anchors.centerIn: parent
                    text: "Aa"
                    color: Theme.highlightColor
                    font.pixelSize: Theme.fontSizeLarge
                }
            }
        }

        Text {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            color: Theme.primaryColor
            font.pixelSize: Theme.fontSizeMedium
            text: applicationWindow ? page.names[applicationWindow.orientation] : ""
        }

        SectionHeader { text: "Allowed orientations" }

        Repeater {
            model: [1, 2, 4, 8]
            TextSwitch {
                width: column.width
                automaticCheck: false
                text: page.names[modelData]
                checked: applicationWindow && (applicationWindow.allowedOrientations & modelData)
                onClicked: {
                    var allowed = applicationWindow.allowedOrientations ^ modelData
                    // The window refuses an empty set; keep the last one ticked.
                    if (allowed !== 0)
                        applicationWindow.allowedOrientations = allowed
                }
            }
        }

        TextSwitch {
            width: column.width
            automaticCheck: false
            text: "Lock the current orientation"
            checked: applicationWindow && applicationWindow._orientationLocked
            onClicked: applicationWindow._orientationLocked = !applicationWindow._orientationLocked
        }

        SectionHeader { text: "Device orientation" }

        Flow {
            width: parent.width
            spacing: Theme.paddingMedium
            Repeater {
                model: [1, 2, 4, 8]
                Rectangle {
                    width: (column.width - Theme.paddingMedium) / 2
                    height: Theme.itemSizeSmall
                    radius: Theme.paddingSmall
                    color: applicationWindow && applicationWindow.deviceOrientation === modelData
                           ? Theme.rgba(Theme.highlightBackgroundColor, 0.4) : "transparent"
                    border.color: Theme.secondaryColor
                    Text {
                        anchors.centerIn: parent
                        text: page.names[modelData]
                        color: Theme.primaryColor
                        font.pixelSize: Theme.fontSizeSmall
                    }
                    MouseArea {
                        anchors.fill: parent
                        onClicked: applicationWindow.deviceOrientation = modelData
                    }
                }
            }
        }

        Text {
            width: parent.width
            topPadding: Theme.paddingLarge
            wrapMode: Text.Wrap
            color: Theme.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            text: applicationWindow
                  ? "Device default: " + applicationWindow.defaultAllowedOrientations
                    + ", configured rotation: " + applicationWindow.screenRotation + "°"
                  : ""
        }
    }
}
