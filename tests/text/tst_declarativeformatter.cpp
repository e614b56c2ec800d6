#include "../common/configfixture.h"
#include "text/declarativeformatter.h"
#include "text/formatterseams.h"
#include "text/formattingproxymodel.h"

#include <QStandardItemModel>
#include <QTranslator>
#include <QtTest>

using F = DeclarativeFormatter;

static const QString HourModeKey = QStringLiteral("/quorvane/i18n/lc_timeformat24h");
// Sunday 15 March 2026, noon.
static const QDateTime Now(QDate(2026, 3, 15), QTime(12, 0));

enum SourceRoles { ModifiedRole = Qt::UserRole + 1, SizeRole, NameRole };

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
    void initTestCase()
    {
        FormatterSeams::setTranslationsDirectoryForTesting(QStringLiteral(CATALOGUE_DIR));
        QVERIFY(m_catalogue.load(QStringLiteral("quorvanepelkan-qt5_eng_en"), QStringLiteral(CATALOGUE_DIR)));
        QCOMPARE(QLocale().name(), QStringLiteral("en_GB"));
        // A proxy model's formatted roles over one source row.
        m_source.setItemRoleNames({ { ModifiedRole, "modified" }, { SizeRole, "size" }, { NameRole, "name" } });
        m_proxy.setSourceModel(&m_source);
        m_proxy.setFormats({ format("modifiedText", "modified", "formatDate", F::DurationElapsed),
                             format("sizeText", "size", "formatFileSize"),
                             format("lengthText", "size", "formatDuration", F::DurationLong),
                             format("safeName", "name", "formatText", F::PortableFilename) });
    }

    void init()
    {
        FormatterSeams::setCurrentDateTimeForTesting(Now);
        QVERIFY(ConfigFixture::reset(HourModeKey));
        useCatalogue(true);
        m_source.clear();
        auto item = new QStandardItem;
        item->setData(Now.addSecs(-3 * 60), ModifiedRole);
        item->setData(qlonglong(1536), SizeRole);
        item->setData(QStringLiteral("Holiday photo (2).jpg"), NameRole);
        m_source.appendRow(item);
    }

    void cleanupTestCase() { ConfigFixture::reset(HourModeKey); }

    void formatDate_data()
    {
        QTest::addColumn<QDateTime>("now");
        QTest::addColumn<QDateTime>("value");
        QTest::addColumn<int>("type");
        QTest::addColumn<QString>("expected"); // "warning: <text>" for an empty result with that warning
        auto row = [](const char *tag, const QDateTime &value, int type, const QString &expected, const QDateTime &now = Now) {
            QTest::newRow(tag) << now << value << type << expected;
        };
        const int L = F::DurationElapsed;
        const int S = F::DurationElapsedShort;
        row("59 s ago", Now.addSecs(-59), L, "now");
        row("59 s ahead", Now.addSecs(59), L, "now");
        row("60 s ahead", Now.addSecs(60), L, "in 1 minute");
        row("1 min ago", Now.addSecs(-60), L, "1 minute ago");
        row("59 min ago", Now.addSecs(-59 * 60), L, "59 minutes ago");
        row("23 h 59 min ago", Now.addSecs(-(23 * 60 + 59) * 60), L, "23 hours ago");
        row("24 h ago is a calendar day", Now.addSecs(-24 * 3600), L, "1 day ago");
        row("27 days ago", Now.addDays(-27), L, "27 days ago");
        row("28 days ago", Now.addDays(-28), L, "1 month ago");
        row("31 Jan to 1 Mar", QDateTime(QDate(2026, 1, 31), QTime(12, 0)), L, "2 months ago", QDateTime(QDate(2026, 3, 1), QTime(12, 0)));
        row("part month rounds up", QDateTime(QDate(2026, 2, 14), QTime(12, 0)), L, "2 months ago");
        row("two years", Now.addYears(-2), L, "24 months ago");
        row("a year and a bit", Now.addYears(-1).addDays(-3), L, "13 months ago");
        row("months ahead", Now.addMonths(3), L, "in 3 months");
        row("short, hours", Now.addSecs(-2 * 3600), S, "2 h ago");
        row("short, ahead", Now.addDays(3), S, "in 3 d");
        row("179 million years ago", QDateTime(QDate(-179000000, 1, 1), QTime(12, 0)), L, "2147483647 months ago");
        row("the earliest date there is", QDateTime::fromMSecsSinceEpoch(-9223372034901316091LL, Qt::UTC), L, "2147483647 months ago");
        row("179 million years ahead", QDateTime(QDate(179000000, 1, 1), QTime(12, 0)), L, "in 2147483647 months");
        row("invalid date, elapsed", QDateTime(), L, "");

        const QDateTime today(Now.date(), QTime(9, 30));
        const QDateTime afternoon(Now.date(), QTime(14, 5));
        const QDateTime duration(Now.date(), QTime(1, 2, 3));
        row("timepoint", today, F::Timepoint, "15/03/2026, 09:30");
        row("invalid date, timepoint", QDateTime(), F::Timepoint, "");
        row("relative, today", today, F::TimepointRelative, "09:30");
        row("relative, a week ago", today.addDays(-7), F::TimepointRelative, "8 Mar");
        row("relative, 6 days ago", today.addDays(-6), F::TimepointRelative, "09:30");
        row("relative, a year ago", today.addYears(-1), F::TimepointRelative, "2025");
        row("relative, future", today.addDays(30), F::TimepointRelative, "09:30");
        row("current day, today", today, F::TimepointRelativeCurrentDay, "09:30");
        row("current day, yesterday", today.addDays(-1), F::TimepointRelativeCurrentDay, "Yesterday");
        row("current day, 3 days ago", today.addDays(-3), F::TimepointRelativeCurrentDay, "Thursday");
        row("current day, 3 days ahead", today.addDays(3), F::TimepointRelativeCurrentDay, "Wednesday");
        row("detailed, yesterday", today.addDays(-1), F::TimepointRelativeCurrentDayDetailed, "Yesterday, 09:30");
        row("detailed, 2 days ago", today.addDays(-2), F::TimepointRelativeCurrentDayDetailed, "Friday, 09:30");
        row("detailed, weeks ago", today.addDays(-20), F::TimepointRelativeCurrentDayDetailed, "23 Feb");
        row("section, today", today, F::TimepointSectionRelative, "");
        row("section, 3 days ahead", today.addDays(3), F::TimepointSectionRelative, "Wednesday");
        row("section, 7 days ago", today.addDays(-7), F::TimepointSectionRelative, "Older");
        row("historical, 6 days ago", today.addDays(-6), F::TimepointSectionHistorical, "Monday");
        row("historical, 364 days ago", today.addDays(-364), F::TimepointSectionHistorical, "March");
        row("historical, 365 days ago", today.addDays(-365), F::TimepointSectionHistorical, "2025");
        row("weekday", today, F::WeekdayNameStandalone, "Sunday");
        row("12 hours", afternoon, F::TimeValueTwelveHours, "2:05 PM");
        row("24 hours", afternoon, F::TimeValueTwentyFourHours, "14:05");
        row("time value, default 24", afternoon, F::TimeValue, "14:05");
        row("duration short drops hours", duration, F::DurationShort, "2:03");
        row("duration long", duration, F::DurationLong, "1:02:03");
        row("date full", today, F::DateFull, "Sunday, 15 March 2026");
        row("date long", today, F::DateLong, "15 March 2026");
        row("month", today, F::MonthNameStandalone, "March");
        row("month short", today, F::MonthNameStandaloneShort, "Mar");
        row("date medium", today, F::DateMedium, "15 Mar 2026");
        row("date medium without year", today, F::DateMediumWithoutYear, "15 Mar");
        row("date full without year", today, F::DateFullWithoutYear, "Sunday, 15 March");
        row("type 21", Now, 21, "warning: formatDate: unknown format type: 21");
        row("type -1", Now, -1, "warning: formatDate: unknown format type: -1");
        // Without a catalogue, names and the full date fall back to the locale; the long
        // date has no fallback: the id itself is the pattern.
        row("untranslated: weekday", today, F::WeekdayNameStandalone, "Sunday");
        row("untranslated: month short", today, F::MonthNameStandaloneShort, "Mar");
        row("untranslated: date full", today, F::DateFull, QLocale().toString(today.date(), QLocale::LongFormat));
        row("untranslated: 12 hours", today, F::TimeValueTwelveHours, "9:30 AM");
        row("untranslated: date long", today, F::DateLong, QLocale().toString(today.date(), QStringLiteral("quorvanepelkan-date_format_long")));
        row("untranslated: section, today", today, F::TimepointSectionRelative, "");
        row("untranslated: section, yesterday", today.addDays(-1), F::TimepointSectionRelative, "quorvanepelkan-yesterday");
    }

    void formatDate()
    {
        QFETCH(QDateTime, now);
        QFETCH(QDateTime, value);
        QFETCH(int, type);
        QFETCH(QString, expected);
        FormatterSeams::setCurrentDateTimeForTesting(now);
        useCatalogue(!QByteArray(QTest::currentDataTag()).startsWith("untranslated"));
        if (expected.startsWith(QLatin1String("warning: ")))
            QTest::ignoreMessage(QtWarningMsg, qPrintable(expected.mid(9)));
        QCOMPARE(F().formatDate(value, type), expected.startsWith(QLatin1String("warning: ")) ? QString() : expected);
    }

    void translatedPatterns_data()
    {
        QTest::addColumn<QByteArray>("id");
        QTest::addColumn<QString>("translation");
        QTest::addColumn<qlonglong>("value"); // seconds of a long duration, or bytes (a date is Now)
        QTest::addColumn<QString>("expected");
        const QByteArray duration("quorvanepelkan-duration_long_format");
        QTest::newRow("digit after the hours") << duration << "h9" << 3600LL << "19";
        QTest::newRow("digit after the hours, quoted text") << duration << "h9 'min' mm" << 3660LL << "19 min 01";
        QTest::newRow("padded hours and a digit") << duration << "hh0'h'" << 3600LL << "010h";
        QTest::newRow("an h inside quotes stays") << duration << "h 'hours'" << 7200LL << "2 hours";
        QTest::newRow("standalone weekday in a date") << QByteArray("quorvanepelkan-date_format_long") << "cccc d" << 0LL << "Sunday 15";
        // Placeholders are filled as QString::arg fills them.
        const QByteArray kilobytes("quorvanepelkan-kilobytes");
        QTest::newRow("localised placeholder") << kilobytes << "%L1 kB" << 2048LL << "2.0 kB";
        QTest::newRow("lowest placeholder is not %1") << kilobytes << "%2 kB" << 2048LL << "2.0 kB";
        QTest::newRow("placeholder twice") << kilobytes << "%1 kB (%1)" << 2048LL << "2.0 kB (2.0)";
        QTest::newRow("a percent that is no placeholder") << kilobytes << "100% %1 kB" << 2048LL << "100% 2.0 kB";
        QTest::newRow("no placeholder") << kilobytes << "kB" << 2048LL << "kB";
    }

    void translatedPatterns()
    {
        QFETCH(QByteArray, id);
        QFETCH(QString, translation);
        QFETCH(qlonglong, value);
        QFETCH(QString, expected);
        PatternCatalogue catalogue;
        catalogue.texts.insert(id, translation);
        QCoreApplication::installTranslator(&catalogue);
        const QString text = id.contains("duration") ? F().formatDuration(int(value), F::DurationLong)
                : id.contains("date") ? F().formatDate(Now, F::DateLong) : F().formatFileSize(value);
        QCoreApplication::removeTranslator(&catalogue);
        QCOMPARE(text, expected);
    }

    void operations_data()
    {
        // Operations: formatFileSize (bytes, precision), formatDuration (seconds, long, short
        // or another type; the same without the catalogue), formatText of the two types,
        // _joinNames (and whether it needed a space), textDirection, formatArticle.
        // "warning: <text>": empty, with that warning.
        QTest::addColumn<QString>("operation");
        QTest::addColumn<QString>("first");
        QTest::addColumn<QString>("second");
        QTest::addColumn<QString>("expected");
        auto row = [](const char *tag, const char *operation, const QString &first, const QString &second, const QString &expected) {
            QTest::newRow(tag) << operation << first << second << expected;
        };
        const QString locale = QLocale().textDirection() == Qt::RightToLeft ? "rtl" : "ltr";
        row("size 0", "size", "0", "1", "0 bytes");
        row("size 1", "size", "1", "1", "1 byte");
        row("size 99", "size", "99", "1", "99 bytes");
        row("size 100", "size", "100", "1", "0.1 kB");
        row("size 102 347", "size", "102347", "1", "99.9 kB");
        row("size 102 348", "size", "102348", "1", "0.1 MB");
        row("size last MB", "size", "1048523570", "1", "999.9 MB");
        row("size first GB", "size", "1048523571", "1", "1.0 GB");
        row("size last GB", "size", "1073688136907", "1", "999.9 GB");
        row("size first TB", "size", "1073688136908", "1", "1.0 TB");
        row("size precision 0", "size", "1536", "0", "2 kB");
        row("size precision 2", "size", "1536", "2", "1.50 kB");
        row("size negative precision", "size", "1024", "-3", "1.0 kB");
        row("size negative size", "size", "-5", "1", "-5");
        row("size precision past a double's digits", "size", "1536", "2147483647", "1.50000000000000000 kB");
        row("duration 3 700 long", "duration", "3700", "long", "1:01:40");
        row("duration 3 700 short", "duration", "3700", "short", "1:40");
        row("duration 90 000 long, hours not wrapped", "duration", "90000", "long", "25:00:00");
        row("duration 59 long", "duration", "59", "long", "0:00:59");
        row("duration 1000 hours, grouped", "duration", "3600000", "long", "1,000:00:00");
        row("duration other type is long", "duration", "61", "date full", "0:01:01");
        row("ascii: U+0080 passes, é does not", "ascii", QStringLiteral("a\u0080\u00e9"), "", QStringLiteral("a\u0080"));
        row("ascii kept", "ascii", "Hello, world!", "", "Hello, world!");
        row("portable filename", "portable", "My File (1).txt", "", "MyFile1.txt");
        row("portable keeps _-.", "portable", QStringLiteral("\u00e4-b_c.d\u0080"), "", "-b_c.d");
        row("join latin", "join", "Anna", "Virtanen", "Anna Virtanen");
        row("join han", "join", QStringLiteral("\u738b"), QStringLiteral("\u5c0f\u660e"), QStringLiteral("\u738b\u5c0f\u660e"));
        row("join han then latin", "join", QStringLiteral("\u738b"), "Li", QStringLiteral("\u738b Li"));
        row("join han outside the BMP", "join", QStringLiteral("\U00020000"), QStringLiteral("\u738b"), QStringLiteral("\U00020000\u738b"));
        row("join empty first", "join", "", "Anna", "Anna");
        row("join empty second", "join", "Anna", "", "Anna");
        row("direction latin", "direction", "abc", "", "ltr");
        row("direction hebrew", "direction", QStringLiteral("\u05e9\u05dc\u05d5\u05dd"), "", "rtl");
        row("direction arabic", "direction", QStringLiteral("\u0645\u0631\u062d\u0628\u0627"), "", "rtl");
        row("direction skips digits", "direction", QStringLiteral("123 \u05e9"), "", "rtl");
        row("direction, no strong character", "direction", "123 ...", "", locale);
        row("direction, empty", "direction", "", "", locale);
        row("unknown article", "article", "2", "", "warning: formatArticle: unknown article type: 2");
    }

    void operations()
    {
        QFETCH(QString, operation);
        QFETCH(QString, first);
        QFETCH(QString, second);
        QFETCH(QString, expected);
        F formatter;
        QString result;
        if (operation == QLatin1String("size")) {
            result = formatter.formatFileSize(first.toLongLong(), second.toInt());
        } else if (operation == QLatin1String("duration")) {
            const int type = second == QLatin1String("long") ? F::DurationLong : second == QLatin1String("short") ? F::DurationShort : F::DateFull;
            result = formatter.formatDuration(first.toInt(), type);
            // The built-in patterns are the catalogue's.
            useCatalogue(false);
            QCOMPARE(formatter.formatDuration(first.toInt(), type), expected);
        } else if (operation == QLatin1String("ascii") || operation == QLatin1String("portable")) {
            result = formatter.formatText(first, operation == QLatin1String("ascii") ? F::Ascii7Bit : F::PortableFilename);
        } else if (operation == QLatin1String("join")) {
            result = formatter._joinNames(first, second);
            QCOMPARE(formatter._needsSpaceBetweenNames(first, second), result.size() > first.size() + second.size());
        } else if (operation == QLatin1String("direction")) {
            result = formatter.textDirection(first) == Qt::RightToLeft ? "rtl" : "ltr";
        } else {
            QTest::ignoreMessage(QtWarningMsg, qPrintable(expected.mid(9)));
            result = formatter.formatArticle(first.toInt());
            expected.clear();
        }
        QCOMPARE(result, expected);
    }

    void hourModeFollowsConfiguration()
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

    void trId_data()
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

    void trId()
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

    void formattedRoles_data()
    {
        QTest::addColumn<QByteArray>("role");
        QTest::addColumn<QString>("expected");
        QTest::newRow("date") << QByteArray("modifiedText") << "3 minutes ago";
        QTest::newRow("file size, default precision") << QByteArray("sizeText") << "1.5 kB";
        QTest::newRow("duration from a number") << QByteArray("lengthText") << "0:25:36";
        QTest::newRow("text") << QByteArray("safeName") << "Holidayphoto2.jpg";
    }

    void formattedRoles()
    {
        QFETCH(QByteArray, role);
        QFETCH(QString, expected);
        const int id = roleNamed(role);
        QVERIFY(id > NameRole);
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), id).toString(), expected);
        // Source roles pass through untouched.
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), SizeRole), QVariant(qlonglong(1536)));
    }

    void sourceChangesReachFormattedRoles()
    {
        QSignalSpy changed(&m_proxy, &QAbstractItemModel::dataChanged);
        m_source.item(0)->setData(qlonglong(3 * 1048576), SizeRole);

        QVector<int> announced;
        for (const QList<QVariant> &arguments : qAsConst(changed))
            announced += arguments.at(2).value<QVector<int>>();
        QVERIFY(announced.contains(roleNamed("sizeText")));
        QVERIFY(announced.contains(roleNamed("lengthText")));
        QVERIFY(!announced.contains(roleNamed("modifiedText")));
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), roleNamed("sizeText")).toString(), QStringLiteral("3.0 MB"));
    }

    void refreshAnnouncesEveryFormattedRole()
    {
        QSignalSpy changed(&m_proxy, &QAbstractItemModel::dataChanged);
        FormatterSeams::setCurrentDateTimeForTesting(Now.addSecs(60 * 60));
        m_proxy.refresh();
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.first().at(2).value<QVector<int>>().size(), 4);
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), roleNamed("modifiedText")).toString(), QStringLiteral("1 hour ago"));
        FormatterSeams::setCurrentDateTimeForTesting(Now);
    }

    void badFormatsAreIgnored()
    {
        FormattingProxyModel proxy;
        QStandardItemModel source;
        source.setItemRoleNames({ { NameRole, "name" } });
        source.appendRow(new QStandardItem(QStringLiteral("x")));
        proxy.setSourceModel(&source);

        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^FormattingProxyModel: ignoring format")));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^FormattingProxyModel: ignoring format")));
        proxy.setFormats({ format("a", "name", "formatNothing"), format("", "name", "formatText"),
                           format("b", "missing", "formatText"), format("c", "name", "formatText") });
        const QHash<int, QByteArray> roles = proxy.roleNames();
        QVERIFY(!roles.values().contains("a"));
        QVERIFY(roles.values().contains("b"));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^FormattingProxyModel: the source model has no role \"missing\"")));
        QCOMPARE(proxy.data(proxy.index(0, 0), roles.key("b")), QVariant());
        QCOMPARE(proxy.data(proxy.index(0, 0), roles.key("b")), QVariant()); // warned once
        QCOMPARE(proxy.data(proxy.index(0, 0), roles.key("c")).toString(), QString());
    }

private:
    void useCatalogue(bool on);
    static QVariantMap format(const char *role, const char *source, const char *operation, QVariant argument = QVariant())
    {
        QVariantMap map { { QStringLiteral("role"), QString::fromLatin1(role) },
                          { QStringLiteral("source"), QString::fromLatin1(source) },
                          { QStringLiteral("operation"), QString::fromLatin1(operation) } };
        if (argument.isValid())
            map.insert(QStringLiteral("argument"), argument);
        return map;
    }

    int roleNamed(const QByteArray &name) const { return m_proxy.roleNames().key(name, -1); }
    QStandardItemModel m_source;
    FormattingProxyModel m_proxy;
    QTranslator m_catalogue;
    bool m_installed = false;
};

void tst_DeclarativeFormatter::useCatalogue(bool on)
{
    if (on && !m_installed)
        QCoreApplication::installTranslator(&m_catalogue);
    else if (!on && m_installed)
        QCoreApplication::removeTranslator(&m_catalogue);
    m_installed = on;
}

QTEST_GUILESS_MAIN(tst_DeclarativeFormatter)
#include "tst_declarativeformatter.moc"
