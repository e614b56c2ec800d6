#include "../common/configfixture.h"
#include "../common/sceneview.h"
#include "rendering/blur/blureffectcache.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "theme.h"
#include "themeiconresolver.h"

#include <QPainter>
#include <QQuickItem>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickView>
#include <QTemporaryDir>
#include <QtTest>

#include <thread>

static const QString ThemeKeys = Pelkan::Theme::configurationPath();

// Colours on screen are compared with room for filtering and blending.
static bool near(QRgb a, QColor b, int tolerance = 12)
{
    return qAbs(qRed(a) - b.red()) <= tolerance && qAbs(qGreen(a) - b.green()) <= tolerance
            && qAbs(qBlue(a) - b.blue()) <= tolerance;
}

class tst_DeclarativeImageProvider : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void requestTexture_data();
    void requestTexture();
    void corruptFileWarns();
    void concurrentRequests();
    void tintedIconsOnScreen();
    void themeColourChangeRetints_data();
    void themeColourChangeRetints();
    void themeKeysReachNewRequests_data();
    void themeKeysReachNewRequests();
    void missingIconReportedOnce();
    void windowsComeAndGo();

private:
    void writeIcon(const QString &name, const QSize &size, bool grayscale);
    QTemporaryDir m_theme;
};

void tst_DeclarativeImageProvider::writeIcon(const QString &name, const QSize &size, bool grayscale)
{
    // A filled disc on transparency: tinting keeps its shape and takes the colour.
    QImage image(size, QImage::Format_ARGB32);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setBrush(Qt::black);
    painter.setPen(Qt::NoPen);
    painter.drawRect(QRect(QPoint(0, 0), size));
    painter.end();
    if (grayscale)
        image.setText(QStringLiteral("Grayscale"), QStringLiteral("true"));
    QVERIFY(image.save(m_theme.filePath(QStringLiteral("icons/") + name + QLatin1String(".png"))));
}

void tst_DeclarativeImageProvider::initTestCase()
{
    QDir().mkpath(m_theme.filePath(QStringLiteral("icons")));
    writeIcon(QStringLiteral("icon-square"), QSize(32, 32), false);
    writeIcon(QStringLiteral("icon-themed"), QSize(32, 32), true);
    writeIcon(QStringLiteral("icon-large"), QSize(600, 40), false);
    // Named as a PNG, but JPEG data: read all the same.
    QImage photo(32, 32, QImage::Format_RGB32);
    photo.fill(Qt::gray);
    QVERIFY(photo.save(m_theme.filePath(QStringLiteral("icons/icon-misnamed.png")), "JPEG"));
    QFile corrupt(m_theme.filePath(QStringLiteral("icons/icon-corrupt.png")));
    QVERIFY(corrupt.open(QIODevice::WriteOnly));
    corrupt.write("\x89PNG\r\n\x1a\n not really");
    corrupt.close();

    QVERIFY(ConfigFixture::reset(ThemeKeys));
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("directory"), QLatin1Char('\'') + m_theme.path() + QLatin1Char('\'')));
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("pixel_ratio"), QStringLiteral("1.0")));
    QTRY_COMPARE(Pelkan::Theme::instance()->themeDirectory(), m_theme.path());
    QTRY_COMPARE(Pelkan::Theme::instance()->pixelRatio(), 1.0);
}

void tst_DeclarativeImageProvider::cleanupTestCase()
{
    ConfigFixture::reset(ThemeKeys);
}

void tst_DeclarativeImageProvider::requestTexture_data()
{
    QTest::addColumn<QString>("id");
    QTest::addColumn<QSize>("requested");
    QTest::addColumn<QSize>("reported"); // invalid: no texture
    QTest::newRow("plain") << "icon-square" << QSize() << QSize(34, 34);
    QTest::newRow("tinted") << "icon-square?#ff0000" << QSize() << QSize(34, 34);
    QTest::newRow("unparsable colour") << "icon-themed?notacolour" << QSize() << QSize(34, 34);
    QTest::newRow("scaled") << "icon-square" << QSize(16, 16) << QSize(18, 18);
    QTest::newRow("large") << "icon-large" << QSize() << QSize(602, 42);
    QTest::newRow("data not as named") << "icon-misnamed?#00ff00" << QSize() << QSize(34, 34);
    QTest::newRow("unknown name") << "icon-missing" << QSize() << QSize();
    QTest::newRow("path escape") << "../icons/icon-square" << QSize() << QSize();
}

void tst_DeclarativeImageProvider::requestTexture()
{
    QFETCH(QString, id);
    QFETCH(QSize, requested);
    QFETCH(QSize, reported);
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

void tst_DeclarativeImageProvider::corruptFileWarns()
{
    DeclarativeImageProvider provider;
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Failed to load .*icon-corrupt.png")));
    QSize size;
    QVERIFY(!provider.requestTexture(QStringLiteral("icon-corrupt"), &size, QSize()));
}

void tst_DeclarativeImageProvider::concurrentRequests()
{
    // Image loader threads ask at the same time.
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

void tst_DeclarativeImageProvider::tintedIconsOnScreen()
{
    QQuickView view;
    view.engine()->addImageProvider(QStringLiteral("theme"), new DeclarativeImageProvider);
    view.setColor(Qt::black);
    QQuickItem *root = showScene(view, "import QtQuick 2.6\n"
                                   "Item { width: 300; height: 100\n"
                                   "  Image { x: 10; y: 10; width: 32; height: 32; source: 'image://theme/icon-square?#ff0000' }\n"
                                   "  Image { x: 60; y: 10; width: 32; height: 32; source: 'image://theme/icon-square?#3050ff' }\n"
                                   "  Image { x: 110; y: 10; width: 32; height: 32; source: 'image://theme/icon-square' }\n"
                                   "  Image { x: 10; y: 50; width: 600; height: 40; source: 'image://theme/icon-large?#00ff00' }\n"
                                   "}\n");
    QVERIFY(root);
    QImage grab;
    QTRY_VERIFY((grab = view.grabWindow(), near(grab.pixel(26, 26), Qt::red)));
    QVERIFY2(near(grab.pixel(76, 26), QColor(0x30, 0x50, 0xff)), qPrintable(QColor(grab.pixel(76, 26)).name()));
    // Untinted: the file's own black; and a standalone texture tints the same way.
    QVERIFY(near(grab.pixel(126, 26), Qt::black));
    QVERIFY2(near(grab.pixel(150, 70), Qt::green), qPrintable(QColor(grab.pixel(150, 70)).name()));
    // Outside the icons the background shows.
    QVERIFY(near(grab.pixel(50, 26), Qt::black));
}

void tst_DeclarativeImageProvider::themeColourChangeRetints_data()
{
    // However the image is drawn: from the atlas, or from a texture of its own that Qt
    // asks for when it mipmaps, tiles, or hands the texture to a shader.
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

void tst_DeclarativeImageProvider::themeColourChangeRetints()
{
    QFETCH(QByteArray, image);
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QStringLiteral("'#ffffff'")));
    QTRY_COMPARE(Pelkan::Theme::instance()->primaryColor(), QColor(Qt::white));
    QQuickView view;
    view.engine()->addImageProvider(QStringLiteral("theme"), new DeclarativeImageProvider);
    view.setColor(Qt::black);
    QVERIFY(showScene(view, "import QtQuick 2.6\nItem { width: 100; height: 100\n  " + image + " }\n"));
    QImage grab;
    QTRY_VERIFY((grab = view.grabWindow(), near(grab.pixel(26, 26), Qt::white)));

    // The same image element, not reloaded, takes the new colour.
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QStringLiteral("'#ff8000'")));
    QTRY_VERIFY2((grab = view.grabWindow(), near(grab.pixel(26, 26), QColor(0xff, 0x80, 0x00))),
                 qPrintable(QColor(grab.pixel(26, 26)).name()));
}

void tst_DeclarativeImageProvider::themeKeysReachNewRequests_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QSize>("before"); // invalid: not found
    QTest::addColumn<QSize>("after");
    QTest::newRow("directory") << "directory" << "icon-elsewhere" << QSize() << QSize(10, 10);
    QTest::newRow("pixel_ratio") << "pixel_ratio" << "icon-ratio" << QSize(34, 34) << QSize(66, 66);
}

void tst_DeclarativeImageProvider::themeKeysReachNewRequests()
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
    QDir().mkpath(m_theme.filePath(QStringLiteral("icons/z2.0")));
    writeIcon(QStringLiteral("icon-ratio"), QSize(32, 32), false);
    writeIcon(QStringLiteral("z2.0/icon-ratio"), QSize(64, 64), false);

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

    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("directory"), QLatin1Char('\'') + m_theme.path() + QLatin1Char('\'')));
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("pixel_ratio"), QStringLiteral("1.0")));
    QTRY_COMPARE(Pelkan::Theme::instance()->themeDirectory(), m_theme.path());
    QTRY_COMPARE(Pelkan::Theme::instance()->pixelRatio(), 1.0);
}

void tst_DeclarativeImageProvider::missingIconReportedOnce()
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
void tst_DeclarativeImageProvider::windowsComeAndGo()
{
    const QByteArray scene = "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                             "Item { width: 100; height: 60\n"
                             "  Image { id: icon; x: 10; y: 10; width: 32; height: 32; source: 'image://theme/icon-themed' }\n"
                             "  BlurEffect { x: 50; width: 40; height: 40; sourceItem: icon } }\n";
    auto show = [&scene](QQuickView &view) {
        view.engine()->addImageProvider(QStringLiteral("theme"), new DeclarativeImageProvider);
        view.setColor(Qt::black);
        QVERIFY(showScene(view, scene));
        QTRY_VERIFY(near(view.grabWindow().pixel(26, 26), Pelkan::Theme::instance()->primaryColor()));
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

    for (const char *colour : { "'#00ff00'", "'#0000ff'" }) {
        QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QString::fromLatin1(colour)));
        QTRY_VERIFY(near(staying->grabWindow().pixel(26, 26), QColor(QString::fromLatin1(colour).remove(QLatin1Char('\'')))));
    }
}

QTEST_MAIN(tst_DeclarativeImageProvider)
#include "tst_declarativeimageprovider.moc"
