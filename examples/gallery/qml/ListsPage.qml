import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A long list with what lists have: a pull-down menu to clear (with a remorse over the
// page) and fill, a push-up menu back to the top, rows with a context menu whose removal
// counts down on the row, sections, a scroll bar, a quick-scroll button, and a placeholder
// when the list is empty.
Page {
    id: page

    ListModel { id: fruit }

    function fill() {
        fruit.clear()
        var names = ["Apple", "Apricot", "Banana", "Bilberry", "Blackcurrant", "Cherry", "Cloudberry",
                     "Damson", "Elderberry", "Fig", "Gooseberry", "Grape", "Lingonberry", "Mango",
                     "Pear", "Plum", "Quince", "Raspberry", "Rowanberry", "Strawberry"]
        for (var round = 0; round < 5; ++round)
            for (var i = 0; i < names.length; ++i)
                fruit.append({ "name": names[i] + (round ? " " + (round + 1) : ""), "letter": names[i].charAt(0) })
    }

    // Made here, not in a delegate: the countdown outlives delegates that scroll away.
    function removeLater(name) {
        return function() {
            for (var i = 0; i < fruit.count; ++i) {
                if (fruit.get(i).name === name) {
                    fruit.remove(i)
                    return
                }
            }
        }
    }

    Component.onCompleted: fill()

    RemorsePopup { id: clearing }

    ListView {
        id: view
        anchors.fill: parent
        model: fruit
        property Item pullDownMenu
        property Item pushUpMenu

        header: PageHeader { title: "Lists and menus"; description: fruit.count + " rows" }
        section.property: "letter"
        section.delegate: SectionHeader { text: section }

        delegate: ListItem {
            id: row
            menu: Component {
                ContextMenu {
                    MenuItem { text: "Remove"; onClicked: row.remorseAction("Removing", page.removeLater(model.name)) }
                    MenuItem { text: "Move to the top"; onClicked: fruit.move(index, 0, 1) }
                }
            }
            Text {
                x: Theme.horizontalPageMargin
                anchors.verticalCenter: parent.verticalCenter
                text: model.name
                color: row.highlighted ? Theme.highlightColor : Theme.primaryColor
                font.pixelSize: Theme.fontSizeMedium
            }
        }

        PullDownMenu {
            MenuItem { text: "Clear"; onClicked: clearing.execute("Clearing", function() { fruit.clear() }) }
            MenuItem { text: "Fill again"; onClicked: page.fill() }
        }
        PushUpMenu {
            MenuLabel { text: "The end" }
            MenuItem { text: "Back to the top"; onClicked: view.positionViewAtBeginning() }
        }

        ViewPlaceholder {
            enabled: fruit.count === 0
            text: "No fruit"
            hintText: "Pull down to fill the list again"
        }
        ScrollDecorator { flickable: view }
    }
    QuickScroll { flickable: view }
}
