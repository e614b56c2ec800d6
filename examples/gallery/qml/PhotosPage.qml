import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Photos one at a time, full screen, slid sideways; each picture lags a little behind its
// frame as it slides (from Slide.offset), and a caption says where in the set it is. Large
// pictures come through the transient image provider, which frees their pixels once they
// are on the GPU.
Page {
    id: page

    property var photos: []

    Rectangle {
        anchors.fill: parent
        color: "black"
    }

    SlideshowView {
        id: slideshow
        anchors.fill: parent
        model: page.photos
        interval: 0

        delegate: Item {
            id: frame
            clip: true
            readonly property real offset: Private.Slide.offset

            Image {
                width: frame.width
                height: frame.height
                x: -frame.offset * frame.width * 0.3 // a parallax against the slide
                fillMode: Image.PreserveAspectCrop
                asynchronous: true
                sourceSize.height: frame.height
                source: "image://transientimage/" + modelData
            }
        }
    }

    Label {
        anchors { bottom: parent.bottom; bottomMargin: Theme.paddingLarge; horizontalCenter: parent.horizontalCenter }
        text: page.photos.length === 0 ? "No photos" : (slideshow.currentIndex + 1) + " / " + slideshow.count
        font.pixelSize: Theme.fontSizeSmall
    }

    TextSwitch {
        anchors.top: parent.top
        text: "Play"
        checked: slideshow.interval > 0
        onClicked: slideshow.interval = checked ? 3000 : 0
    }
}
