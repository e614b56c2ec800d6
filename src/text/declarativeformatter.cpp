#include "declarativeformatter.h"
#include "text/formatterseams.h"
#include "platform/mgconfitem.h"
#include "core/pelkanlogging.h"

#include <QLocale>
#include <QQmlEngine>
#include <QSet>
#include <QTranslator>
#include <private/qqmlengine_p.h>
#include <private/qqmljavascriptexpression_p.h>
#include <private/qqmlnotifier_p.h>

#include <limits>

namespace {

// Every formatter of the process (GUI thread), for time-zone changes.
QSet<DeclarativeFormatter *> &liveFormatters()
{
    static QSet<DeclarativeFormatter *> formatters;
    return formatters;
}

// The one locale every operation formats with, fixed when the library is loaded.
const QLocale s_formattingLocale;

const char *const WeekdayIds[7] = {
    "quorvanepelkan-weekday_monday_standalone", "quorvanepelkan-weekday_tuesday_standalone",
    "quorvanepelkan-weekday_wednesday_standalone", "quorvanepelkan-weekday_thursday_standalone",
    "quorvanepelkan-weekday_friday_standalone", "quorvanepelkan-weekday_saturday_standalone",
    "quorvanepelkan-weekday_sunday_standalone",
};

const char *const MonthIds[12] = {
    "quorvanepelkan-monthname_january_standalone", "quorvanepelkan-monthname_february_standalone",
    "quorvanepelkan-monthname_march_standalone", "quorvanepelkan-monthname_april_standalone",
    "quorvanepelkan-monthname_may_standalone", "quorvanepelkan-monthname_june_standalone",
    "quorvanepelkan-monthname_july_standalone", "quorvanepelkan-monthname_august_standalone",
    "quorvanepelkan-monthname_september_standalone", "quorvanepelkan-monthname_october_standalone",
    "quorvanepelkan-monthname_november_standalone", "quorvanepelkan-monthname_december_standalone",
};

// The translation of id, or an empty string when there is none (qtTrId gives the id back).
QString translated(const QByteArray &id, int n = -1)
{
    const QString text = qtTrId(id.constData(), n);
    return text.isEmpty() || text == QLatin1String(id) ? QString() : text;
}

// The number of the placeholder at text[at] ('%' followed by one or two digits, or by 'L'
// and the digits, as QString::arg reads them), or 0; length receives its length.
int placeholderAt(const QString &text, int at, int *length)
{
    int i = at + 1;
    if (i < text.size() && text.at(i) == QLatin1Char('L'))
        ++i;
    int number = 0;
    const int first = i;
    while (i < text.size() && i - first < 2 && text.at(i).isDigit() && text.at(i).unicode() < 128) {
        number = number * 10 + (text.at(i).unicode() - '0');
        ++i;
    }
    *length = i - at;
    return number;
}

// Fills the lowest-numbered placeholder, every occurrence of it, as QString::arg does with
// a text ("%1", "%L1", or "%2" when that is the lowest a translator wrote); a text with
// none (an untranslated id) comes back unchanged, without arg()'s warning.
QString fill(const QString &text, const QString &value)
{
    int lowest = 100;
    int length = 0;
    for (int at = text.indexOf(QLatin1Char('%')); at >= 0; at = text.indexOf(QLatin1Char('%'), at + 1)) {
        const int number = placeholderAt(text, at, &length);
        if (number > 0 && number < lowest)
            lowest = number;
    }
    if (lowest == 100)
        return text;
    QString result;
    result.reserve(text.size() + value.size());
    int copied = 0;
    for (int at = text.indexOf(QLatin1Char('%')); at >= 0; at = text.indexOf(QLatin1Char('%'), at + 1)) {
        if (placeholderAt(text, at, &length) != lowest)
            continue;
        result.append(text.constData() + copied, at - copied).append(value);
        copied = at + length;
        at = copied - 1;
    }
    return result.append(text.constData() + copied, text.size() - copied);
}

QString capitaliseFirst(QString text)
{
    if (text.isEmpty())
        return text;
    const QChar first = text.at(0);
    const bool lower = first.unicode() <= 0x7f ? (first >= QLatin1Char('a') && first <= QLatin1Char('z'))
                                               : first.category() == QChar::Letter_Lowercase;
    if (lower)
        text[0] = first.toUpper();
    return text;
}

// Code points at the start and end of a string, pairing surrogates.
uint firstCodePoint(const QString &s)
{
    if (s.size() > 1 && s.at(0).isHighSurrogate() && s.at(1).isLowSurrogate())
        return QChar::surrogateToUcs4(s.at(0), s.at(1));
    return s.at(0).unicode();
}

uint lastCodePoint(const QString &s)
{
    const int n = s.size();
    if (n > 1 && s.at(n - 1).isLowSurrogate() && s.at(n - 2).isHighSurrogate())
        return QChar::surrogateToUcs4(s.at(n - 2), s.at(n - 1));
    return s.at(n - 1).unicode();
}

// Writes a duration pattern in one pass: "h"/"hh" as the hour count (never wrapped),
// "m", "mm", "s", "ss" as the minutes and seconds of the rest, anything else that is not a
// letter or a quote as it stands. It gives exactly what replacing the hours and then
// formatting the rest with the locale gives; unusual patterns (mixed or long hour runs,
// other fields, quoted text, negative or four-digit hours) return false and take that path.
bool formatDurationPattern(const QString &pattern, int hours, const QTime &rest, const QLocale &locale,
                           QString *result)
{
    if (hours < 0 || hours > 999 || !rest.isValid())
        return false;
    const ushort fieldZero = locale.zeroDigit().unicode();
    const ushort hourZero = QLocale().zeroDigit().unicode();
    auto appendNumber = [result](int value, int width, ushort zero) {
        if (value >= 100)
            result->append(QChar(ushort(zero + value / 100)));
        if (value >= 10 || width == 2)
            result->append(QChar(ushort(zero + value / 10 % 10)));
        result->append(QChar(ushort(zero + value % 10)));
    };

    int hourRun = 0;
    result->clear();
    result->reserve(pattern.size() + 2);
    for (int i = 0; i < pattern.size(); ++i) {
        const QChar c = pattern.at(i);
        int run = 1;
        while (i + run < pattern.size() && pattern.at(i + run) == c)
            ++run;
        if (c == QLatin1Char('h')) {
            if (run > 2 || (hourRun && hourRun != run))
                return false;
            hourRun = run;
            appendNumber(hours, run, hourZero);
        } else if (c == QLatin1Char('m') || c == QLatin1Char('s')) {
            if (run > 2)
                return false;
            appendNumber(c == QLatin1Char('m') ? rest.minute() : rest.second(), run, fieldZero);
        } else if (c.isLetter() || c == QLatin1Char('\'') || c == QLatin1Char('%')) {
            return false;
        } else {
            result->append(pattern.constData() + i, run);
        }
        i += run - 1;
    }
    return true;
}

// The pattern with its hour fields ("h", or "hh" padded to two digits) written out as
// the hour count, so that hours never wrap at 24; quoted text stays as it is. The count is
// spliced in as text: a digit that follows the field in the pattern stays a literal.
QString withHours(const QString &pattern, int hours)
{
    const QLocale locale;
    const QString plain = locale.toString(hours);
    QString padded = plain;
    if (hours >= 0 && hours < 10)
        padded.prepend(locale.zeroDigit());
    QString result;
    result.reserve(pattern.size() + plain.size());
    bool quoted = false;
    for (int i = 0; i < pattern.size(); ++i) {
        const QChar c = pattern.at(i);
        if (c == QLatin1Char('\'')) {
            quoted = !quoted;
        } else if (!quoted && c == QLatin1Char('h')) {
            const bool pair = i + 1 < pattern.size() && pattern.at(i + 1) == c;
            result.append(pair ? padded : plain);
            i += pair ? 1 : 0;
            continue;
        }
        result.append(c);
    }
    return result;
}

} // namespace

DeclarativeFormatter::DeclarativeFormatter(QObject *parent)
    : QObject(parent)
    , m_hourMode(new MGConfItem(QStringLiteral("/quorvane/i18n/lc_timeformat24h"), this))
    , m_readers(new QQmlNotifier)
{
    connect(m_hourMode, &MGConfItem::valueChanged, this, &DeclarativeFormatter::updateHourMode);
    updateHourMode();
    liveFormatters().insert(this);
}

DeclarativeFormatter::~DeclarativeFormatter()
{
    liveFormatters().remove(this);
    delete m_readers;
}

void DeclarativeFormatter::notifyTimeZoneChanged()
{
    const QSet<DeclarativeFormatter *> formatters = liveFormatters();
    for (DeclarativeFormatter *formatter : formatters)
        formatter->m_readers->notify();
}

void DeclarativeFormatter::captureReader() const
{
    // A formatted date in a binding is a function call the engine cannot see into: tell it
    // what the result depends on, so that the binding follows the time zone and hour mode.
    auto *engine = qobject_cast<QQmlEngine *>(qjsEngine(this));
    QQmlPropertyCapture *capture = engine ? QQmlEnginePrivate::get(engine)->propertyCapture : nullptr;
    if (capture)
        capture->captureProperty(m_readers);
}

void DeclarativeFormatter::updateHourMode()
{
    const QVariant value = m_hourMode->value();
    const bool twelveHour = value.isValid() && value.toString() == QLatin1String("12");
    if (twelveHour == m_twelveHour)
        return;
    m_twelveHour = twelveHour;
    Q_EMIT twelveHourChanged();
    m_readers->notify();
}

// Building blocks ---------------------------------------------------------------------

QString DeclarativeFormatter::shortTime(const QTime &time) const
{
    const QString pattern = translated(m_twelveHour ? "quorvanepelkan-time_format_short_12h"
                                                    : "quorvanepelkan-time_format_short_24h");
    return pattern.isEmpty() ? s_formattingLocale.toString(time, QLocale::ShortFormat)
                             : s_formattingLocale.toString(time, pattern);
}

QString DeclarativeFormatter::weekdayName(const QDate &date, bool capitalised) const
{
    const QByteArray id = QByteArray(WeekdayIds[date.dayOfWeek() - 1]) + (capitalised ? "_capitalized" : "");
    const QString text = translated(id);
    if (!text.isEmpty())
        return text;
    const QString name = s_formattingLocale.dayName(date.dayOfWeek(), QLocale::LongFormat);
    return capitalised ? capitaliseFirst(name) : name;
}

QString DeclarativeFormatter::monthName(const QDate &date, bool capitalised) const
{
    const QByteArray id = QByteArray(MonthIds[date.month() - 1]) + (capitalised ? "_capitalized" : "");
    const QString text = translated(id);
    if (!text.isEmpty())
        return text;
    const QString name = s_formattingLocale.monthName(date.month(), QLocale::LongFormat);
    return capitalised ? capitaliseFirst(name) : name;
}

QString DeclarativeFormatter::shortDateWithoutYear(const QDate &date) const
{
    // The day, then the month as a number (%2) or as a short name (%3).
    const QString text = fill(qtTrId("quorvanepelkan-formatShortDate"), s_formattingLocale.toString(date, QStringLiteral("d")));
    if (text.contains(QLatin1String("%2")) || text.contains(QLatin1String("%L2")))
        return fill(text, s_formattingLocale.toString(date, QStringLiteral("M")));
    return fill(text, s_formattingLocale.toString(date, QStringLiteral("MMM")));
}

QString DeclarativeFormatter::yearOrShortDate(const QDate &date, const QDate &today) const
{
    return date <= today.addYears(-1) ? s_formattingLocale.toString(date, QStringLiteral("yyyy"))
                                      : shortDateWithoutYear(date);
}

QString DeclarativeFormatter::sectionRelative(qint64 difference, const QDate &date) const
{
    if (difference == 0)
        return QString();
    if (difference == 1)
        return qtTrId("quorvanepelkan-yesterday");
    if (difference < 7)
        return weekdayName(date, true);
    return qtTrId("quorvanepelkan-older");
}

QString DeclarativeFormatter::timepoint(const QString &time, const QString &dateOrDay) const
{
    return fill(fill(qtTrId("quorvanepelkan-formatTimepoint"), time), dateOrDay);
}

QString DeclarativeFormatter::timeValue(const QTime &time, bool twelveHours) const
{
    QString pattern = translated(twelveHours ? "quorvanepelkan-time_value_twelve_hours"
                                             : "quorvanepelkan-time_value_twentyfour_hours");
    if (pattern.isEmpty())
        pattern = twelveHours ? QStringLiteral("h:mm AP") : QStringLiteral("hh:mm");
    return s_formattingLocale.toString(time, pattern);
}

QString DeclarativeFormatter::datePattern(const QDate &date, const char *id, bool replaceWeekday) const
{
    QString pattern = qtTrId(id);
    if (replaceWeekday && pattern.contains(QLatin1String("cccc"))) {
        // The translated standalone weekday, quoted so the date formatter prints it verbatim.
        QString name = weekdayName(date, false);
        name.replace(QLatin1String("'"), QLatin1String("''"));
        pattern.replace(QLatin1String("cccc"), QLatin1Char('\'') + name + QLatin1Char('\''));
    }
    return s_formattingLocale.toString(date, pattern);
}

QString DeclarativeFormatter::elapsed(const QDateTime &dateTime, const QDate &today, bool shortForm) const
{
    // As dateTime.secsTo(now), without building a local date-time for now. The earliest
    // and latest dates Qt knows lie further apart than 64 bits of milliseconds.
    const qint64 then = dateTime.toMSecsSinceEpoch();
    qint64 milliseconds;
    if (__builtin_sub_overflow(FormatterSeams::currentMSecsSinceEpoch(), then, &milliseconds))
        milliseconds = then < 0 ? std::numeric_limits<qint64>::max() : std::numeric_limits<qint64>::min();
    const qint64 seconds = milliseconds / 1000;
    const qint64 minutes = seconds / 60;
    const bool future = minutes < 0;
    const qint64 m = qAbs(minutes);

    // Rows: minutes, hours, days, months; columns: past, past short, future, future short.
    static const char *const ids[4][4] = {
        { "quorvanepelkan-minutes", "quorvanepelkan-minutes-short", "quorvanepelkan-minutes-future", "quorvanepelkan-minutes-future-short" },
        { "quorvanepelkan-hours", "quorvanepelkan-hours-short", "quorvanepelkan-hours-future", "quorvanepelkan-hours-future-short" },
        { "quorvanepelkan-days", "quorvanepelkan-days-short", "quorvanepelkan-days-future", "quorvanepelkan-days-future-short" },
        { "quorvanepelkan-months", "quorvanepelkan-months-short", "quorvanepelkan-months-future", "quorvanepelkan-months-future-short" },
    };
    enum Unit { Minutes, Hours, Days, Months };
    auto text = [&](Unit unit, qint64 n) {
        return qtTrId(ids[unit][(future ? 2 : 0) + (shortForm ? 1 : 0)], int(n));
    };

    if (m == 0)
        return qtTrId("quorvanepelkan-now");
    if (m < 60)
        return text(Minutes, m);
    const qint64 h = m / 60;
    if (h < 24)
        return text(Hours, h);

    const QDate date = dateTime.date();
    const qint64 d = qAbs(today.toJulianDay() - date.toJulianDay());
    if (d < 28)
        return text(Days, d);
    if (!date.isValid())
        return QString();

    // Whole months from the earlier date to the later one, any part month counted as one.
    // Dates may lie billions of years apart: count in 64 bits and show at most INT_MAX.
    QDate from = qMin(date, today);
    const QDate to = qMax(date, today);
    const qint64 years = qint64(to.year()) - from.year();
    if (years - 1 > (std::numeric_limits<int>::max() - 24) / 12)
        return text(Months, std::numeric_limits<int>::max());
    int months = 0;
    if (years >= 2) {
        from = from.addYears(int(years - 1));
        months = 12 * int(years - 1);
    }
    if (years >= 1 && from.addYears(1) < to) {
        from = from.addYears(1);
        months += 12;
    }
    while (from.isValid() && from < to && months < std::numeric_limits<int>::max()) {
        from = from.addMonths(1);
        ++months;
    }
    return months == 0 ? text(Days, d) : text(Months, months);
}

// Operations ---------------------------------------------------------------------------

QString DeclarativeFormatter::formatDate(const QDateTime &dateTime, int formatType) const
{
    captureReader();
    if (!dateTime.isValid())
        return QString();
    if (formatType < Timepoint || formatType > DateFullWithoutYear) {
        qCWarning(lcPelkanCoreLog) << "formatDate: unknown format type:" << formatType;
        return QString();
    }

    const QDate date = dateTime.date();
    const QDate today = FormatterSeams::currentDate();
    const qint64 difference = today.toJulianDay() - date.toJulianDay();

    switch (FormatType(formatType)) {
    case Timepoint:
        return timepoint(shortTime(dateTime.time()), s_formattingLocale.toString(date, QLocale::ShortFormat));
    case TimepointRelative:
        return difference > 6 ? yearOrShortDate(date, today) : shortTime(dateTime.time());
    case TimepointRelativeCurrentDay:
        if (difference == 0)
            return shortTime(dateTime.time());
        if (difference == 1)
            return qtTrId("quorvanepelkan-yesterday");
        if (difference > 6)
            return yearOrShortDate(date, today);
        return weekdayName(date, true);
    case TimepointRelativeCurrentDayDetailed:
        if (difference > 6)
            return yearOrShortDate(date, today);
        if (difference == 0)
            return shortTime(dateTime.time());
        return timepoint(shortTime(dateTime.time()),
                         difference == 1 ? qtTrId("quorvanepelkan-yesterday") : weekdayName(date, true));
    case TimepointSectionRelative:
        return sectionRelative(difference, date);
    case TimepointSectionHistorical:
        if (difference <= 6)
            return sectionRelative(difference, date);
        if (difference <= 364)
            return monthName(date, true);
        return s_formattingLocale.toString(date, QStringLiteral("yyyy"));
    case WeekdayNameStandalone:
        return weekdayName(date, false);
    case DurationElapsed:
        return elapsed(dateTime, today, false);
    case DurationElapsedShort:
        return elapsed(dateTime, today, true);
    case TimeValueTwelveHours:
        return timeValue(dateTime.time(), true);
    case TimeValueTwentyFourHours:
        return timeValue(dateTime.time(), false);
    case TimeValue: {
        const QVariant mode = m_hourMode->value();
        return timeValue(dateTime.time(), mode.isValid() && mode.toString() == QLatin1String("12"));
    }
    case DurationShort:
    case DurationLong:
        return formatDuration(QTime(0, 0).secsTo(dateTime.time()), formatType);
    case DateFull:
        // The only date pattern with a fallback; the others use whatever the catalogue says.
        if (translated("quorvanepelkan-date_format_full").isEmpty())
            return QLocale().toString(date, QLocale::LongFormat);
        return datePattern(date, "quorvanepelkan-date_format_full", true);
    case DateLong:
        return datePattern(date, "quorvanepelkan-date_format_long", true);
    case MonthNameStandalone:
        return monthName(date, false);
    case MonthNameStandaloneShort: {
        const QString text = translated(QByteArray(MonthIds[date.month() - 1]) + "_short");
        return text.isEmpty() ? s_formattingLocale.monthName(date.month(), QLocale::ShortFormat) : text;
    }
    case DateMedium:
        return datePattern(date, "quorvanepelkan-date_format_medium", false);
    case DateMediumWithoutYear:
        return shortDateWithoutYear(date);
    case DateFullWithoutYear:
        return datePattern(date, "quorvanepelkan-date_format_full_without_year", true);
    }
    return QString();
}

QString DeclarativeFormatter::formatArticle(int articleType) const
{
    switch (articleType) {
    case AnteMeridiemIndicator:
        return s_formattingLocale.amText();
    case PostMeridiemIndicator:
        return s_formattingLocale.pmText();
    default:
        qCWarning(lcPelkanCoreLog) << "formatArticle: unknown article type:" << articleType;
        return QString();
    }
}

QString DeclarativeFormatter::formatDuration(int seconds, int formatType) const
{
    const int hours = seconds / 3600;
    const int rest = seconds - 3600 * hours;
    const bool shortForm = formatType == DurationShort;

    QString pattern = translated(shortForm ? "quorvanepelkan-duration_short_format" : "quorvanepelkan-duration_long_format");
    if (pattern.isEmpty())
        pattern = shortForm ? QStringLiteral("m:ss") : QStringLiteral("h:mm:ss");

    QString text;
    if (formatDurationPattern(pattern, hours, QTime(0, 0).addSecs(rest), s_formattingLocale, &text))
        return text;

    return s_formattingLocale.toString(QTime(0, 0).addSecs(rest), withHours(pattern, hours));
}

QString DeclarativeFormatter::formatFileSize(qlonglong bytes, int precision) const
{
    if (bytes < 0)
        return QString::number(bytes, 10);
    if (precision < 0)
        precision = 1;
    precision = qMin(precision, MaxFileSizePrecision);
    if (bytes < 100)
        return qtTrId("quorvanepelkan-bytes", int(bytes));

    // Each limit is the largest count that still prints below 100.0 kB, 1000.0 MB, 1000.0 GB.
    const char *id;
    double value;
    if (bytes <= 102347) {
        id = "quorvanepelkan-kilobytes";
        value = bytes / 1024.0;
    } else if (bytes <= 1048523570LL) {
        id = "quorvanepelkan-megabytes";
        value = bytes / 1048576.0;
    } else if (bytes <= 1073688136907LL) {
        id = "quorvanepelkan-gigabytes";
        value = bytes / 1073741824.0;
    } else {
        id = "quorvanepelkan-terabytes";
        value = bytes / 1099511627776.0;
    }
    return fill(qtTrId(id), s_formattingLocale.toString(value, 'f', precision));
}

QString DeclarativeFormatter::formatText(const QString &input, int formatType) const
{
    if (formatType != Ascii7Bit && formatType != PortableFilename) {
        qCWarning(lcPelkanCoreLog) << "formatText: unknown format type:" << formatType;
        return QString();
    }
    QString result;
    result.reserve(input.size());
    for (const QChar c : input) {
        const ushort u = c.unicode();
        if (u > 0x80)
            continue;
        if (formatType == PortableFilename
                && !((u >= 'A' && u <= 'Z') || (u >= 'a' && u <= 'z') || (u >= '0' && u <= '9')
                     || u == '_' || u == '-' || u == '.')) {
            continue;
        }
        result.append(c);
    }
    return result;
}

bool DeclarativeFormatter::_needsSpaceBetweenNames(const QString &first, const QString &second) const
{
    if (first.isEmpty() || second.isEmpty())
        return false;
    return !(QChar::script(lastCodePoint(first)) == QChar::Script_Han
             && QChar::script(firstCodePoint(second)) == QChar::Script_Han);
}

QString DeclarativeFormatter::_joinNames(const QString &first, const QString &second) const
{
    return _needsSpaceBetweenNames(first, second) ? first + QLatin1Char(' ') + second : first + second;
}

QString DeclarativeFormatter::trId(const QString &id, const QString &catalog, int n, const QString &localeName) const
{
    const QLocale locale = localeName.isEmpty() ? s_formattingLocale : QLocale(localeName);
    const QString directory = FormatterSeams::translationsDirectory();

    QTranslator translator;
    if (!translator.load(locale, catalog, QStringLiteral("-"), directory) || translator.isEmpty())
        (void)translator.load(catalog + QLatin1String("_eng_en"), directory);
    if (translator.isEmpty()) {
        qCDebug(lcPelkanCoreLog) << "Failed to load translation:" << catalog << "with locale:" << locale.name();
        return id;
    }

    QString text = translator.translate(nullptr, id.toUtf8().constData(), nullptr, n);
    if (text.isEmpty())
        return id;
    if (text.contains(QLatin1String("%n")) || text.contains(QLatin1String("%Ln"))) {
        text.replace(QLatin1String("%Ln"), QLatin1String("%L1"));
        text.replace(QLatin1String("%n"), QLatin1String("%1"));
        text = text.arg(n);
    }
    return text;
}

int DeclarativeFormatter::textDirection(const QString &s) const
{
    for (int i = 0; i < s.size(); ++i) {
        uint code = s.at(i).unicode();
        if (s.at(i).isHighSurrogate() && i + 1 < s.size() && s.at(i + 1).isLowSurrogate()) {
            code = QChar::surrogateToUcs4(s.at(i), s.at(i + 1));
            ++i;
        }
        switch (QChar::direction(code)) {
        case QChar::DirL:
            return Qt::LeftToRight;
        case QChar::DirR:
        case QChar::DirAL:
            return Qt::RightToLeft;
        default:
            break;
        }
    }
    return s_formattingLocale.textDirection();
}
