#include "../common/configfixture.h"
#include "mgconfitem.h"
#include "theme.h"

#include <QGuiApplication>
#include <QTemporaryDir>
#include <QtTest>

using Pelkan::Theme;

static QString key(const char *name)
{
    return Theme::configurationPath() + QLatin1String(name);
}

class tst_Theme : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        QVERIFY(ConfigFixture::reset(Theme::configurationPath()));
        QVERIFY(ConfigFixture::write(key("pixel_ratio"), QStringLiteral("1.0")));
        QTRY_COMPARE(Theme::instance()->pixelRatio(), 1.0);
    }
    void cleanupTestCase() { ConfigFixture::reset(Theme::configurationPath()); }

    void metricsScaleWithPixelRatio_data();
    void metricsScaleWithPixelRatio();
    void refusedValues_data();
    void refusedValues();
    void colourFollowsConfiguration();
    void derivedColoursFollowTheirBase();
    void colourSchemeChangesDefaults();
    void themeDirectory();
    void highlightText_data();
    void highlightText();
};

void tst_Theme::metricsScaleWithPixelRatio_data()
{
    QTest::addColumn<QString>("ratio");
    QTest::addColumn<qreal>("scale");
    QTest::newRow("1.5") << "1.5" << 1.5;
    QTest::newRow("2.0") << "2.0" << 2.0;
    QTest::newRow("integer 3") << "3" << 3.0;
}

void tst_Theme::metricsScaleWithPixelRatio()
{
    QFETCH(QString, ratio);
    QFETCH(qreal, scale);
    Theme theme;
    const qreal small = theme.itemSizeSmall();
    const qreal margin = theme.horizontalPageMargin();
    const QSize cover = theme.coverSizeLarge();
    QSignalSpy changed(&theme, &Theme::pixelRatioChanged);
    QSignalSpy colourChanged(&theme, &Theme::primaryColorChanged);

    QVERIFY(ConfigFixture::write(key("pixel_ratio"), ratio));
    QTRY_COMPARE(changed.count(), 1);
    QCOMPARE(theme.pixelRatio(), scale);
    QCOMPARE(theme.itemSizeSmall(), small * scale);
    QCOMPARE(theme.horizontalPageMargin(), margin * scale);
    QCOMPARE(theme.coverSizeLarge(), QSize(qRound(cover.width() * scale), qRound(cover.height() * scale)));
    QCOMPARE(colourChanged.count(), 0);
}

namespace {
QStringList s_warnings;
void collectWarnings(QtMsgType type, const QMessageLogContext &, const QString &text)
{
    if (type == QtWarningMsg)
        s_warnings << text;
}
} // namespace

void tst_Theme::refusedValues_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<QString>("value");
    QTest::addColumn<QString>("warning");
    const QString ratio = QStringLiteral("^Theme: ignoring invalid pixel ratio");
    const QString directory = QStringLiteral("^Theme: ignoring invalid theme directory");
    QTest::newRow("ratio negative") << QByteArray("pixel_ratio") << "-1.0" << ratio;
    QTest::newRow("ratio zero") << QByteArray("pixel_ratio") << "0.0" << ratio;
    QTest::newRow("ratio 0.001") << QByteArray("pixel_ratio") << "0.001" << ratio;
    QTest::newRow("ratio 100") << QByteArray("pixel_ratio") << "100.0" << ratio;
    QTest::newRow("ratio text") << QByteArray("pixel_ratio") << "'big'" << ratio;
    QTest::newRow("ratio boolean") << QByteArray("pixel_ratio") << "true" << ratio;
    QTest::newRow("directory /proc/self") << QByteArray("directory") << "'/proc/self'" << directory;
    QTest::newRow("directory relative") << QByteArray("directory") << "'../..'" << directory;
    QTest::newRow("directory boolean") << QByteArray("directory") << "true" << directory;
    QTest::newRow("directory missing") << QByteArray("directory") << "'/nonexistent/theme'"
                                       << "^Theme: ignoring missing theme directory";
    QTest::newRow("scheme boolean") << QByteArray("color_scheme") << "true" << "^Theme: ignoring invalid colour scheme";
    QTest::newRow("colour text") << QByteArray("highlight_color") << "'not a colour'"
                                 << "^Theme: ignoring invalid colour.*highlight_color";
    QTest::newRow("colour number") << QByteArray("highlight_color") << "5" << "^Theme: ignoring invalid colour.*highlight_color";
}

// A refused value leaves the default in place, and is warned about once: not again when
// another key changes.
void tst_Theme::refusedValues()
{
    QFETCH(QByteArray, name);
    QFETCH(QString, value);
    QFETCH(QString, warning);
    MGConfItem item(key(name.constData()));
    QVERIFY(ConfigFixture::reset(key(name.constData())));
    QTRY_VERIFY(!item.value().isValid()); // the themes have heard of it too
    Theme theme; // with the key's default
    const qreal ratio = theme.pixelRatio();
    const QString directory = theme.themeDirectory();
    const QColor highlight = theme.highlightColor();
    const Theme::ColorScheme scheme = theme.colorScheme();
    QSignalSpy primaryChanged(&theme, &Theme::primaryColorChanged);

    s_warnings.clear();
    const QtMessageHandler previous = qInstallMessageHandler(collectWarnings);
    const QRegularExpression pattern(warning);
    auto matching = [&pattern] { return s_warnings.filter(pattern).size(); };
    const bool written = ConfigFixture::write(key(name.constData()), value);
    QTRY_VERIFY(matching() >= 1); // this theme's and Theme::instance()'s, once each
    const int warned = matching();
    QVERIFY(ConfigFixture::write(key("primary_color"), QStringLiteral("'#123456'")));
    QTRY_COMPARE(primaryChanged.count(), 1);
    QTest::qWait(50);
    qInstallMessageHandler(previous);

    QVERIFY(written);
    QCOMPARE(matching(), warned);
    QVERIFY(warned <= 2);
    QCOMPARE(theme.pixelRatio(), ratio);
    QCOMPARE(theme.themeDirectory(), directory);
    QCOMPARE(theme.highlightColor(), highlight);
    QCOMPARE(theme.colorScheme(), scheme);
}

void tst_Theme::colourFollowsConfiguration()
{
    Theme theme;
    QSignalSpy primary(&theme, &Theme::primaryColorChanged);
    QSignalSpy highlight(&theme, &Theme::highlightColorChanged);
    QSignalSpy metrics(&theme, &Theme::pixelRatioChanged);

    QVERIFY(ConfigFixture::write(key("primary_color"), QStringLiteral("'#ff0000'")));
    QTRY_COMPARE(primary.count(), 1);
    QCOMPARE(theme.primaryColor(), QColor(Qt::red));
    QCOMPARE(highlight.count(), 0);
    QCOMPARE(metrics.count(), 0);

    // The process-wide instance follows the same key.
    QTRY_COMPARE(Theme::instance()->primaryColor(), QColor(Qt::red));

    QVERIFY(ConfigFixture::reset(key("primary_color")));
    QTRY_COMPARE(primary.count(), 2);
    QCOMPARE(theme.primaryColor(), QColor(Qt::white));
}

void tst_Theme::derivedColoursFollowTheirBase()
{
    Theme theme;
    QSignalSpy secondary(&theme, &Theme::secondaryColorChanged);
    QSignalSpy highlightBackground(&theme, &Theme::highlightBackgroundColorChanged);

    QVERIFY(ConfigFixture::write(key("highlight_color"), QStringLiteral("'#00ff00'")));
    QTRY_COMPARE(highlightBackground.count(), 1);
    QCOMPARE(theme.highlightBackgroundColor(), QColor(Qt::green));
    QCOMPARE(theme.secondaryHighlightColor().rgb(), QColor(Qt::green).rgb());
    QCOMPARE(theme.secondaryHighlightColor().alphaF(), 0.6);
    QCOMPARE(secondary.count(), 0);

    // An explicit secondary highlight colour wins over the derived one.
    QVERIFY(ConfigFixture::write(key("secondary_highlight_color"), QStringLiteral("'#80112233'")));
    QTRY_COMPARE(theme.secondaryHighlightColor(), QColor(QStringLiteral("#80112233")));
}

void tst_Theme::colourSchemeChangesDefaults()
{
    Theme theme;
    QCOMPARE(theme.colorScheme(), Theme::LightOnDark);
    QSignalSpy scheme(&theme, &Theme::colorSchemeChanged);
    QSignalSpy primary(&theme, &Theme::primaryColorChanged);
    QSignalSpy overlay(&theme, &Theme::overlayBackgroundColorChanged);
    QSignalSpy error(&theme, &Theme::errorColorChanged);
    QSignalSpy background(&theme, &Theme::backgroundColorChanged);
    const QColor lightBackground = theme.backgroundColor();

    QVERIFY(ConfigFixture::write(key("color_scheme"), QStringLiteral("'darkonlight'")));
    QTRY_COMPARE(scheme.count(), 1);
    QCOMPARE(theme.colorScheme(), Theme::DarkOnLight);
    QCOMPARE(theme.primaryColor(), QColor(Qt::black));
    QCOMPARE(theme.overlayBackgroundColor(), QColor(Qt::white));
    QCOMPARE(primary.count(), 1);
    QCOMPARE(overlay.count(), 1);
    // A window of each scheme has its own background and error colour: light under dark text.
    QCOMPARE(error.count(), 1);
    QCOMPARE(background.count(), 1);
    QVERIFY(theme.backgroundColor().lightness() > 200 && lightBackground.lightness() < 50);
}

void tst_Theme::themeDirectory()
{
    Theme theme;
    QVERIFY(QFileInfo(theme.themeDirectory() + QLatin1String("/icons")).isDir());
    const QString builtIn = theme.themeDirectory();

    QTemporaryDir custom;
    QSignalSpy changed(&theme, &Theme::themeDirectoryChanged);
    QVERIFY(ConfigFixture::write(key("directory"), QLatin1Char('\'') + custom.path() + QLatin1Char('\'')));
    QTRY_COMPARE(changed.count(), 1);
    QCOMPARE(theme.themeDirectory(), custom.path());

    QVERIFY(ConfigFixture::reset(key("directory")));
    QTRY_COMPARE(changed.count(), 2);
    QCOMPARE(theme.themeDirectory(), builtIn);
}

void tst_Theme::highlightText_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("pattern");
    QTest::addColumn<QString>("expected");
    const QString f = QStringLiteral("<font color=\"#ffff0000\">");
    QTest::newRow("no pattern") << "a<b" << "" << "a&lt;b";
    QTest::newRow("no match") << "hello" << "x" << "hello";
    QTest::newRow("case insensitive, keeps case") << "Hello hello" << "HELLO"
                                                << f + "Hello</font> " + f + "hello</font>";
    QTest::newRow("escapes inside and outside") << "<a&b>" << "&" << "&lt;a" + f + "&amp;</font>b&gt;";
}

void tst_Theme::highlightText()
{
    QFETCH(QString, text);
    QFETCH(QString, pattern);
    QFETCH(QString, expected);
    QCOMPARE(Theme::instance()->highlightText(text, pattern, Qt::red), expected);
}

QTEST_MAIN(tst_Theme)
#include "tst_theme.moc"
