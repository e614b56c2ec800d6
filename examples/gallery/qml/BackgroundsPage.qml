import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The drawn backgrounds: glass over a frosted view of what lies behind it (drag it), chat
// bubbles, edges of a strip fading into the page, and the frame-rate overlay. The colour
// buttons write the theme's highlight colours to the device configuration, and everything
// here follows at once, as it would for a change made in the settings.
Page {
    id: page

    readonly property color pageColor: applicationWindow ? applicationWindow._backgroundColor : "black"
    readonly property string themeKeys: "/desktop/quorvane/pelkan/theme/"

    function setHighlight(color) {
        if (color) {
            Private.Config.setValue(themeKeys + "highlight_color", color)
            Private.Config.setValue(themeKeys + "highlight_background_color", color)
        } else {
            Private.Config.unset(themeKeys + "highlight_color")
            Private.Config.unset(themeKeys + "highlight_background_color")
        }
    }

    Flickable {
        anchors.fill: parent
        contentHeight: column.height + Theme.paddingLarge

        ScrollDecorator {}

        Column {
            id: column
            width: page.width

            PageHeader { title: "Backgrounds" }

            SectionHeader { text: "Glass over a frosted backdrop" }

            Item {
                width: page.width
                height: Theme.itemSizeExtraLarge * 2

                // What lies behind: stripes in the theme's colours, one of them moving.
                Item {
                    id: scenery
                    anchors.fill: parent
                    Repeater {
                        model: 8
                        Rectangle {
                            x: index * scenery.width / 8
                            width: scenery.width / 16
                            height: scenery.height
                            color: index % 2 ? Theme.highlightColor : Theme.primaryColor
                        }
                    }
                    Rectangle {
                        width: Theme.itemSizeMedium
                        height: width
                        radius: width / 2
                        y: (scenery.height - height) / 2
                        color: Theme.highlightBackgroundColor
                        SequentialAnimation on x {
                            running: page.status === PageStatus.Active
                            loops: Animation.Infinite
                            NumberAnimation { from: 0; to: scenery.width - Theme.itemSizeMedium; duration: 3000 }
                            NumberAnimation { to: 0; duration: 3000 }
                        }
                    }
                }

                Private.OverlayBackgroundSource { id: frost; sourceItem: scenery }

                GlassBackground {
                    id: pane
                    x: (parent.width - width) / 2
                    y: Theme.paddingLarge
                    width: parent.width * 0.6
                    height: parent.height - 2 * Theme.paddingLarge
                    backdrop: frost
                    borderWidth: Math.max(1, Math.round(Theme.pixelRatio))
                    Label {
                        anchors.centerIn: parent
                        text: "Drag me"
                    }
                    MouseArea {
                        anchors.fill: parent
                        drag.target: pane
                        drag.axis: Drag.XAxis
                        drag.minimumX: 0
                        drag.maximumX: page.width - pane.width
                    }
                }
            }

            SectionHeader { text: "Chat bubbles" }

            Repeater {
                model: [
                    { mine: false, text: "Are we still on for tonight?" },
                    { mine: true, text: "Yes! Seven at the usual place." },
                    { mine: false, text: "Great, I will book a table by the window." },
                    { mine: true, text: "See you!" },
                ]
                Item {
                    width: page.width
                    height: bubble.height + Theme.paddingSmall
                    BubbleBackground {
                        id: bubble
                        x: modelData.mine ? page.width - width - Theme.horizontalPageMargin : Theme.horizontalPageMargin
                        width: Math.min(message.implicitWidth, page.width * 0.7) + 2 * Theme.paddingMedium
                        height: message.height + 2 * Theme.paddingSmall + tailSize
                        color: modelData.mine ? Theme.rgba(Theme.highlightBackgroundColor, 0.4)
                                              : Theme.rgba(Theme.primaryColor, 0.12)
                        tailOffset: modelData.mine ? -Theme.paddingLarge : Theme.paddingLarge
                        tailDirection: modelData.mine ? 30 : -30
                        Label {
                            id: message
                            x: Theme.paddingMedium
                            y: Theme.paddingSmall
                            width: Math.min(implicitWidth, page.width * 0.7)
                            wrapMode: Text.Wrap
                            text: modelData.text
                        }
                    }
                }
            }

            SectionHeader { text: "Faded edges" }

            Item {
                width: page.width
                height: Theme.itemSizeLarge

                ListView {
                    id: strip
                    anchors.fill: parent
                    orientation: ListView.Horizontal
                    spacing: Theme.paddingSmall
                    model: 30
                    delegate: Rectangle {
                        width: Theme.itemSizeLarge
                        height: strip.height
                        radius: Theme.paddingSmall
                        color: Theme.rgba(Theme.highlightBackgroundColor, 0.3)
                        Label { anchors.centerIn: parent; text: index + 1 }
                    }
                }
                OverlayGradient {
                    anchors { left: parent.left; top: parent.top; bottom: parent.bottom }
                    width: Theme.itemSizeMedium
                    color: page.pageColor
                    direction: OpacityRamp.RightToLeft
                }
                OverlayGradient {
                    anchors { right: parent.right; top: parent.top; bottom: parent.bottom }
                    width: Theme.itemSizeMedium
                    color: page.pageColor
                }
            }

            SectionHeader { text: "Theme colours, live" }

            ButtonLayout {
                width: page.width
                Button { text: "Orange"; onClicked: page.setHighlight("#ff8800") }
                Button { text: "Green"; onClicked: page.setHighlight("#33cc66") }
                Button { text: "Default"; onClicked: page.setHighlight("") }
            }

            TextSwitch {
                text: "Frame rate"
                description: "Frames per second and frame times over the window"
                checked: page.applicationWindow ? page.applicationWindow.showFrameRate : false
                onCheckedChanged: if (page.applicationWindow) page.applicationWindow.showFrameRate = checked
            }
        }
    }
}
