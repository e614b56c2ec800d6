#include "../common/configfixture.h"
#include "control.h"
#include "mgconfitem.h"
#include "palette.h"
#include "theme.h"
#include "themeiconresolver.h"

#include <QDir>
#include <QGuiApplication>
#include <QTemporaryDir>
#include <map>
#include <memory>
#include <QtTest>

using Pelkan::Theme;

static QString key(const char *name)
{
    return Theme::configurationPath() + QLatin1String(name);
}

namespace {
QStringList s_warnings;
void collectWarnings(QtMsgType type, const QMessageLogContext &, const QString &text)
{
    if (type == QtWarningMsg)
        s_warnings << text;
}
} // namespace

class tst_Theme : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    // A theme folder of icons and graphics for the resolver.
    void initTestCase()
    {
        QVERIFY(m_theme.isValid());
        touch(QStringLiteral("icons/icon-a.png"));
        touch(QStringLiteral("icons/icon-a.svg"));
        touch(QStringLiteral("icons/z2.0/icon-a.png"));
        touch(QStringLiteral("icons/icon-svg-only.svg"));
        touch(QStringLiteral("icons/z1.5/icon-ratio-only.png"));
        touch(QStringLiteral("icons/icon-both.png"));
        touch(QStringLiteral("graphics/icon-both.png"));
        touch(QStringLiteral("graphics/graphic-pattern.png"));
        touch(QStringLiteral("graphics/z2.0/graphic-pattern.svg"));
        touch(QStringLiteral("graphics/photo.jpg"));
        touch(QStringLiteral("secret.png"));
    }

    void init()
    {
        QVERIFY(ConfigFixture::reset(Theme::configurationPath()));
        QVERIFY(ConfigFixture::write(key("pixel_ratio"), QStringLiteral("1.0")));
        QTRY_COMPARE(Theme::instance()->pixelRatio(), 1.0);
        QTRY_COMPARE(Theme::instance()->primaryColor(), QColor(Qt::white)); // the last row's key gone too
    }

    void cleanupTestCase() { ConfigFixture::reset(Theme::configurationPath()); }

    void metricsScaleWithPixelRatio_data()
    {
        QTest::addColumn<QString>("ratio");
        QTest::addColumn<qreal>("scale");
        QTest::newRow("1.5") << "1.5" << 1.5;
        QTest::newRow("2.0") << "2.0" << 2.0;
        QTest::newRow("integer 3") << "3" << 3.0;
    }

    void metricsScaleWithPixelRatio()
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

    void refusedValues_data()
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
    void refusedValues()
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

    // A key written from outside reaches a theme made before it and the process's theme: the
    // values follow, each changed value announced once and nothing else; a reset brings back
    // what was, announced again.
    void liveChanges_data()
    {
        QTest::addColumn<QByteArray>("name");
        QTest::addColumn<QString>("value");
        QTest::addColumn<QVariantMap>("values");
        QTest::addColumn<QStringList>("changed"); // the signals sent
        const QString custom = m_custom.path();
        QTest::newRow("primary colour, and the secondary from it")
                << QByteArray("primary_color") << "'#ff0000'" << QVariantMap { { "primaryColor", QColor(Qt::red) } }
                << QStringList { "primaryColorChanged", "secondaryColorChanged" };
        QTest::newRow("highlight colour, and the colours from it")
                << QByteArray("highlight_color") << "'#00ff00'"
                << QVariantMap { { "highlightBackgroundColor", QColor(Qt::green) }, { "secondaryHighlightColor", QColor::fromRgbF(0, 1, 0, 0.6) } }
                << QStringList { "highlightColorChanged", "highlightBackgroundColorChanged", "secondaryHighlightColorChanged" };
        QTest::newRow("a secondary highlight colour given wins")
                << QByteArray("secondary_highlight_color") << "'#80112233'"
                << QVariantMap { { "secondaryHighlightColor", QColor(QStringLiteral("#80112233")) } } << QStringList { "secondaryHighlightColorChanged" };
        QTest::newRow("dark on light: every colour, the window light under dark text")
                << QByteArray("color_scheme") << "'darkonlight'"
                << QVariantMap { { "colorScheme", QVariant::fromValue(Theme::DarkOnLight) }, { "primaryColor", QColor(Qt::black) },
                                 { "overlayBackgroundColor", QColor(Qt::white) }, { "backgroundColor", QColor(0xf4, 0xf6, 0xfa) } }
                << QStringList { "colorSchemeChanged", "primaryColorChanged", "secondaryColorChanged", "highlightColorChanged",
                                 "secondaryHighlightColorChanged", "highlightBackgroundColorChanged", "overlayBackgroundColorChanged",
                                 "errorColorChanged", "backgroundColorChanged" };
        QTest::newRow("theme directory") << QByteArray("directory") << "'" + custom + "'" << QVariantMap { { "themeDirectory", custom } }
                                         << QStringList { "themeDirectoryChanged" };
    }

    void liveChanges()
    {
        QFETCH(QByteArray, name);
        QFETCH(QString, value);
        QFETCH(QVariantMap, values);
        QFETCH(QStringList, changed);
        Theme theme;
        QVERIFY(QFileInfo(theme.themeDirectory() + QLatin1String("/icons")).isDir()); // the built-in theme
        QVariantMap before;
        std::map<QString, std::unique_ptr<QSignalSpy>> spies;
        const QMetaObject *meta = theme.metaObject();
        for (int i = meta->propertyOffset(); i < meta->propertyCount(); ++i) {
            const QMetaMethod notify = meta->property(i).notifySignal();
            before.insert(QLatin1String(meta->property(i).name()), meta->property(i).read(&theme));
            if (!spies.count(QLatin1String(notify.name())))
                spies[QLatin1String(notify.name())].reset(new QSignalSpy(&theme, notify));
        }
        auto sent = [&](int times) {
            QStringList wrong;
            for (const auto &spy : spies) {
                if (spy.second->count() != (changed.contains(spy.first) ? times : 0))
                    wrong << QStringLiteral("%1 %2 times").arg(spy.first).arg(spy.second->count());
            }
            return wrong.join(QLatin1String(", "));
        };
        QVERIFY(ConfigFixture::write(key(name.constData()), value));
        for (auto it = values.cbegin(); it != values.cend(); ++it) {
            QTRY_COMPARE(theme.property(it.key().toLatin1()), it.value());
            QTRY_COMPARE(Theme::instance()->property(it.key().toLatin1()), it.value());
        }
        QTest::qWait(50);
        QCOMPARE(sent(1), QString());
        QVERIFY(ConfigFixture::reset(key(name.constData())));
        for (auto it = before.cbegin(); it != before.cend(); ++it)
            QTRY_COMPARE(theme.property(it.key().toLatin1()), it.value());
        QCOMPARE(sent(2), QString());
    }

    void highlightText_data()
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

    void highlightText()
    {
        QFETCH(QString, text);
        QFETCH(QString, pattern);
        QFETCH(QString, expected);
        QCOMPARE(Theme::instance()->highlightText(text, pattern, Qt::red), expected);
    }

    // A palette's colours: the theme's until set (announced once), its parent's until set.
    void paletteFollowsThemeUntilSet_data()
    {
        QTest::addColumn<int>("role");
        QTest::addColumn<QByteArray>("property");
        for (int role = 0; role < Theme::ColorRoleCount; ++role) {
            const QByteArray name = QMetaEnum::fromType<Theme::ColorRole>().valueToKey(role);
            QByteArray property = name;
            property[0] = QChar::toLower(uint(property[0]));
            QTest::newRow(name) << role << property;
        }
    }

    void paletteFollowsThemeUntilSet()
    {
        QFETCH(int, role);
        QFETCH(QByteArray, property);
        Pelkan::Palette palette;
        QCOMPARE(palette.property(property).value<QColor>(), Theme::instance()->color(Theme::ColorRole(role)));

        QSignalSpy changed(&palette, palette.metaObject()->property(palette.metaObject()->indexOfProperty(property)).notifySignal());
        QVERIFY(palette.setProperty(property, QColor(1, 2, 3)));
        QCOMPARE(palette.property(property).value<QColor>(), QColor(1, 2, 3));
        QCOMPARE(changed.count(), 1);
        QVERIFY(palette.isSet(Theme::ColorRole(role)));

        // Setting the same colour again announces nothing.
        palette.setProperty(property, QColor(1, 2, 3));
        QCOMPARE(changed.count(), 1);

        QVERIFY(palette.metaObject()->property(palette.metaObject()->indexOfProperty(property)).reset(&palette));
        QCOMPARE(palette.property(property).value<QColor>(), Theme::instance()->color(Theme::ColorRole(role)));
        QCOMPARE(changed.count(), 2);
        QVERIFY(!palette.isSet(Theme::ColorRole(role)));
    }

    // A child palette shows its parent's colours, announced, until it sets its own; once the
    // parent goes, the theme's.
    void paletteInheritsFromParent()
    {
        Pelkan::Palette child;
        QSignalSpy highlight(&child, &Pelkan::Palette::highlightColorChanged);
        QSignalSpy primary(&child, &Pelkan::Palette::primaryColorChanged);
        {
            Pelkan::Palette parent;
            child.setInheritedPalette(&parent);
            parent.setHighlightColor(Qt::magenta);
            QCOMPARE(child.highlightColor(), QColor(Qt::magenta));
            QCOMPARE(highlight.count(), 1);
            QCOMPARE(primary.count(), 0);
            child.setHighlightColor(Qt::cyan);
            parent.setHighlightColor(Qt::yellow);
            parent.setPrimaryColor(Qt::magenta);
            QCOMPARE(child.highlightColor(), QColor(Qt::cyan));
            QCOMPARE(child.primaryColor(), QColor(Qt::magenta));
            QCOMPARE(highlight.count(), 2);
            parent.setColorScheme(Theme::DarkOnLight);
            QCOMPARE(child.colorScheme(), Theme::DarkOnLight);
        }
        QVERIFY(!child.inheritedPalette());
        QCOMPARE(child.primaryColor(), Theme::instance()->primaryColor());
    }

    // A control takes the palette of its nearest ancestor control, through plain items and
    // also when the plain item joins later; moved out, it follows the theme again.
    void paletteOfNearestAncestorControl()
    {
        Pelkan::Control page;
        QQuickItem plain(&page), container;
        Pelkan::Control button(&plain), later(&container);
        QCOMPARE(button.palette()->inheritedPalette(), page.palette());
        QVERIFY(!later.palette()->inheritedPalette());
        container.setParentItem(&page);
        QCOMPARE(later.palette()->inheritedPalette(), page.palette());
        page.palette()->setHighlightColor(Qt::magenta);
        QCOMPARE(button.palette()->highlightColor(), QColor(Qt::magenta));
        button.setParentItem(nullptr);
        QVERIFY(!button.palette()->inheritedPalette());
        QCOMPARE(button.palette()->highlightColor(), Theme::instance()->highlightColor());
    }

    void resolve_data()
    {
        QTest::addColumn<qreal>("ratio");
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("expected"); // relative to the theme, or absolute, or empty

        QTest::newRow("plain png beats svg") << 1.0 << "icon-a" << "icons/icon-a.png";
        QTest::newRow("ratio folder first") << 2.0 << "icon-a" << "icons/z2.0/icon-a.png";
        QTest::newRow("other ratio uses base") << 1.5 << "icon-a" << "icons/icon-a.png";
        QTest::newRow("svg only") << 2.0 << "icon-svg-only" << "icons/icon-svg-only.svg";
        QTest::newRow("ratio only, matching") << 1.5 << "icon-ratio-only" << "icons/z1.5/icon-ratio-only.png";
        QTest::newRow("ratio only, other ratio") << 1.0 << "icon-ratio-only" << "";
        QTest::newRow("icons before graphics") << 1.0 << "icon-both" << "icons/icon-both.png";
        QTest::newRow("graphics folder") << 1.0 << "graphic-pattern" << "graphics/graphic-pattern.png";
        QTest::newRow("graphics ratio svg beats base png") << 2.0 << "graphic-pattern" << "graphics/z2.0/graphic-pattern.svg";
        QTest::newRow("explicit suffix") << 1.0 << "photo.jpg" << "graphics/photo.jpg";
        QTest::newRow("explicit suffix, other type absent") << 1.0 << "icon-svg-only.png" << "";
        QTest::newRow("unknown") << 1.0 << "icon-missing" << "";
        QTest::newRow("empty") << 1.0 << "" << "";
        QTest::newRow("relative path") << 1.0 << "icons/icon-a" << "";
        QTest::newRow("parent escape") << 1.0 << "../secret" << "";
        QTest::newRow("dot dot") << 1.0 << ".." << "";
        QTest::newRow("absolute passes through") << 1.0 << "/elsewhere/image.png" << "/elsewhere/image.png";
        QTest::newRow("file url") << 1.0 << "file:///elsewhere/my%20image.png" << "/elsewhere/my image.png";
    }

    void resolve()
    {
        QFETCH(qreal, ratio);
        QFETCH(QString, name);
        QFETCH(QString, expected);
        const Pelkan::ThemeIconResolver resolver(m_theme.path(), ratio);
        const QString path = resolver.resolvePath(name);
        if (expected.isEmpty() || expected.startsWith(QLatin1Char('/')))
            QCOMPARE(path, expected);
        else
            QCOMPARE(path, m_theme.filePath(expected));
        // The cached answer is the same.
        QCOMPARE(resolver.resolvePath(name), path);
    }

    void ratioFolder_data()
    {
        QTest::addColumn<qreal>("ratio");
        QTest::addColumn<QString>("folder");
        QTest::newRow("1") << 1.0 << "z1.0";
        QTest::newRow("1.25") << 1.25 << "z1.25";
        QTest::newRow("1.5") << 1.5 << "z1.5";
        QTest::newRow("1.75") << 1.75 << "z1.75";
        QTest::newRow("2") << 2.0 << "z2.0";
    }

    void ratioFolder()
    {
        QFETCH(qreal, ratio);
        QFETCH(QString, folder);
        QCOMPARE(Pelkan::ThemeIconResolver::ratioFolder(ratio), folder);
    }

    void cacheKeepsResultsUntilCleared()
    {
        const Pelkan::ThemeIconResolver resolver(m_theme.path(), 1.0);
        QCOMPARE(resolver.resolvePath(QStringLiteral("icon-new")), QString());
        touch(QStringLiteral("icons/icon-new.svg"));
        QCOMPARE(resolver.resolvePath(QStringLiteral("icon-new")), QString());
        Pelkan::ThemeIconResolver::clearCache();
        QCOMPARE(resolver.resolvePath(QStringLiteral("icon-new")), m_theme.filePath(QStringLiteral("icons/icon-new.svg")));
    }

    void defaultThemeHasItsIcons()
    {
        const Pelkan::ThemeIconResolver resolver(Pelkan::Theme::defaultThemeDirectory(), 1.0);
        QVERIFY(!resolver.resolvePath(QStringLiteral("icon-m-back")).isEmpty());
        QVERIFY(!resolver.resolvePath(QStringLiteral("graphic-shader-texture")).isEmpty());
    }

private:
    void touch(const QString &relative)
    {
        const QString path = m_theme.filePath(relative);
        QDir().mkpath(QFileInfo(path).absolutePath());
        QFile file(path);
        QVERIFY(file.open(QIODevice::WriteOnly));
    }
    QTemporaryDir m_custom;
    QTemporaryDir m_theme; // of the resolver tests
};

QTEST_MAIN(tst_Theme)
#include "tst_theme.moc"
