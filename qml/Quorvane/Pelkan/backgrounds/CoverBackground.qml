import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// The background of an application's cover: glass in the theme's highlight colour with
// the theme's pattern, filling the cover. Put it first in the cover, under its content.
Private.GlassBackgroundBase {
    anchors.fill: parent
    color: Theme.rgba(Theme.highlightBackgroundColor, 0.25)
    patternOpacity: 0.3
    radius: Theme.paddingLarge
}
