import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Items (photos, cards) one at a time, slid sideways by the finger; the ends join unless
// `loops` is off. With an `interval` (milliseconds) it also moves on by itself, pausing
// while a finger is on it. Each item can follow the slide through Slide.offset.
Private.SlideableBase {
    id: view

    /*! Milliseconds between moving on by itself; 0 (the default) never does. */
    property int interval: 0

    loops: true
    width: parent ? parent.width : 0
    height: parent ? parent.height : 0

    Timer {
        running: view.interval > 0 && view.visible && !view.dragging && view.count > 1
        interval: Math.max(1, view.interval)
        repeat: true
        onTriggered: view.next()
    }
}
