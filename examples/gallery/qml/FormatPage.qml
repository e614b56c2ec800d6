import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The formatter at work: times relative to now that tick once a second, a stopwatch,
// file sizes across the unit boundaries and dates in every style.
Flickable {
    id: page

    property date started: new Date()
    property date now: new Date()

    contentHeight: column.height + Theme.paddingLarge

    Timer {
        interval: 1000
        running: true
        repeat: true
        onTriggered: {
            page.now = new Date()
            events.refresh()
        }
    }

    ListModel {
        id: source
        Component.onCompleted: {
            var minute = 60 * 1000, hour = 60 * minute, day = 24 * hour
            var base = new Date().getTime()
            var offsets = [-20 * 1000, -5 * minute, -3 * hour, -day, -5 * day, -40 * day, -400 * day, 2 * hour]
            for (var i = 0; i < offsets.length; ++i)
                append({ when: new Date(base + offsets[i]) })
        }
    }

    FormattingProxyModel {
        id: events
        sourceModel: source
        formats: [
            { role: "elapsed", source: "when", operation: "formatDate", argument: Formatter.DurationElapsed },
            { role: "section", source: "when", operation: "formatDate", argument: Formatter.TimepointSectionHistorical },
            { role: "stamp", source: "when", operation: "formatDate", argument: Formatter.TimepointRelativeCurrentDay }
        ]
    }

    Column {
        id: column
        x: Theme.horizontalPageMargin
        width: parent.width - 2 * Theme.horizontalPageMargin

        SectionHeader { text: "Relative times" }

        Repeater {
            model: events
            Item {
                width: column.width
                height: Theme.itemSizeSmall * 0.8
                Text {
                    anchors.verticalCenter: parent.verticalCenter
                    text: model.elapsed
                    color: Theme.primaryColor
                    font.pixelSize: Theme.fontSizeMedium
                }
                Text {
                    anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                    text: model.stamp + (model.section ? "  ·  " + model.section : "")
                    color: Theme.secondaryColor
                    font.pixelSize: Theme.fontSizeSmall
                }
            }
        }

        SectionHeader { text: "Durations" }

        Text {
            color: Theme.primaryColor
            font.pixelSize: Theme.fontSizeMedium
            text: "Open for " + Format.formatDuration(Math.round((page.now - page.started) / 1000), Formatter.DurationLong)
                  + "\n3 700 s: " + Format.formatDuration(3700, Formatter.DurationLong)
                  + " (short " + Format.formatDuration(3700, Formatter.DurationShort) + ")"
                  + "\n90 000 s: " + Format.formatDuration(90000, Formatter.DurationLong)
        }

        SectionHeader { text: "File sizes" }

        Flow {
            width: parent.width
            spacing: Theme.paddingLarge
            Repeater {
                model: [99, 100, 102347, 102348, 5 * 1048576, 1048523571, 3.5 * 1099511627776]
                Text {
                    color: Theme.primaryColor
                    font.pixelSize: Theme.fontSizeSmall
                    text: Format.formatFileSize(modelData)
                }
            }
        }

        SectionHeader { text: "Dates" }

        Repeater {
            model: [
                { name: "Full", type: Formatter.DateFull },
                { name: "Long", type: Formatter.DateLong },
                { name: "Medium", type: Formatter.DateMedium },
                { name: "Without year", type: Formatter.DateFullWithoutYear },
                { name: "12 hours", type: Formatter.TimeValueTwelveHours },
                { name: "24 hours", type: Formatter.TimeValueTwentyFourHours }
            ]
            Item {
                width: column.width
                height: Theme.itemSizeSmall * 0.7
                Text {
                    anchors.verticalCenter: parent.verticalCenter
                    text: modelData.name
                    color: Theme.secondaryColor
                    font.pixelSize: Theme.fontSizeSmall
                }
                Text {
                    anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                    text: Format.formatDate(page.now, modelData.type)
                    color: Theme.primaryColor
                    font.pixelSize: Theme.fontSizeSmall
                }
            }
        }
    }
}
