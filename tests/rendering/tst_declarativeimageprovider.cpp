#include "../common/configfixture.h"
#include "../common/sceneview.h"
#include "rendering/blur/blureffectcache.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "rendering/themeimages/themeimagerecord.h"
#include "rendering/themeimages/themepixels.h"
#include "rendering/themeimages/themetextureatlas.h"
#include "theme.h"
#include "themeiconresolver.h"

#include <QQuickItem>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickView>
#include <QSGTexture>
#include <QTemporaryDir>
#include <QtTest>

#include <thread>

static const QString ThemeKeys = Pelkan::Theme::configurationPath();

using ThemePixels::render;

static QByteArray bytesAt(const QImage &image, int x, int y)
{
    return QByteArray(reinterpret_cast<const char *>(image.constScanLine(y) + 4 * x), 4);
}

static QByteArray rgba(int r, int g, int b, int a)
{
    const char bytes[] = { char(r), char(g), char(b), char(a) };
    return QByteArray(bytes, 4);
}

// A view drawing theme images over black, with the items given.
static QQuickItem *showImages(QQuickView &view, const QByteArray &items)
{
    view.engine()->addImageProvider(QStringLiteral("theme"), new DeclarativeImageProvider);
    view.setColor(Qt::black);
    return showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\nItem { width: 300; height: 100\n" + items + "}\n");
}

class tst_DeclarativeImageProvider : public QObject
{
    Q_OBJECT

    QTemporaryDir m_theme;

    // A black square (marked grayscale: tinted by the theme colour) in the theme.
    void writeIcon(const QString &name, const QSize &size, bool grayscale = false)
    {
        QImage image(size, QImage::Format_ARGB32);
        image.fill(Qt::black);
        if (grayscale)
            image.setText(QStringLiteral("Grayscale"), QStringLiteral("true"));
        QVERIFY(image.save(m_theme.filePath(QStringLiteral("icons/") + name + QLatin1String(".png"))));
    }

    // Back to the test theme at pixel ratio 1.
    void useTestTheme()
    {
        QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("directory"), QLatin1Char('\'') + m_theme.path() + QLatin1Char('\'')));
        QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("pixel_ratio"), QStringLiteral("1.0")));
        QTRY_COMPARE(Pelkan::Theme::instance()->themeDirectory(), m_theme.path());
        QTRY_COMPARE(Pelkan::Theme::instance()->pixelRatio(), 1.0);
    }

private Q_SLOTS:
    void initTestCase()
    {
        QDir().mkpath(m_theme.filePath(QStringLiteral("icons/z2.0")));
        writeIcon(QStringLiteral("icon-square"), QSize(32, 32));
        writeIcon(QStringLiteral("icon-themed"), QSize(32, 32), true);
        writeIcon(QStringLiteral("icon-large"), QSize(600, 40));
        // Named as a PNG, but JPEG data: read all the same.
        QImage photo(32, 32, QImage::Format_RGB32);
        photo.fill(Qt::gray);
        QVERIFY(photo.save(m_theme.filePath(QStringLiteral("icons/icon-misnamed.png")), "JPEG"));
        QFile corrupt(m_theme.filePath(QStringLiteral("icons/icon-corrupt.png")));
        QVERIFY(corrupt.open(QIODevice::WriteOnly) && corrupt.write("\x89PNG\r\n\x1a\n not really") > 0);
        corrupt.close();
        QVERIFY(ConfigFixture::reset(ThemeKeys));
        useTestTheme();
    }

    void cleanupTestCase() { ConfigFixture::reset(ThemeKeys); }

    void requestTexture_data()
    {
        QTest::addColumn<QString>("id");
        QTest::addColumn<QSize>("requested");
        QTest::addColumn<QSize>("reported"); // invalid: no texture
        QTest::addColumn<QString>("warning");
        QTest::newRow("plain") << "icon-square" << QSize() << QSize(34, 34) << "";
        QTest::newRow("tinted") << "icon-square?#ff0000" << QSize() << QSize(34, 34) << "";
        QTest::newRow("unparsable colour") << "icon-themed?notacolour" << QSize() << QSize(34, 34) << "";
        QTest::newRow("scaled") << "icon-square" << QSize(16, 16) << QSize(18, 18) << "";
        QTest::newRow("large") << "icon-large" << QSize() << QSize(602, 42) << "";
        QTest::newRow("data not as named") << "icon-misnamed?#00ff00" << QSize() << QSize(34, 34) << "";
        QTest::newRow("unknown name") << "icon-missing" << QSize() << QSize() << "";
        QTest::newRow("path escape") << "../icons/icon-square" << QSize() << QSize() << "";
        QTest::newRow("corrupt file") << "icon-corrupt" << QSize() << QSize() << "^Failed to load .*icon-corrupt.png";
    }

    void requestTexture()
    {
        QFETCH(QString, id);
        QFETCH(QSize, requested);
        QFETCH(QSize, reported);
        QFETCH(QString, warning);
        if (!warning.isEmpty())
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(warning));
        DeclarativeImageProvider provider;
        QSize size;
        QScopedPointer<QQuickTextureFactory> factory(provider.requestTexture(id, &size, requested));
        QCOMPARE(bool(factory), reported.isValid());
        if (factory) {
            QCOMPARE(size, reported);
            QCOMPARE(factory->textureSize(), reported);
            QCOMPARE(factory->image().size(), reported - QSize(2, 2));
        }
    }

    // Image loader threads ask at the same time.
    void concurrentRequests()
    {
        DeclarativeImageProvider provider;
        std::atomic<int> made(0);
        std::vector<std::thread> threads;
        for (int t = 0; t < 4; ++t) {
            threads.emplace_back([&provider, &made, t] {
                for (int i = 0; i < 50; ++i) {
                    QSize size;
                    const QString id = (i + t) % 2 ? QStringLiteral("icon-square?#00ff00") : QStringLiteral("icon-themed");
                    delete provider.requestTexture(id, &size, QSize());
                    ++made;
                }
            });
        }
        for (std::thread &thread : threads)
            thread.join();
        QCOMPARE(made.load(), 200);
    }

    void tintedIconsOnScreen()
    {
        QQuickView view;
        QVERIFY(showImages(view, "  Image { x: 10; y: 10; width: 32; height: 32; source: 'image://theme/icon-square?#ff0000' }\n"
                                 "  Image { x: 60; y: 10; width: 32; height: 32; source: 'image://theme/icon-square?#3050ff' }\n"
                                 "  Image { x: 110; y: 10; width: 32; height: 32; source: 'image://theme/icon-square' }\n"
                                 "  Image { x: 10; y: 50; width: 600; height: 40; source: 'image://theme/icon-large?#00ff00' }\n"));
        // Tinted, also as a standalone texture; untinted, the file's own black; between, the background.
        QCOMPARE(pixelsDiffer(view, { { { 26, 26 }, qRgb(255, 0, 0) }, { { 76, 26 }, qRgb(0x30, 0x50, 0xff) }, { { 150, 70 }, qRgb(0, 255, 0) },
                                      { { 126, 26 }, qRgb(0, 0, 0) }, { { 50, 26 }, qRgb(0, 0, 0) } }, 12), QString());
    }

    // The same image element, not reloaded, takes a new theme colour, however it is drawn:
    // from the atlas, or from a texture of its own that Qt asks for when it mipmaps, tiles,
    // or hands the texture to a shader.
    void themeColourChangeRetints_data()
    {
        QTest::addColumn<QByteArray>("image");
        const QByteArray source = "source: 'image://theme/icon-themed'";
        QTest::newRow("plain") << "Image { x: 10; y: 10; width: 32; height: 32; " + source + " }";
        QTest::newRow("mipmap") << "Image { x: 10; y: 10; width: 32; height: 32; mipmap: true; " + source + " }";
        QTest::newRow("tiled") << "Image { x: 10; y: 10; width: 64; height: 64; fillMode: Image.Tile; " + source + " }";
        QTest::newRow("tiled horizontally") << "Image { x: 10; y: 10; width: 64; height: 32; fillMode: Image.TileHorizontally; " + source + " }";
        QTest::newRow("shader effect source")
                << "Image { id: icon; visible: false; " + source + " }\n"
                   "  ShaderEffect { x: 10; y: 10; width: 32; height: 32; property variant source: icon }";
    }

    void themeColourChangeRetints()
    {
        QFETCH(QByteArray, image);
        QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QStringLiteral("'#ffffff'")));
        QTRY_COMPARE(Pelkan::Theme::instance()->primaryColor(), QColor(Qt::white));
        QQuickView view;
        QVERIFY(showImages(view, "  " + image + "\n"));
        QCOMPARE(pixelsDiffer(view, { { { 26, 26 }, qRgb(255, 255, 255) } }, 12), QString());
        QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QStringLiteral("'#ff8000'")));
        QCOMPARE(pixelsDiffer(view, { { { 26, 26 }, qRgb(0xff, 0x80, 0x00) } }, 12), QString());
    }

    void themeKeysReachNewRequests_data()
    {
        QTest::addColumn<QString>("key");
        QTest::addColumn<QString>("name");
        QTest::addColumn<QSize>("before"); // invalid: not found
        QTest::addColumn<QSize>("after");
        QTest::newRow("directory") << "directory" << "icon-elsewhere" << QSize() << QSize(10, 10);
        QTest::newRow("pixel_ratio") << "pixel_ratio" << "icon-ratio" << QSize(34, 34) << QSize(66, 66);
    }

    void themeKeysReachNewRequests()
    {
        QFETCH(QString, key);
        QFETCH(QString, name);
        QFETCH(QSize, before);
        QFETCH(QSize, after);
        QTemporaryDir other;
        QDir().mkpath(other.filePath(QStringLiteral("icons")));
        QImage small(8, 8, QImage::Format_ARGB32);
        small.fill(Qt::black);
        QVERIFY(small.save(other.filePath(QStringLiteral("icons/icon-elsewhere.png"))));
        writeIcon(QStringLiteral("icon-ratio"), QSize(32, 32));
        writeIcon(QStringLiteral("z2.0/icon-ratio"), QSize(64, 64));

        DeclarativeImageProvider provider; // made before the change, as an engine's is
        auto sizeOf = [&provider, &name] {
            QSize size;
            QScopedPointer<QQuickTextureFactory> factory(provider.requestTexture(name, &size, QSize()));
            return factory ? size : QSize();
        };
        QCOMPARE(sizeOf(), before);
        const QString value = key == QLatin1String("directory") ? QLatin1Char('\'') + other.path() + QLatin1Char('\'')
                                                                 : QStringLiteral("2.0");
        QVERIFY(ConfigFixture::write(ThemeKeys + key, value));
        QTRY_COMPARE(sizeOf(), after);
        useTestTheme();
    }

    void missingIconReportedOnce()
    {
        static QStringList warnings;
        warnings.clear();
        QtMessageHandler previous = qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &, const QString &text) {
            if (type == QtWarningMsg)
                warnings << text;
        });
        DeclarativeImageProvider provider;
        for (int i = 0; i < 3; ++i) {
            QSize size;
            QVERIFY(!provider.requestTexture(QStringLiteral("icon-nowhere?#ff0000"), &size, QSize()));
        }
        qInstallMessageHandler(previous);
        QCOMPARE(warnings.size(), 1); // and nothing from a reader opened on no file
        QVERIFY2(warnings.first().contains(QLatin1String("\"icon-nowhere\""))
                         && warnings.first().contains(m_theme.path() + QLatin1String("/icons/z1.0"))
                         && warnings.first().contains(m_theme.path() + QLatin1String("/graphics")),
                 qPrintable(warnings.first()));
    }

    // Windows opened and closed while another stays: what they drew with goes with their
    // GL context (each window's own in the threaded loop; in the basic loop one shared by all,
    // which stays with the window that stays), and a later colour change reaches only
    // windows that exist.
    void windowsComeAndGo()
    {
        auto show = [](QQuickView &view) {
            QVERIFY(showImages(view, "  Image { id: icon; x: 10; y: 10; width: 32; height: 32; source: 'image://theme/icon-themed' }\n"
                                     "  BlurEffect { x: 50; width: 40; height: 40; sourceItem: icon }\n"));
            QCOMPARE(pixelsDiffer(view, { { { 26, 26 }, Pelkan::Theme::instance()->primaryColor().rgb() } }, 12), QString());
        };
        const int atlases = DeclarativeImageProvider::atlasCount();
        const int caches = BlurEffectCache::cacheCount();
        // The staying window opens after the first passing one, which drew the icon first.
        QScopedPointer<QQuickView> staying;
        for (int i = 0; i < 12; ++i) {
            QQuickView passing;
            show(passing);
            if (!staying) {
                staying.reset(new QQuickView);
                show(*staying);
            }
            passing.close();
        }
        QCOMPARE(DeclarativeImageProvider::atlasCount(), atlases + 1);
        QCOMPARE(BlurEffectCache::cacheCount(), caches + 1);
        for (QRgb colour : { qRgb(0, 255, 0), qRgb(0, 0, 255) }) {
            QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), "'" + QColor(colour).name() + "'"));
            QCOMPARE(pixelsDiffer(*staying, { { { 26, 26 }, colour } }, 12), QString());
        }
    }

    // The pixels of theme images: tinted by the alpha or grey rule, bordered by their own edges.
    void pixelsTinted_data()
    {
        QTest::addColumn<QImage>("source");
        QTest::addColumn<QColor>("tint");
        QTest::addColumn<QByteArray>("expected"); // the one pixel, as R, G, B, A bytes

        auto single = [](QImage::Format format, QRgb pixel) {
            QImage image(1, 1, format);
            image.setPixel(0, 0, pixel);
            return image;
        };
        // Alpha rule: the colour of the source is discarded, its alpha scales the tint.
        QTest::newRow("ARGB32 alpha") << single(QImage::Format_ARGB32, qRgba(10, 200, 30, 128)) << QColor(255, 0, 0) << rgba(128, 0, 0, 128);
        QTest::newRow("premultiplied alpha") << single(QImage::Format_ARGB32_Premultiplied, qRgba(0, 0, 0, 51)) << QColor(0, 255, 100) << rgba(0, 51, 20, 51);
        QTest::newRow("RGBA8888 alpha") << single(QImage::Format_RGBA8888, qRgba(0, 0, 0, 255)) << QColor(1, 2, 3) << rgba(1, 2, 3, 255);
        QTest::newRow("tint alpha ignored") << single(QImage::Format_ARGB32, qRgba(0, 0, 0, 255)) << QColor(255, 255, 255, 10) << rgba(255, 255, 255, 255);
        // Grey rule for opaque images: (11 R + 16 G + 5 B) >> 5.
        QTest::newRow("RGB32 grey") << single(QImage::Format_RGB32, qRgb(100, 200, 50)) << QColor(255, 255, 255) << rgba(142, 142, 142, 142);
        QTest::newRow("RGBX8888 grey") << single(QImage::Format_RGBX8888, qRgb(255, 255, 255)) << QColor(0, 0, 255) << rgba(0, 0, 255, 255);
        // Other formats are converted first.
        QImage grey8(1, 1, QImage::Format_Grayscale8);
        grey8.fill(64);
        QTest::newRow("Grayscale8 converted, grey rule") << grey8 << QColor(255, 255, 255) << rgba(64, 64, 64, 64);
        QImage indexed(1, 1, QImage::Format_Indexed8);
        indexed.setColorTable({ qRgba(0, 0, 0, 0), qRgba(9, 9, 9, 255) });
        indexed.setPixel(0, 0, 1);
        QTest::newRow("Indexed8 with alpha, alpha rule") << indexed << QColor(200, 100, 0) << rgba(200, 100, 0, 255);
        QTest::newRow("no tint: a premultiplied copy") << single(QImage::Format_ARGB32, qRgba(200, 100, 50, 128)) << QColor()
                                                      << rgba(100, 50, 25, 128);
    }

    void pixelsTinted()
    {
        QFETCH(QImage, source);
        QFETCH(QColor, tint);
        QFETCH(QByteArray, expected);
        const QImage plain = render(source, tint, false);
        QCOMPARE(plain.format(), QImage::Format_RGBA8888_Premultiplied);
        QCOMPARE(bytesAt(plain, 0, 0), expected);
        const QImage bordered = render(source, tint, true);
        QCOMPARE(bordered.size(), QSize(3, 3));
        for (int y = 0; y < 3; ++y)
            for (int x = 0; x < 3; ++x)
                QCOMPARE(bytesAt(bordered, x, y), expected);

        // The pixel among clear (or black) ones in a line long enough to be tinted four pixels
        // at a time, with a clear round, a mixed one and a rest.
        QImage line(9, 1, source.format());
        line.setColorTable(source.colorTable());
        line.fill(0);
        for (int x : { 4, 6, 8 })
            line.setPixel(x, 0, source.format() == QImage::Format_Indexed8 ? source.pixelIndex(0, 0) : source.pixel(0, 0));
        const QImage tinted = render(line, tint, false);
        for (int x = 0; x < 9; ++x)
            QCOMPARE(bytesAt(tinted, x, 0), x == 4 || x == 6 || x == 8 ? expected : rgba(0, 0, 0, 0));

        // For ARGB32 the same pixel, its red and blue in their places there.
        const QImage argb = ThemePixels::renderArgb32(source, tint);
        QCOMPARE(argb.format(), QImage::Format_ARGB32_Premultiplied);
        QCOMPARE(argb.pixel(0, 0), qRgba(uchar(expected[0]), uchar(expected[1]), uchar(expected[2]), uchar(expected[3])));
    }

    void pixelsBorderRepeatsTheEdges()
    {
        QImage source(2, 2, QImage::Format_ARGB32);
        source.setPixel(0, 0, qRgba(0, 0, 0, 10));
        source.setPixel(1, 0, qRgba(0, 0, 0, 20));
        source.setPixel(0, 1, qRgba(0, 0, 0, 30));
        source.setPixel(1, 1, qRgba(0, 0, 0, 40));
        const QImage image = render(source, Qt::white, true);
        QCOMPARE(image.size(), QSize(4, 4));
        const int expected[4][4] = { { 10, 10, 20, 20 }, { 10, 10, 20, 20 }, { 30, 30, 40, 40 }, { 30, 30, 40, 40 } };
        for (int y = 0; y < 4; ++y)
            for (int x = 0; x < 4; ++x)
                QCOMPARE(int(uchar(bytesAt(image, x, y).at(3))), expected[y][x]);
    }

    void atlasSide_data()
    {
        QTest::addColumn<QSize>("window");
        QTest::addColumn<int>("maximum");
        QTest::addColumn<int>("side");
        QTest::newRow("540x960") << QSize(540, 960) << 4096 << 512;
        QTest::newRow("1080x1920") << QSize(1080, 1920) << 4096 << 1024;
        QTest::newRow("1x1") << QSize(1, 1) << 4096 << 512;
        QTest::newRow("exactly 1025 long") << QSize(1025, 10) << 4096 << 1024;
        QTest::newRow("1024 long rounds down") << QSize(1024, 10) << 4096 << 512;
        QTest::newRow("capped by GL") << QSize(1080, 1920) << 256 << 256;
    }

    void atlasSide()
    {
        QFETCH(QSize, window);
        QFETCH(int, maximum);
        QFETCH(int, side);
        QCOMPARE(ThemeTextureAtlas::sideFor(window, maximum), side);
    }

    // Images at least half the atlas wide or high get a texture of their own, as do those
    // that no longer fit; freed, the first one's place takes it again.
    void atlasPlacement_data()
    {
        QTest::addColumn<QList<QSize>>("images");
        QTest::addColumn<QList<bool>>("inAtlas");
        QTest::newRow("small") << QList<QSize> { { 32, 32 } } << QList<bool> { true };
        QTest::newRow("just under half") << QList<QSize> { { 255, 10 } } << QList<bool> { true };
        QTest::newRow("exactly half wide") << QList<QSize> { { 256, 10 } } << QList<bool> { false };
        QTest::newRow("exactly half high") << QList<QSize> { { 10, 256 } } << QList<bool> { false };
        const QSize quarter(200, 200); // two by two fit in 512
        QTest::newRow("full: freed space used again") << QList<QSize> { quarter, quarter, quarter, quarter, quarter }
                                                      << QList<bool> { true, true, true, true, false };
    }

    void atlasPlacement()
    {
        QFETCH(QList<QSize>, images);
        QFETCH(QList<bool>, inAtlas);
        const Pelkan::ThemeIconResolver resolver(QStringLiteral("/nonexistent"), 1.0);
        ThemeTextureAtlas atlas(resolver, 512);
        std::vector<std::unique_ptr<QSGTexture>> textures;
        for (int i = 0; i <= images.size(); ++i) {
            if (i == images.size())
                textures.erase(textures.begin());
            const QSize image = images.at(i % images.size());
            ThemeImageRecord record;
            record.imageSize = image;
            textures.emplace_back(atlas.create(record, QString(), QImage(image + QSize(2, 2), QImage::Format_RGBA8888_Premultiplied)));
            QSGTexture *texture = textures.back().get();
            QCOMPARE(texture->isAtlasTexture(), inAtlas.at(i % images.size()));
            QCOMPARE(texture->textureSize(), image);
            if (texture->isAtlasTexture()) {
                // The sub-rectangle covers the image inside its one-pixel border.
                const QRectF sub = texture->normalizedTextureSubRect();
                QCOMPARE(sub.size(), QSizeF(image.width() / 512.0, image.height() / 512.0));
                QVERIFY(sub.left() >= 1 / 512.0 && sub.top() >= 1 / 512.0);
            }
        }
        QCOMPARE(atlas.standaloneCount(), int(inAtlas.count(false)));
    }
};

QTEST_MAIN(tst_DeclarativeImageProvider)
#include "tst_declarativeimageprovider.moc"
