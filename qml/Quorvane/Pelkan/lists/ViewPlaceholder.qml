import QtQuick 2.6
import Quorvane.Pelkan 1.0

// What an empty view shows instead of rows: a text and a hint, centred in what the view
// shows below its header. Declare it inside the Flickable, ListView or GridView and bind
// `enabled` to the view being empty; it places itself in the view's content, so that it
// moves with the content when the view is pulled.
Item {
    id: placeholder

    /*! The main text, in the highlight colour. */
    property string text
    /*! A line of advice below the text (what to do to fill the view); none when empty. */
    property string hintText
    /*! The view the placeholder is shown in: the one it is declared in, unless set. */
    property Flickable flickable: {
        var above = parent
        if (above instanceof Flickable)
            return above
        if (above && above.parent instanceof Flickable && above.parent.contentItem === above)
            return above.parent
        return null
    }

    enabled: false
    visible: enabled
    width: flickable ? flickable.width : 0
    height: flickable ? Math.max(0, flickable.height - internal.headerHeight) : 0
    // Below the header at the top of the content.
    y: flickable ? flickable.originY + internal.headerHeight : 0

    Accessible.role: Accessible.StaticText
    Accessible.name: hintText.length ? text + ". " + hintText : text

    QtObject {
        id: internal
        readonly property Item header: placeholder.flickable && placeholder.flickable.hasOwnProperty("headerItem")
                                       ? placeholder.flickable.headerItem : null
        readonly property real headerHeight: header ? header.height : 0

        function place() {
            if (placeholder.flickable && placeholder.parent !== placeholder.flickable.contentItem)
                placeholder.parent = placeholder.flickable.contentItem
        }
    }

    // Moved after a change of view, not inside its handler (the view is read from the parent).
    onFlickableChanged: placeLater.restart()
    Timer {
        id: placeLater
        interval: 0
        onTriggered: internal.place()
    }
    Component.onCompleted: internal.place()

    Column {
        id: column
        anchors.verticalCenter: placeholder.verticalCenter
        x: Theme.horizontalPageMargin
        width: placeholder.width - 2 * Theme.horizontalPageMargin
        spacing: Theme.paddingMedium

        Text {
            width: column.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            text: placeholder.text
            color: Theme.highlightColor
            font.pixelSize: Theme.fontSizeLarge
        }
        Text {
            width: column.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            visible: text.length > 0
            text: placeholder.hintText
            color: Theme.secondaryHighlightColor
            font.pixelSize: Theme.fontSizeMedium
        }
    }
}
