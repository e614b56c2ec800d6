import QtQuick 2.6
import Quorvane.Pelkan 1.0

// What an empty view shows instead of rows: a text and a hint, centred in the view.
// Declare it inside the view and bind `enabled` to the view being empty.
Item {
    id: placeholder

    property string text
    property string hintText
    readonly property Item _view: parent && parent.parent && parent.parent.hasOwnProperty("contentY") ? parent.parent : parent

    enabled: false
    visible: enabled
    width: _view ? _view.width : 0
    height: _view ? _view.height : 0
    y: _view && _view.hasOwnProperty("originY") ? _view.originY : 0

    Column {
        anchors.verticalCenter: parent.verticalCenter
        x: Theme.horizontalPageMargin
        width: parent.width - 2 * Theme.horizontalPageMargin
        spacing: Theme.paddingMedium

        Text {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            text: placeholder.text
            color: Theme.highlightColor
            font.pixelSize: Theme.fontSizeLarge
        }
        Text {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            visible: text.length > 0
            text: placeholder.hintText
            color: Theme.secondaryHighlightColor
            font.pixelSize: Theme.fontSizeMedium
        }
    }
}
