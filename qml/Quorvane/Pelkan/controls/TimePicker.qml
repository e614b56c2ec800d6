import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype TimePicker
    \inqmlmodule Quorvane.Pelkan
    \brief Picks a time of day, or minutes and seconds, on wheels.

    Each wheel is reached by Tab and turned by Up and Down. The wheels run left to right, right
    to left when mirrored.
*/
Private.ControlBase {
    id: picker

    /*! TimePickerMode.HoursAndMinutes (a time of day: `hour`, `minute`) or
        TimePickerMode.MinutesAndSeconds (a duration's `minute` and `second`). */
    property int mode: Private.TimePickerMode.HoursAndMinutes
    /*! DateTime.DefaultHours (the device's setting, followed live), TwentyFourHours or
        TwelveHours (with an am/pm wheel). */
    property int hourMode: DateTime.DefaultHours
    /*! The hour, 0 to 23. */
    property int hour: 0
    /*! The minute, 0 to 59. */
    property int minute: 0
    /*! The second, 0 to 59 (MinutesAndSeconds). */
    property int second: 0
    /*! Whether the hours run 1 to 12 with an am/pm wheel. */
    readonly property bool twelveHour: mode === Private.TimePickerMode.HoursAndMinutes
                                       && (hourMode === DateTime.TwelveHours
                                           || (hourMode === DateTime.DefaultHours && Format.twelveHour))
    /*! The choice as a date on 1 January 2000. */
    readonly property date time: new Date(2000, 0, 1, hour, minute, second)
    /*! The choice as the formatter writes it. */
    readonly property string timeText: mode === Private.TimePickerMode.MinutesAndSeconds
        ? internal.twoDigits(minute) + ":" + internal.twoDigits(second)
        : Format.formatDate(time, twelveHour ? Formatter.TimeValueTwelveHours : Formatter.TimeValueTwentyFourHours)

    QtObject {
        id: internal
        function twoDigits(n) { return n < 10 ? "0" + n : "" + n }
        function range(count, first, pad) {
            var labels = []
            for (var i = 0; i < count; ++i)
                labels.push(pad ? twoDigits(i + first) : "" + (i + first))
            return labels
        }
    }

    text: timeText
    implicitWidth: wheels.width
    implicitHeight: wheels.height

    // The wheels show the properties; turning a wheel sets them.
    Row {
        id: wheels
        spacing: Theme.paddingLarge
        Private.PickerColumn {
            palette: picker.palette
            labels: picker.mode === Private.TimePickerMode.MinutesAndSeconds ? internal.range(60, 0, true)
                  : picker.twelveHour ? ["12"].concat(internal.range(11, 1, false)) : internal.range(24, 0, true)
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
            palette: picker.palette
            labels: internal.range(60, 0, true)
            currentIndex: picker.mode === Private.TimePickerMode.MinutesAndSeconds ? picker.second : picker.minute
            onPicked: {
                if (picker.mode === Private.TimePickerMode.MinutesAndSeconds)
                    picker.second = index
                else
                    picker.minute = index
            }
        }
        Private.PickerColumn {
            palette: picker.palette
            visible: picker.twelveHour
            labels: [Format.formatArticle(Formatter.AnteMeridiemIndicator), Format.formatArticle(Formatter.PostMeridiemIndicator)]
            currentIndex: picker.hour >= 12 ? 1 : 0
            onPicked: picker.hour = picker.hour % 12 + (index === 1 ? 12 : 0)
        }
    }
}
