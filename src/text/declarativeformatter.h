#pragma once

#include <QDateTime>
#include <QObject>
#include <QString>

class MGConfItem;

// Turns dates, times, durations, file sizes and names into display text, with the
// toolkit's translation ids (falling back to built-in patterns or the locale's own names
// where a translation is missing), and looks up translations from a named catalogue.
//
// All locale-dependent formatting uses one process-wide locale, the default locale at the
// time the library was loaded. The 12/24-hour choice follows "/quorvane/i18n/lc_timeformat24h"
// ("12" selects the 12-hour clock) while the application runs.
class QQmlNotifier;

class DeclarativeFormatter : public QObject
{
    Q_OBJECT
    // The device's clock shows 12 hours with am/pm: time pickers follow it live.
    Q_PROPERTY(bool twelveHour READ twelveHour NOTIFY twelveHourChanged)

public:
    enum FormatType {
        Timepoint,
        TimepointRelative,
        TimepointRelativeCurrentDay,
        TimepointRelativeCurrentDayDetailed,
        TimepointSectionRelative,
        TimepointSectionHistorical,
        WeekdayNameStandalone,
        DurationElapsed,
        DurationElapsedShort,
        TimeValueTwelveHours,
        TimeValueTwentyFourHours,
        TimeValue,
        DurationShort,
        DurationLong,
        DateFull,
        DateLong,
        MonthNameStandalone,
        MonthNameStandaloneShort,
        DateMedium,
        DateMediumWithoutYear,
        DateFullWithoutYear
    };
    Q_ENUM(FormatType)

    enum ArticleType { AnteMeridiemIndicator, PostMeridiemIndicator };
    Q_ENUM(ArticleType)

    enum TextFormatType { Ascii7Bit, PortableFilename };
    Q_ENUM(TextFormatType)

    explicit DeclarativeFormatter(QObject *parent = nullptr);
    ~DeclarativeFormatter() override;

    // The most digits after the point that formatFileSize writes: all a double holds.
    static constexpr int MaxFileSizePrecision = 17;

    bool twelveHour() const { return m_twelveHour; }

    // The device's time zone changed: every binding that formatted a date with any
    // formatter is evaluated again.
    static void notifyTimeZoneChanged();

Q_SIGNALS:
    void twelveHourChanged();

public Q_SLOTS:
    void updateHourMode();
    QString formatDate(const QDateTime &dateTime, int formatType) const;
    QString formatArticle(int articleType) const;
    QString formatDuration(int seconds, int formatType) const;
    // precision: digits after the point; negative means 1, at most MaxFileSizePrecision.
    QString formatFileSize(qlonglong bytes, int precision = 1) const;
    QString formatText(const QString &input, int formatType) const;
    bool _needsSpaceBetweenNames(const QString &first, const QString &second) const;
    QString _joinNames(const QString &first, const QString &second) const;
    QString trId(const QString &id, const QString &catalog, int n = -1, const QString &localeName = QString()) const;
    int textDirection(const QString &s) const;

private:
    QString shortTime(const QTime &time) const;
    QString weekdayName(const QDate &date, bool capitalised) const;
    QString monthName(const QDate &date, bool capitalised) const;
    QString shortDateWithoutYear(const QDate &date) const;
    QString yearOrShortDate(const QDate &date, const QDate &today) const;
    QString sectionRelative(qint64 difference, const QDate &date) const;
    QString timepoint(const QString &time, const QString &dateOrDay) const;
    QString elapsed(const QDateTime &dateTime, const QDate &today, bool shortForm) const;
    QString timeValue(const QTime &time, bool twelveHours) const;
    QString datePattern(const QDate &date, const char *id, bool replaceWeekday) const;

    // Makes the binding being evaluated (if any) depend on what changes formatted dates.
    void captureReader() const;

    MGConfItem *m_hourMode;
    QQmlNotifier *m_readers; // the bindings that formatted a date
    bool m_twelveHour = false;
};
