import QtQuick 2.6
import org.kde.kirigami 2.10 as Kirigami

Kirigami.Page {
    width: 540
    height: 960
    Kirigami.Heading {
        anchors.centerIn: parent
        text: "Hello"
    }
}
