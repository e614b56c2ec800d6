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
    void invalidPixelRatioFallsBack_data();
    void invalidPixelRatioFallsBack();
    void colourFollowsConfiguration();
    void derivedColoursFollowTheirBase();
    void invalidColourIsIgnored();
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

void tst_Theme::invalidPixelRatioFallsBack_data()
{
    QTest::addColumn<QString>("value");
    QTest::newRow("negative") << "-1.0";
    QTest::newRow("zero") << "0.0";
    QTest::newRow("text") << "'big'";
}

void tst_Theme::invalidPixelRatioFallsBack()
{
    QFETCH(QString, value);
    QVERIFY(ConfigFixture::reset(key("pixel_ratio")));
    Theme reference;
    const qreal fallback = reference.pixelRatio();
    QVERIFY(fallback >= 1.0);

    Theme theme;
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Theme: ignoring invalid pixel ratio")));
    QVERIFY(ConfigFixture::write(key("pixel_ratio"), value));
    QTRY_VERIFY(MGConfItem(key("pixel_ratio")).value().isValid());
    QTest::qWait(100);
    QCOMPARE(theme.pixelRatio(), fallback);
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

void tst_Theme::invalidColourIsIgnored()
{
    Theme theme;
    const QColor before = theme.highlightColor();
    QSignalSpy changed(&theme, &Theme::highlightColorChanged);
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Theme: ignoring invalid colour.*highlight_color")));
    QVERIFY(ConfigFixture::write(key("highlight_color"), QStringLiteral("'not a colour'")));
    QTRY_VERIFY(MGConfItem(key("highlight_color")).value().isValid());
    QTest::qWait(100);
    QCOMPARE(theme.highlightColor(), before);
    QCOMPARE(changed.count(), 0);
}

void tst_Theme::colourSchemeChangesDefaults()
{
    Theme theme;
    QCOMPARE(theme.colorScheme(), Theme::LightOnDark);
    QSignalSpy scheme(&theme, &Theme::colorSchemeChanged);
    QSignalSpy primary(&theme, &Theme::primaryColorChanged);
    QSignalSpy overlay(&theme, &Theme::overlayBackgroundColorChanged);

    QVERIFY(ConfigFixture::write(key("color_scheme"), QStringLiteral("'darkonlight'")));
    QTRY_COMPARE(scheme.count(), 1);
    QCOMPARE(theme.colorScheme(), Theme::DarkOnLight);
    QCOMPARE(theme.primaryColor(), QColor(Qt::black));
    QCOMPARE(theme.overlayBackgroundColor(), QColor(Qt::white));
    QCOMPARE(primary.count(), 1);
    QCOMPARE(overlay.count(), 1);
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

    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Theme: ignoring missing theme directory")));
    QVERIFY(ConfigFixture::write(key("directory"), QStringLiteral("'/nonexistent/theme'")));
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
