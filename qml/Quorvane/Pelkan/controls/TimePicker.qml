import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Picks a time of day (`hour`, `minute`) with TimePickerMode.HoursAndMinutes, or a
// duration's `minute` and `second` with TimePickerMode.MinutesAndSeconds, on wheels.
// `hourMode` (DateTime.HourMode) chooses 24 hours or 12 with an am/pm wheel; by default it
// follows the device's setting, live. `timeText` shows the choice as the formatter does.
Row {
    id: picker

    property int mode: Private.TimePickerMode.HoursAndMinutes
    property int hourMode: DateTime.DefaultHours
    property int hour: 0
    property int minute: 0
    property int second: 0
    readonly property bool twelveHour: mode === Private.TimePickerMode.HoursAndMinutes
                                       && (hourMode === DateTime.TwelveHours
                                           || (hourMode === DateTime.DefaultHours && Format.twelveHour))
    readonly property date time: new Date(2000, 0, 1, hour, minute, second)
    readonly property string timeText: mode === Private.TimePickerMode.MinutesAndSeconds
        ? _twoDigits(minute) + ":" + _twoDigits(second)
        : Format.formatDate(time, twelveHour ? Formatter.TimeValueTwelveHours : Formatter.TimeValueTwentyFourHours)

    function _twoDigits(n) { return n < 10 ? "0" + n : "" + n }
    function _range(count, first, pad) {
        var labels = []
        for (var i = 0; i < count; ++i)
            labels.push(pad ? _twoDigits(i + first) : "" + (i + first))
        return labels
    }

    spacing: Theme.paddingLarge

    // The wheels show the properties; turning a wheel sets them.
    Private.PickerColumn {
        labels: picker.mode === Private.TimePickerMode.MinutesAndSeconds ? picker._range(60, 0, true)
              : picker.twelveHour ? ["12"].concat(picker._range(11, 1, false)) : picker._range(24, 0, true)
        currentIndex: picker.mode === Private.TimePickerMode.MinutesAndSeconds ? picker.minute
                    : picker.twelveHour ? picker.hour % 12 : picker.hour
        onPicked: {
            if (picker.mode === Private.TimePickerMode.MinutesAndSeconds)
                picker.minute = index
            else
                picker.hour = picker.twelveHour ? index + (picker.hour >= 12 ? 12 : 0) : index
        }
    }
    Private.PickerColumn {
        labels: picker._range(60, 0, true)
        currentIndex: picker.mode === Private.TimePickerMode.MinutesAndSeconds ? picker.second : picker.minute
        onPicked: {
            if (picker.mode === Private.TimePickerMode.MinutesAndSeconds)
                picker.second = index
            else
                picker.minute = index
        }
    }
    Private.PickerColumn {
        visible: picker.twelveHour
        labels: [Format.formatArticle(Formatter.AnteMeridiemIndicator), Format.formatArticle(Formatter.PostMeridiemIndicator)]
        currentIndex: picker.hour >= 12 ? 1 : 0
        onPicked: picker.hour = picker.hour % 12 + (index === 1 ? 12 : 0)
    }
}
