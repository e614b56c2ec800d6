#include "../common/configfixture.h"
#include "text/declarativeformatter.h"
#include "text/formatterseams.h"

#include <QTranslator>
#include <QtTest>

using F = DeclarativeFormatter;

static const QString HourModeKey = QStringLiteral("/quorvane/i18n/lc_timeformat24h");
// Sunday 15 March 2026, noon.
static const QDateTime Now(QDate(2026, 3, 15), QTime(12, 0));

// A catalogue whose texts a test sets, installed over the real one.
class PatternCatalogue : public QTranslator
{
public:
    QHash<QByteArray, QString> texts;
    bool isEmpty() const override { return texts.isEmpty(); }
    QString translate(const char *, const char *id, const char *, int) const override { return texts.value(id); }
};

class tst_DeclarativeFormatter : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanupTestCase();

    void elapsed_data();
    void elapsed();
    void formatDate_data();
    void formatDate();
    void untranslatedDatePatterns();
    void badDates_data();
    void badDates();
    void formatFileSize_data();
    void formatFileSize();
    void formatDuration_data();
    void formatDuration();
    void durationSweepMatchesLocale();
    void translatedPatterns_data();
    void translatedPatterns();
    void formatText_data();
    void formatText();
    void joinNames_data();
    void joinNames();
    void textDirection_data();
    void textDirection();
    void formatArticle();
    void hourModeFollowsConfiguration();
    void trId_data();
    void trId();

private:
    void useCatalogue(bool on);
    QTranslator m_catalogue;
    bool m_installed = false;
};

void tst_DeclarativeFormatter::initTestCase()
{
    FormatterSeams::setTranslationsDirectoryForTesting(QStringLiteral(CATALOGUE_DIR));
    QVERIFY(m_catalogue.load(QStringLiteral("quorvanepelkan-qt5_eng_en"), QStringLiteral(CATALOGUE_DIR)));
    QCOMPARE(QLocale().name(), QStringLiteral("en_GB"));
}

void tst_DeclarativeFormatter::init()
{
    FormatterSeams::setCurrentDateTimeForTesting(Now);
    QVERIFY(ConfigFixture::reset(HourModeKey));
    useCatalogue(true);
}

void tst_DeclarativeFormatter::cleanupTestCase()
{
    ConfigFixture::reset(HourModeKey);
}

void tst_DeclarativeFormatter::useCatalogue(bool on)
{
    if (on && !m_installed)
        QCoreApplication::installTranslator(&m_catalogue);
    else if (!on && m_installed)
        QCoreApplication::removeTranslator(&m_catalogue);
    m_installed = on;
}

void tst_DeclarativeFormatter::elapsed_data()
{
    QTest::addColumn<QDateTime>("now");
    QTest::addColumn<QDateTime>("value");
    QTest::addColumn<int>("type");
    QTest::addColumn<QString>("expected");
    const int L = F::DurationElapsed;
    const int S = F::DurationElapsedShort;
    QTest::newRow("59 s ago") << Now << Now.addSecs(-59) << L << "now";
    QTest::newRow("59 s ahead") << Now << Now.addSecs(59) << L << "now";
    QTest::newRow("60 s ahead") << Now << Now.addSecs(60) << L << "in 1 minute";
    QTest::newRow("1 min ago") << Now << Now.addSecs(-60) << L << "1 minute ago";
    QTest::newRow("59 min ago") << Now << Now.addSecs(-59 * 60) << L << "59 minutes ago";
    QTest::newRow("23 h 59 min ago") << Now << Now.addSecs(-(23 * 60 + 59) * 60) << L << "23 hours ago";
    QTest::newRow("24 h ago is a calendar day") << Now << Now.addSecs(-24 * 3600) << L << "1 day ago";
    QTest::newRow("27 days ago") << Now << Now.addDays(-27) << L << "27 days ago";
    QTest::newRow("28 days ago") << Now << Now.addDays(-28) << L << "1 month ago";
    QTest::newRow("31 Jan to 1 Mar") << QDateTime(QDate(2026, 3, 1), QTime(12, 0))
                                     << QDateTime(QDate(2026, 1, 31), QTime(12, 0)) << L << "2 months ago";
    QTest::newRow("part month rounds up") << Now << QDateTime(QDate(2026, 2, 14), QTime(12, 0)) << L << "2 months ago";
    QTest::newRow("two years") << Now << Now.addYears(-2) << L << "24 months ago";
    QTest::newRow("a year and a bit") << Now << Now.addYears(-1).addDays(-3) << L << "13 months ago";
    QTest::newRow("months ahead") << Now << Now.addMonths(3) << L << "in 3 months";
    QTest::newRow("short, hours") << Now << Now.addSecs(-2 * 3600) << S << "2 h ago";
    QTest::newRow("short, ahead") << Now << Now.addDays(3) << S << "in 3 d";
    QTest::newRow("179 million years ago") << Now << QDateTime(QDate(-179000000, 1, 1), QTime(12, 0)) << L
                                           << "2147483647 months ago";
    QTest::newRow("the earliest date there is") << Now << QDateTime::fromMSecsSinceEpoch(-9223372034901316091LL, Qt::UTC) << L
                                                << "2147483647 months ago";
    QTest::newRow("179 million years ahead") << Now << QDateTime(QDate(179000000, 1, 1), QTime(12, 0)) << L
                                             << "in 2147483647 months";
}

void tst_DeclarativeFormatter::elapsed()
{
    QFETCH(QDateTime, now);
    QFETCH(QDateTime, value);
    QFETCH(int, type);
    QFETCH(QString, expected);
    FormatterSeams::setCurrentDateTimeForTesting(now);
    QCOMPARE(F().formatDate(value, type), expected);
}

void tst_DeclarativeFormatter::formatDate_data()
{
    QTest::addColumn<QDateTime>("value");
    QTest::addColumn<int>("type");
    QTest::addColumn<QString>("expected");
    const QDateTime today(Now.date(), QTime(9, 30));
    QTest::newRow("timepoint") << today << int(F::Timepoint) << "15/03/2026, 09:30";
    QTest::newRow("relative, today") << today << int(F::TimepointRelative) << "09:30";
    QTest::newRow("relative, a week ago") << today.addDays(-7) << int(F::TimepointRelative) << "8 Mar";
    QTest::newRow("relative, 6 days ago") << today.addDays(-6) << int(F::TimepointRelative) << "09:30";
    QTest::newRow("relative, a year ago") << today.addYears(-1) << int(F::TimepointRelative) << "2025";
    QTest::newRow("relative, future") << today.addDays(30) << int(F::TimepointRelative) << "09:30";
    QTest::newRow("current day, today") << today << int(F::TimepointRelativeCurrentDay) << "09:30";
    QTest::newRow("current day, yesterday") << today.addDays(-1) << int(F::TimepointRelativeCurrentDay) << "Yesterday";
    QTest::newRow("current day, 3 days ago") << today.addDays(-3) << int(F::TimepointRelativeCurrentDay) << "Thursday";
    QTest::newRow("current day, 3 days ahead") << today.addDays(3) << int(F::TimepointRelativeCurrentDay) << "Wednesday";
    QTest::newRow("detailed, yesterday") << today.addDays(-1) << int(F::TimepointRelativeCurrentDayDetailed) << "Yesterday, 09:30";
    QTest::newRow("detailed, 2 days ago") << today.addDays(-2) << int(F::TimepointRelativeCurrentDayDetailed) << "Friday, 09:30";
    QTest::newRow("detailed, weeks ago") << today.addDays(-20) << int(F::TimepointRelativeCurrentDayDetailed) << "23 Feb";
    QTest::newRow("section, today") << today << int(F::TimepointSectionRelative) << "";
    QTest::newRow("section, 3 days ahead") << today.addDays(3) << int(F::TimepointSectionRelative) << "Wednesday";
    QTest::newRow("section, 7 days ago") << today.addDays(-7) << int(F::TimepointSectionRelative) << "Older";
    QTest::newRow("historical, 6 days ago") << today.addDays(-6) << int(F::TimepointSectionHistorical) << "Monday";
    QTest::newRow("historical, 364 days ago") << today.addDays(-364) << int(F::TimepointSectionHistorical) << "March";
    QTest::newRow("historical, 365 days ago") << today.addDays(-365) << int(F::TimepointSectionHistorical) << "2025";
    QTest::newRow("weekday") << today << int(F::WeekdayNameStandalone) << "Sunday";
    QTest::newRow("12 hours") << QDateTime(Now.date(), QTime(14, 5)) << int(F::TimeValueTwelveHours) << "2:05 PM";
    QTest::newRow("24 hours") << QDateTime(Now.date(), QTime(14, 5)) << int(F::TimeValueTwentyFourHours) << "14:05";
    QTest::newRow("time value, default 24") << QDateTime(Now.date(), QTime(14, 5)) << int(F::TimeValue) << "14:05";
    QTest::newRow("duration short drops hours") << QDateTime(Now.date(), QTime(1, 2, 3)) << int(F::DurationShort) << "2:03";
    QTest::newRow("duration long") << QDateTime(Now.date(), QTime(1, 2, 3)) << int(F::DurationLong) << "1:02:03";
    QTest::newRow("date full") << today << int(F::DateFull) << "Sunday, 15 March 2026";
    QTest::newRow("date long") << today << int(F::DateLong) << "15 March 2026";
    QTest::newRow("month") << today << int(F::MonthNameStandalone) << "March";
    QTest::newRow("month short") << today << int(F::MonthNameStandaloneShort) << "Mar";
    QTest::newRow("date medium") << today << int(F::DateMedium) << "15 Mar 2026";
    QTest::newRow("date medium without year") << today << int(F::DateMediumWithoutYear) << "15 Mar";
    QTest::newRow("date full without year") << today << int(F::DateFullWithoutYear) << "Sunday, 15 March";
}

void tst_DeclarativeFormatter::formatDate()
{
    QFETCH(QDateTime, value);
    QFETCH(int, type);
    QFETCH(QString, expected);
    QCOMPARE(F().formatDate(value, type), expected);
}

void tst_DeclarativeFormatter::untranslatedDatePatterns()
{
    useCatalogue(false);
    const QDateTime value(Now.date(), QTime(9, 30));
    F formatter;
    // Names and the full date fall back to the locale.
    QCOMPARE(formatter.formatDate(value, F::WeekdayNameStandalone), QStringLiteral("Sunday"));
    QCOMPARE(formatter.formatDate(value, F::MonthNameStandaloneShort), QStringLiteral("Mar"));
    QCOMPARE(formatter.formatDate(value, F::DateFull), QLocale().toString(value.date(), QLocale::LongFormat));
    QCOMPARE(formatter.formatDate(value, F::TimeValueTwelveHours), QStringLiteral("9:30 AM"));
    // The long date has no fallback: the id itself is the pattern.
    QCOMPARE(formatter.formatDate(value, F::DateLong),
             QLocale().toString(value.date(), QStringLiteral("quorvanepelkan-date_format_long")));
    QCOMPARE(formatter.formatDate(value, F::TimepointSectionRelative), QString());
    QCOMPARE(formatter.formatDate(value.addDays(-1), F::TimepointSectionRelative), QStringLiteral("quorvanepelkan-yesterday"));
}

void tst_DeclarativeFormatter::badDates_data()
{
    QTest::addColumn<QDateTime>("value");
    QTest::addColumn<int>("type");
    QTest::addColumn<bool>("warns");
    QTest::newRow("invalid date, timepoint") << QDateTime() << int(F::Timepoint) << false;
    QTest::newRow("invalid date, elapsed") << QDateTime() << int(F::DurationElapsed) << false;
    QTest::newRow("type 21") << Now << 21 << true;
    QTest::newRow("type -1") << Now << -1 << true;
}

void tst_DeclarativeFormatter::badDates()
{
    QFETCH(QDateTime, value);
    QFETCH(int, type);
    QFETCH(bool, warns);
    if (warns)
        QTest::ignoreMessage(QtWarningMsg, qPrintable(QStringLiteral("formatDate: unknown format type: %1").arg(type)));
    QCOMPARE(F().formatDate(value, type), QString());
}

void tst_DeclarativeFormatter::formatFileSize_data()
{
    QTest::addColumn<qlonglong>("bytes");
    QTest::addColumn<int>("precision");
    QTest::addColumn<QString>("expected");
    QTest::newRow("0") << 0LL << 1 << "0 bytes";
    QTest::newRow("1") << 1LL << 1 << "1 byte";
    QTest::newRow("99") << 99LL << 1 << "99 bytes";
    QTest::newRow("100") << 100LL << 1 << "0.1 kB";
    QTest::newRow("102 347") << 102347LL << 1 << "99.9 kB";
    QTest::newRow("102 348") << 102348LL << 1 << "0.1 MB";
    QTest::newRow("last MB") << 1048523570LL << 1 << "999.9 MB";
    QTest::newRow("first GB") << 1048523571LL << 1 << "1.0 GB";
    QTest::newRow("last GB") << 1073688136907LL << 1 << "999.9 GB";
    QTest::newRow("first TB") << 1073688136908LL << 1 << "1.0 TB";
    QTest::newRow("precision 0") << 1536LL << 0 << "2 kB";
    QTest::newRow("precision 2") << 1536LL << 2 << "1.50 kB";
    QTest::newRow("negative precision") << 1024LL << -3 << "1.0 kB";
    QTest::newRow("negative size") << -5LL << 1 << "-5";
    QTest::newRow("precision past a double's digits") << 1536LL << 2147483647 << "1.50000000000000000 kB";
}

void tst_DeclarativeFormatter::formatFileSize()
{
    QFETCH(qlonglong, bytes);
    QFETCH(int, precision);
    QFETCH(QString, expected);
    QCOMPARE(F().formatFileSize(bytes, precision), expected);
}

void tst_DeclarativeFormatter::formatDuration_data()
{
    QTest::addColumn<int>("seconds");
    QTest::addColumn<int>("type");
    QTest::addColumn<QString>("expected");
    QTest::newRow("3 700 long") << 3700 << int(F::DurationLong) << "1:01:40";
    QTest::newRow("3 700 short") << 3700 << int(F::DurationShort) << "1:40";
    QTest::newRow("90 000 long, hours not wrapped") << 90000 << int(F::DurationLong) << "25:00:00";
    QTest::newRow("59 long") << 59 << int(F::DurationLong) << "0:00:59";
    QTest::newRow("1000 hours, grouped") << 3600000 << int(F::DurationLong) << "1,000:00:00";
    QTest::newRow("other type is long") << 61 << int(F::DateFull) << "0:01:01";
}

void tst_DeclarativeFormatter::formatDuration()
{
    QFETCH(int, seconds);
    QFETCH(int, type);
    QFETCH(QString, expected);
    QCOMPARE(F().formatDuration(seconds, type), expected);
    // The built-in patterns are the catalogue's.
    useCatalogue(false);
    QCOMPARE(F().formatDuration(seconds, type), expected);
}

void tst_DeclarativeFormatter::durationSweepMatchesLocale()
{
    // Every minute and second field, padded or not, as the locale's time formatter writes it.
    F formatter;
    const QLocale locale;
    for (int seconds = 0; seconds < 3 * 3600; seconds += 37) {
        const QTime rest = QTime(0, 0).addSecs(seconds % 3600);
        QCOMPARE(formatter.formatDuration(seconds, F::DurationLong),
                 QString::number(seconds / 3600) + QLatin1Char(':') + locale.toString(rest, QStringLiteral("mm:ss")));
        QCOMPARE(formatter.formatDuration(seconds, F::DurationShort), locale.toString(rest, QStringLiteral("m:ss")));
    }
}

void tst_DeclarativeFormatter::translatedPatterns_data()
{
    QTest::addColumn<QByteArray>("id");
    QTest::addColumn<QString>("translation");
    QTest::addColumn<qlonglong>("value"); // seconds of a long duration, or bytes
    QTest::addColumn<QString>("expected");
    const QByteArray duration("quorvanepelkan-duration_long_format");
    QTest::newRow("digit after the hours") << duration << "h9" << 3600LL << "19";
    QTest::newRow("digit after the hours, quoted text") << duration << "h9 'min' mm" << 3660LL << "19 min 01";
    QTest::newRow("padded hours and a digit") << duration << "hh0'h'" << 3600LL << "010h";
    QTest::newRow("an h inside quotes stays") << duration << "h 'hours'" << 7200LL << "2 hours";
    // Placeholders are filled as QString::arg fills them.
    const QByteArray kilobytes("quorvanepelkan-kilobytes");
    QTest::newRow("localised placeholder") << kilobytes << "%L1 kB" << 2048LL << "2.0 kB";
    QTest::newRow("lowest placeholder is not %1") << kilobytes << "%2 kB" << 2048LL << "2.0 kB";
    QTest::newRow("placeholder twice") << kilobytes << "%1 kB (%1)" << 2048LL << "2.0 kB (2.0)";
    QTest::newRow("a percent that is no placeholder") << kilobytes << "100% %1 kB" << 2048LL << "100% 2.0 kB";
    QTest::newRow("no placeholder") << kilobytes << "kB" << 2048LL << "kB";
}

void tst_DeclarativeFormatter::translatedPatterns()
{
    QFETCH(QByteArray, id);
    QFETCH(QString, translation);
    QFETCH(qlonglong, value);
    QFETCH(QString, expected);
    PatternCatalogue catalogue;
    catalogue.texts.insert(id, translation);
    QCoreApplication::installTranslator(&catalogue);
    const QString text = id.contains("duration") ? F().formatDuration(int(value), F::DurationLong)
                                                 : F().formatFileSize(value);
    QCoreApplication::removeTranslator(&catalogue);
    QCOMPARE(text, expected);
}

void tst_DeclarativeFormatter::formatText_data()
{
    QTest::addColumn<QString>("input");
    QTest::addColumn<int>("type");
    QTest::addColumn<QString>("expected");
    QTest::newRow("U+0080 passes, é does not") << QStringLiteral("a\u0080\u00e9") << int(F::Ascii7Bit) << QStringLiteral("a\u0080");
    QTest::newRow("ascii kept") << "Hello, world!" << int(F::Ascii7Bit) << "Hello, world!";
    QTest::newRow("portable filename") << "My File (1).txt" << int(F::PortableFilename) << "MyFile1.txt";
    QTest::newRow("portable keeps _-.") << QStringLiteral("\u00e4-b_c.d\u0080") << int(F::PortableFilename) << "-b_c.d";
}

void tst_DeclarativeFormatter::formatText()
{
    QFETCH(QString, input);
    QFETCH(int, type);
    QFETCH(QString, expected);
    QCOMPARE(F().formatText(input, type), expected);
}

void tst_DeclarativeFormatter::joinNames_data()
{
    QTest::addColumn<QString>("first");
    QTest::addColumn<QString>("second");
    QTest::addColumn<QString>("joined");
    QTest::newRow("latin") << "Anna" << "Virtanen" << "Anna Virtanen";
    QTest::newRow("han") << QStringLiteral("\u738b") << QStringLiteral("\u5c0f\u660e") << QStringLiteral("\u738b\u5c0f\u660e");
    QTest::newRow("han then latin") << QStringLiteral("\u738b") << "Li" << QStringLiteral("\u738b Li");
    QTest::newRow("han outside the BMP") << QStringLiteral("\U00020000") << QStringLiteral("\u738b") << QStringLiteral("\U00020000\u738b");
    QTest::newRow("empty first") << "" << "Anna" << "Anna";
    QTest::newRow("empty second") << "Anna" << "" << "Anna";
}

void tst_DeclarativeFormatter::joinNames()
{
    QFETCH(QString, first);
    QFETCH(QString, second);
    QFETCH(QString, joined);
    F formatter;
    QCOMPARE(formatter._joinNames(first, second), joined);
    QCOMPARE(formatter._needsSpaceBetweenNames(first, second), joined.size() > first.size() + second.size());
}

void tst_DeclarativeFormatter::textDirection_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("direction");
    QTest::newRow("latin") << "abc" << int(Qt::LeftToRight);
    QTest::newRow("hebrew") << QStringLiteral("\u05e9\u05dc\u05d5\u05dd") << int(Qt::RightToLeft);
    QTest::newRow("arabic") << QStringLiteral("\u0645\u0631\u062d\u0628\u0627") << int(Qt::RightToLeft);
    QTest::newRow("digits skipped") << QStringLiteral("123 \u05e9") << int(Qt::RightToLeft);
    QTest::newRow("no strong character") << "123 ..." << int(QLocale().textDirection());
    QTest::newRow("empty") << "" << int(QLocale().textDirection());
}

void tst_DeclarativeFormatter::textDirection()
{
    QFETCH(QString, text);
    QFETCH(int, direction);
    QCOMPARE(F().textDirection(text), direction);
}

void tst_DeclarativeFormatter::formatArticle()
{
    F formatter;
    QTest::ignoreMessage(QtWarningMsg, "formatArticle: unknown article type: 2");
    QCOMPARE(formatter.formatArticle(2), QString());
}

void tst_DeclarativeFormatter::hourModeFollowsConfiguration()
{
    F formatter;
    QSignalSpy hourModeChanged(&formatter, &F::twelveHourChanged);
    const QDateTime afternoon(Now.date(), QTime(14, 5));
    QCOMPARE(formatter.formatDate(afternoon, F::TimepointRelative), QStringLiteral("14:05"));
    QVERIFY(!formatter.property("twelveHour").toBool());
    QVERIFY(ConfigFixture::write(HourModeKey, QStringLiteral("'12'")));
    QTRY_COMPARE(formatter.formatDate(afternoon, F::TimepointRelative), QStringLiteral("2:05 PM"));
    QCOMPARE(formatter.formatDate(afternoon, F::TimeValue), QStringLiteral("2:05 PM"));
    QVERIFY(formatter.property("twelveHour").toBool());
    QCOMPARE(hourModeChanged.count(), 1);
    QVERIFY(ConfigFixture::write(HourModeKey, QStringLiteral("'24'")));
    QTRY_COMPARE(formatter.formatDate(afternoon, F::TimepointRelative), QStringLiteral("14:05"));
    QCOMPARE(hourModeChanged.count(), 2);
}

void tst_DeclarativeFormatter::trId_data()
{
    QTest::addColumn<QString>("id");
    QTest::addColumn<QString>("catalog");
    QTest::addColumn<int>("n");
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("expected");
    const QString c = QStringLiteral("quorvanepelkan-qt5");
    QTest::newRow("finnish singular") << "quorvanepelkan-minutes" << c << 1 << "fi" << "1 minuutti sitten";
    QTest::newRow("finnish plural") << "quorvanepelkan-minutes" << c << 5 << "fi" << "5 minuuttia sitten";
    QTest::newRow("finnish future") << "quorvanepelkan-hours-future" << c << 2 << "fi" << "2 tunnin päästä";
    QTest::newRow("finnish plain") << "quorvanepelkan-bt-cancel" << c << -1 << "fi_FI" << "Peruuta";
    QTest::newRow("no german: english fallback") << "quorvanepelkan-bt-cancel" << c << -1 << "de" << "Cancel";
    QTest::newRow("default locale: english") << "quorvanepelkan-bytes" << c << 3 << "" << "3 bytes";
    QTest::newRow("unknown id") << "quorvanepelkan-nothing" << c << -1 << "fi" << "quorvanepelkan-nothing";
    QTest::newRow("unknown catalogue") << "quorvanepelkan-bt-cancel" << "nothing-qt5" << -1 << "fi" << "quorvanepelkan-bt-cancel";
}

void tst_DeclarativeFormatter::trId()
{
    QFETCH(QString, id);
    QFETCH(QString, catalog);
    QFETCH(int, n);
    QFETCH(QString, locale);
    QFETCH(QString, expected);
    // trId reads catalogues itself; the installed translator plays no part.
    useCatalogue(false);
    QCOMPARE(F().trId(id, catalog, n, locale), expected);
}

QTEST_GUILESS_MAIN(tst_DeclarativeFormatter)
#include "tst_declarativeformatter.moc"
