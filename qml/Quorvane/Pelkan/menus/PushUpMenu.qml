import QtQuick 2.6
import Quorvane.Pelkan.private 1.0 as Private

// A menu below a Flickable's content, revealed by pushing the content up past its end.
Private.PulleyMenuBase {
    _pullDown: false
}
