import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Fades content into a colour along an OpacityRamp `direction`: laid over the edge of a
// view in the view's background colour, the content seems to fade out there. The opacity
// is clamp(slope * (t - offset), 0, 1) with t running 0 to 1 along the direction; the
// colour is the theme's overlay colour until set. Drawn from vertex colours, no texture.
//     OverlayGradient { anchors { right: parent.right; top: parent.top; bottom: parent.bottom }
//                       width: Theme.paddingLarge * 2; color: window.color }
Private.OverlayGradientBase {
}
