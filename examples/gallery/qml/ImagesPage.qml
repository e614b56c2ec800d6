import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Theme images through the "theme" image provider, tinted by the colour in their name.
// The pattern tile is marked Grayscale: it follows the theme's primary colour on the GPU
// side, without being reloaded. Try
//   dconf write /desktop/quorvane/pelkan/theme/primary_color "'#ffb000'"
Flickable {
    id: page
    contentHeight: column.height + Theme.paddingLarge
    readonly property var icons: ["icon-m-back", "icon-m-forward", "icon-m-add", "icon-m-close",
                                  "icon-m-search", "icon-m-menu", "icon-m-home", "icon-m-favorite"]

    Column {
        id: column
        x: Theme.horizontalPageMargin
        width: parent.width - 2 * Theme.horizontalPageMargin
        spacing: Theme.paddingMedium

        Repeater {
            model: [{ title: "Highlight colour", suffix: "?" + Theme.highlightColor },
                    { title: "Named tint", suffix: "?#ff6f61" },
                    { title: "As drawn", suffix: "" }]
            Column {
                id: row
                property string suffix: modelData.suffix
                width: column.width
                spacing: Theme.paddingSmall
                SectionHeader { text: modelData.title }
                Flow {
                    width: parent.width
                    spacing: Theme.paddingLarge
                    Repeater {
                        model: page.icons
                        Image {
                            width: Theme.iconSizeMedium
                            height: width
                            sourceSize: Qt.size(width, height)
                            source: "image://theme/" + modelData + row.suffix
                        }
                    }
                }
            }
        }

        SectionHeader { text: "Glass" }

        Row {
            spacing: Theme.paddingLarge
            GlassItem { width: Theme.itemSizeMedium; height: width; color: Theme.highlightColor }
            GlassItem { width: Theme.itemSizeMedium; height: width; color: Theme.highlightColor; dimmed: true }
            GlassItem { width: Theme.itemSizeMedium; height: width; color: "#ff6f61"; falloffRadius: 0.25 }
        }
        GlassItem {
            width: column.width
            height: Theme.itemSizeSmall / 2
            color: Theme.highlightColor
            ratio: 0
        }
        GlassItem {
            width: column.width
            height: Theme.itemSizeSmall / 2
            color: Theme.highlightColor
            ratio: 0
            dashed: true
        }

        SectionHeader { text: "Blur, plain and tinted" }

        Flow {
            width: column.width
            spacing: Theme.paddingLarge
            Grid {
                id: blurSource
                columns: 4
                Repeater {
                    model: page.icons
                    Image {
                        width: Theme.iconSizeMedium
                        height: width
                        source: "image://theme/" + modelData + "?#ff6f61"
                    }
                }
            }
            Private.BlurEffect {
                width: blurSource.width
                height: blurSource.height
                sourceItem: blurSource
                kernel: Private.BlurEffect.Gaussian13
                levels: 2
            }
            Private.BlurEffect {
                width: blurSource.width
                height: blurSource.height
                sourceItem: blurSource
                levels: 2
                overlayColor: Theme.rgba(Theme.highlightBackgroundColor, 0.3)
            }
        }

        SectionHeader { text: "Follows the primary colour" }

        Row {
            spacing: Theme.paddingLarge
            Repeater {
                model: 4
                Image {
                    width: Theme.iconSizeLarge
                    height: width
                    source: "image://theme/graphic-shader-texture"
                }
            }
        }
    }
}
