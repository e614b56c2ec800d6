import QtQuick 2.6
import Quorvane.Pelkan 1.0

// Attached to the right of the home page: reached with a swipe to the left.
Page {
    id: page

    Column {
        width: page.width
        spacing: Theme.paddingLarge

        PageHeader { title: "About"; description: "Quorvane Pelkan" }

        Text {
            x: Theme.horizontalPageMargin
            width: parent.width - 2 * Theme.horizontalPageMargin
            wrapMode: Text.Wrap
            color: Theme.secondaryColor
            font.pixelSize: Theme.fontSizeSmall
            text: "Every page here is a Page on the application's PageStack: swipe right, or press Back, to return."
        }

        BusyIndicator {
            anchors.horizontalCenter: parent.horizontalCenter
            size: BusyIndicatorSize.Large
            running: page.status === PageStatus.Active
        }
    }
}
