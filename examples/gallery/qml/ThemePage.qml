import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private
import Quorvane.Pelkan.theme 1.0 as ThemeModule

// The theme as an application sees it: metrics, colours, icons and palettes. Every value
// follows the device configuration live; try
//   dconf write /desktop/quorvane/pelkan/theme/highlight_color "'#ff8800'"
Flickable {
    contentHeight: column.height + Theme.paddingLarge

    Column {
        id: column
        x: Theme.horizontalPageMargin
        width: parent.width - 2 * Theme.horizontalPageMargin

        Text {
            width: parent.width
            topPadding: Theme.paddingLarge
            horizontalAlignment: Text.AlignRight
            text: "Theme"
            color: Theme.highlightColor
            font.pixelSize: Theme.fontSizeLarge
        }

        SectionHeader { text: "Metrics (pixel ratio " + Theme.pixelRatio + ")" }

        Repeater {
            model: ["itemSizeSmall", "itemSizeMedium", "itemSizeLarge", "itemSizeExtraLarge",
                    "paddingSmall", "paddingMedium", "paddingLarge", "horizontalPageMargin",
                    "iconSizeSmall", "iconSizeMedium", "iconSizeLarge",
                    "fontSizeSmall", "fontSizeMedium", "fontSizeLarge"]

            Item {
                width: column.width
                height: Theme.fontSizeMedium * 1.4

                Rectangle {
                    anchors.verticalCenter: parent.verticalCenter
                    width: Math.min(Theme[modelData], parent.width / 2)
                    height: Theme.paddingSmall
                    radius: height / 2
                    color: Theme.secondaryHighlightColor
                }
                Text {
                    anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                    text: modelData + "  " + Theme[modelData]
                    color: Theme.primaryColor
                    font.pixelSize: Theme.fontSizeSmall
                }
            }
        }

        SectionHeader { text: "Colours (" + (Theme.colorScheme === Theme.LightOnDark ? "light on dark" : "dark on light") + ")" }

        Grid {
            columns: 2
            spacing: Theme.paddingMedium
            Repeater {
                model: ["primaryColor", "secondaryColor", "highlightColor", "secondaryHighlightColor",
                        "highlightBackgroundColor", "overlayBackgroundColor"]
                Row {
                    spacing: Theme.paddingSmall
                    width: (column.width - Theme.paddingMedium) / 2
                    Rectangle {
                        width: Theme.iconSizeSmall
                        height: width
                        radius: Theme.paddingSmall
                        color: Theme[modelData]
                        border.color: Theme.secondaryColor
                    }
                    Text {
                        anchors.verticalCenter: parent.verticalCenter
                        width: parent.width - Theme.iconSizeSmall - Theme.paddingSmall
                        elide: Text.ElideRight
                        text: modelData.replace("Color", "")
                        color: Theme.primaryColor
                        font.pixelSize: Theme.fontSizeSmall * 0.8
                    }
                }
            }
        }

        SectionHeader { text: "Icons" }

        Flow {
            width: parent.width
            spacing: Theme.paddingLarge
            Repeater {
                model: ["icon-m-back", "icon-m-forward", "icon-m-add", "icon-m-close",
                        "icon-m-search", "icon-m-menu", "icon-m-home", "icon-m-favorite"]
                Image {
                    width: Theme.iconSizeMedium
                    height: width
                    sourceSize: Qt.size(width, height)
                    source: "file://" + Theme.themeDirectory + "/icons/" + modelData + ".svg"
                }
            }
        }

        SectionHeader { text: "Palettes" }

        Private.ControlBase {
            id: card
            width: parent.width
            height: Theme.itemSizeLarge
            palette.highlightColor: "#ff8a3d"

            Rectangle {
                anchors.fill: parent
                radius: Theme.paddingMedium
                color: Theme.rgba(card.palette.highlightBackgroundColor, 0.25)
            }
            Private.ControlBase {
                id: inner
                anchors.centerIn: parent
                width: label.width
                height: label.height
                Text {
                    id: label
                    text: "This control inherits its page's highlight colour"
                    color: inner.palette.highlightColor
                    font.pixelSize: Theme.fontSizeSmall
                }
            }
        }

        SectionHeader { text: "Screen and modules" }

        Text {
            width: parent.width
            wrapMode: Text.Wrap
            color: Theme.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            text: "Screen " + Screen.width + " × " + Screen.height + ", size category " + Screen.sizeCategory
                  + "\nOrientation.All = " + Orientation.All + ", PortraitMask = " + Orientation.PortraitMask
                  + "\nTheme module primary colour " + ThemeModule.Theme.primaryColor
        }
    }
}
