import QtQuick 2.6
import Quorvane.Pelkan 1.0

ApplicationWindow {
    initialPage: Component { FirstPage {} }
    cover: Component { CoverPage {} }
}
