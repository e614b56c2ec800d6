import QtQuick 2.6
import Quorvane.Pelkan.private 1.0 as Private

// A menu above a Flickable's content, revealed by pulling the content down:
//     Flickable { PullDownMenu { MenuItem { text: "Refresh"; onClicked: ... } } }
Private.PulleyMenuBase {
    _pullDown: true
}
