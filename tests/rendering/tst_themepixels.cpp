#include "rendering/themeimages/themeimagerecord.h"
#include "rendering/themeimages/themepixels.h"
#include "rendering/themeimages/themetextureatlas.h"
#include "themeiconresolver.h"

#include <QSGTexture>
#include <QtTest>

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

class tst_ThemePixels : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void tint_data()
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

    void tint()
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
    }

    void borderRepeatsTheEdges()
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

    void argb32SwapsRedAndBlue()
    {
        QImage source(1, 1, QImage::Format_ARGB32);
        source.setPixel(0, 0, qRgba(0, 0, 0, 255));
        const QImage image = ThemePixels::renderArgb32(source, QColor(255, 10, 0));
        QCOMPARE(image.format(), QImage::Format_ARGB32_Premultiplied);
        QCOMPARE(image.pixel(0, 0), qRgba(255, 10, 0, 255));
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

    void atlasPlacement_data()
    {
        QTest::addColumn<QSize>("image");
        QTest::addColumn<bool>("inAtlas");
        QTest::newRow("small") << QSize(32, 32) << true;
        QTest::newRow("just under half") << QSize(255, 10) << true;
        QTest::newRow("exactly half wide") << QSize(256, 10) << false;
        QTest::newRow("exactly half high") << QSize(10, 256) << false;
    }

    void atlasPlacement()
    {
        QFETCH(QSize, image);
        QFETCH(bool, inAtlas);
        const Pelkan::ThemeIconResolver resolver(QStringLiteral("/nonexistent"), 1.0);
        ThemeTextureAtlas atlas(resolver, 512);
        ThemeImageRecord record;
        record.imageSize = image;
        QImage bordered(image + QSize(2, 2), QImage::Format_RGBA8888_Premultiplied);
        QScopedPointer<QSGTexture> texture(atlas.create(record, QString(), bordered));
        QCOMPARE(texture->isAtlasTexture(), inAtlas);
        QCOMPARE(texture->textureSize(), image);
        if (inAtlas) {
            // The sub-rectangle covers the image inside its one-pixel border.
            const QRectF sub = texture->normalizedTextureSubRect();
            QCOMPARE(sub.size(), QSizeF(image.width() / 512.0, image.height() / 512.0));
            QVERIFY(sub.left() >= 1 / 512.0 && sub.top() >= 1 / 512.0);
        }
    }

    void fullAtlasGoesStandalone()
    {
        const Pelkan::ThemeIconResolver resolver(QStringLiteral("/nonexistent"), 1.0);
        ThemeTextureAtlas atlas(resolver, 512);
        ThemeImageRecord record;
        record.imageSize = QSize(200, 200);
        const QImage bordered(202, 202, QImage::Format_RGBA8888_Premultiplied);
        std::vector<std::unique_ptr<QSGTexture>> textures;
        for (int i = 0; i < 4; ++i) // two by two fit in 512
            textures.emplace_back(atlas.create(record, QString(), bordered));
        QVERIFY(textures.back()->isAtlasTexture());
        textures.emplace_back(atlas.create(record, QString(), bordered));
        QVERIFY(!textures.back()->isAtlasTexture());
        QCOMPARE(atlas.standaloneCount(), 1);
        // Freed space is used again.
        textures.erase(textures.begin());
        textures.emplace_back(atlas.create(record, QString(), bordered));
        QVERIFY(textures.back()->isAtlasTexture());
    }
};

QTEST_GUILESS_MAIN(tst_ThemePixels)
#include "tst_themepixels.moc"
