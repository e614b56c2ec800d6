import QtQuick 2.6
import Quorvane.Pelkan 1.0

// Searching a list: a search field in the list's header filters the rows as the user
// types, and keeps the keyboard while the list refills. What was searched for is offered
// again next time (remembered for this kind of page by default).
Page {
    id: page

    readonly property alias list: list
    property string pattern
    readonly property var cities: [
        "Amsterdam", "Athens", "Barcelona", "Berlin", "Bordeaux", "Bratislava", "Brussels",
        "Bucharest", "Budapest", "Copenhagen", "Dublin", "Edinburgh", "Gdansk", "Geneva",
        "Hamburg", "Helsinki", "Krakow", "Lisbon", "Ljubljana", "London", "Lyon", "Madrid",
        "Marseille", "Milan", "Munich", "Naples", "Oslo", "Paris", "Porto", "Prague", "Reykjavik",
        "Riga", "Rome", "Rotterdam", "Seville", "Sofia", "Stockholm", "Tallinn", "Turku",
        "Valencia", "Vienna", "Vilnius", "Warsaw", "Zagreb", "Zurich"
    ]

    function filter(pattern) {
        var lower = pattern.toLowerCase()
        matches.clear()
        for (var i = 0; i < cities.length; ++i) {
            if (cities[i].toLowerCase().indexOf(lower) >= 0)
                matches.append({ "name": cities[i] })
        }
    }

    ListModel { id: matches }

    ListView {
        id: list
        anchors.fill: parent
        model: matches

        header: Column {
            width: list.width
            PageHeader { title: "Search" }
            SearchField {
                id: search
                placeholderText: "City"
                onTextChanged: {
                    page.pattern = text
                    page.filter(text)
                }
            }
        }

        delegate: ListItem {
            id: row
            width: list.width
            Label {
                x: Theme.horizontalPageMargin
                width: row.width - 2 * Theme.horizontalPageMargin
                height: row.contentHeight
                verticalAlignment: Text.AlignVCenter
                textFormat: Text.StyledText
                color: row.highlighted ? Theme.highlightColor : Theme.primaryColor
                text: Theme.highlightText(model.name, page.pattern, Theme.highlightColor)
            }
        }

        ScrollDecorator {}
    }

    Component.onCompleted: filter("")
}
