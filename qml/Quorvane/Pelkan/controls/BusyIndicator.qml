import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype BusyIndicator
    \inqmlmodule Quorvane.Pelkan
    \brief A spinning ring of dots while something is under way.

    It turns only while running and visible, so a hidden indicator costs no frames. Give it a
    `text` to tell a screen reader what is under way.
*/
Private.ControlBase {
    id: indicator

    /*! Whether it shows and turns. */
    property bool running
    /*! BusyIndicatorSize.ExtraSmall, Small, Medium (default) or Large. */
    property int size: BusyIndicatorSize.Medium
    /*! The colour of the dots; the palette's highlight colour until set. */
    property color color: palette.highlightColor

    accessibleRole: Accessible.Indicator
    implicitWidth: size === BusyIndicatorSize.ExtraSmall ? Theme.iconSizeSmall * 0.75
                 : size === BusyIndicatorSize.Small ? Theme.iconSizeSmall
                 : size === BusyIndicatorSize.Large ? Theme.iconSizeLarge
                 : Theme.iconSizeMedium
    implicitHeight: implicitWidth
    width: implicitWidth
    height: implicitHeight
    opacity: running ? 1 : 0
    Behavior on opacity { OpacityAnimator { duration: 200 } }

    Item {
        id: ring
        anchors.fill: parent

        Repeater {
            model: 8
            Rectangle {
                readonly property real angle: index * Math.PI / 4
                width: ring.width / 6
                height: width
                radius: width / 2
                color: indicator.color
                opacity: 0.2 + 0.8 * index / 7
                x: ring.width / 2 + (ring.width / 2 - width / 2) * Math.cos(angle) - width / 2
                y: ring.height / 2 + (ring.height / 2 - width / 2) * Math.sin(angle) - height / 2
            }
        }

        RotationAnimator on rotation {
            from: 0
            to: 360
            duration: 1000
            loops: Animation.Infinite
            running: indicator.running && indicator.visible && indicator.opacity > 0
        }
    }
}
