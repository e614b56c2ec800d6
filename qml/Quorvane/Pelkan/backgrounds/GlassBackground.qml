import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// A panel of glass under dialogs, menus and covers: the theme's overlay colour (0.6 opaque
// until `color` is set), brightened by the theme's glass pattern, rounded, optionally
// bordered, over an optional frosted `backdrop` (an OverlayBackgroundSource, or any item
// offering a texture, such as a BlurEffect). One draw call.
Private.GlassBackgroundBase {
    radius: Theme.paddingMedium
}
