#include "../common/sceneview.h"
#include "rendering/providers/backgroundimagecache.h"
#include "rendering/providers/backgroundimageprovider.h"
#include "rendering/providers/transientimageprovider.h"
#include "rendering/providers/transientimagetexturefactory.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "screen.h"
#include "theme.h"

#include <QPainter>
#include <QQmlEngine>
#include <QQuickView>
#include <QSGTexture>
#include <QSemaphore>
#include <QTemporaryDir>
#include <QThreadPool>
#include <QtTest>

#include <sys/stat.h>
#include <thread>

// The transient provider (runs again with QSG_TRANSIENT_IMAGES set: see
// decodedImageAfterTexture), the background provider (a picture made into an opaque
// background, cached on disk, made again when its source changes), and what all three
// providers do with files an attacker or an accident hands them: images that declare more
// pixels than a device can hold, FIFOs and devices that would block a loader thread, sizes
// asked for that no screen needs.
namespace {

quint32 crc32(const QByteArray &data)
{
    quint32 crc = 0xffffffff;
    for (const char byte : data) {
        crc ^= quint8(byte);
        for (int bit = 0; bit < 8; ++bit)
            crc = (crc >> 1) ^ (0xedb88320 & (0u - (crc & 1)));
    }
    return ~crc;
}

QByteArray chunk(const char *type, const QByteArray &body)
{
    QByteArray out;
    QDataStream stream(&out, QIODevice::WriteOnly);
    stream << quint32(body.size());
    const QByteArray typed = QByteArray(type) + body;
    stream.writeRawData(typed.constData(), typed.size());
    stream << crc32(typed);
    return out;
}

// A PNG of a few hundred bytes that declares width x height grey pixels (46341 x 46341
// overflows an int): the declared size is all a reader sees before it allocates.
QByteArray declaring(quint32 width, quint32 height)
{
    QByteArray header;
    QDataStream stream(&header, QIODevice::WriteOnly);
    stream << width << height << quint8(8) << quint8(0) << quint8(0) << quint8(0) << quint8(0);
    const QByteArray rows = qCompress(QByteArray(4096, '\0')).mid(4); // zlib stream without Qt's length
    return QByteArray("\x89PNG\r\n\x1a\n", 8) + chunk("IHDR", header) + chunk("IDAT", rows) + chunk("IEND", {});
}

// The size of what a provider made of path, or an invalid size when it made nothing;
// run on a pool thread as Qt's image loader would, and given up after a few seconds.
QSize request(QQuickImageProvider *provider, const QString &path, const QSize &requested, bool *finished)
{
    QSize result(-2, -2);
    QSemaphore done;
    QThreadPool::globalInstance()->start([&] {
        QSize size;
        if (provider->imageType() == QQuickImageProvider::Texture) {
            std::unique_ptr<QQuickTextureFactory> factory(provider->requestTexture(path, &size, requested));
            size = factory ? factory->textureSize() : QSize();
        } else {
            size = provider->requestImage(path, &size, requested).size();
        }
        result = size;
        done.release();
    });
    *finished = done.tryAcquire(1, 10000);
    return result;
}

bool writeFile(const QString &path, const QByteArray &bytes)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size();
}

} // namespace

class tst_ImageProviders : public QObject
{
    Q_OBJECT

    QTemporaryDir m_dir;
    QString m_red; // 16 x 8
    QHash<QString, QQuickImageProvider *> m_providers;

    QString path(const QString &name) const { return m_dir.filePath(name); }

    // 40 x 20: the left half opaque (white unless said), the right half transparent.
    QString writeSource(const QString &name, QColor left = Qt::white, const QString &comment = {})
    {
        QImage image(40, 20, QImage::Format_ARGB32);
        image.fill(Qt::transparent);
        QPainter(&image).fillRect(0, 0, 20, 20, left);
        if (!comment.isEmpty())
            image.setText(QStringLiteral("Comment"), comment);
        return image.save(path(name)) ? path(name) : QString();
    }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_dir.isValid());
        QImage red(16, 8, QImage::Format_RGB32);
        red.fill(Qt::red);
        QVERIFY(red.save(m_red = path(QStringLiteral("red.png"))));
        QVERIFY(writeFile(path(QStringLiteral("broken.png")), "\x89PNG not really"));
        QVERIFY(writeFile(path(QStringLiteral("bomb.png")), declaring(46341, 46341)));
        QVERIFY(writeFile(path(QStringLiteral("wide.png")), declaring(23200, 23200)));
        QVERIFY(::mkfifo(QFile::encodeName(path(QStringLiteral("fifo.png"))).constData(), 0600) == 0);
        m_providers.insert(QStringLiteral("theme"), new DeclarativeImageProvider);
        m_providers.insert(QStringLiteral("transientimage"), new TransientImageProvider);
        m_providers.insert(QStringLiteral("pelkan-background"), new BackgroundImageProvider);
    }

    void cleanupTestCase() { qDeleteAll(m_providers); }

    void transientTexture_data()
    {
        QTest::addColumn<QString>("id");
        QTest::addColumn<QSize>("requested");
        QTest::addColumn<QString>("file");
        QTest::addColumn<QSize>("expected");
        QTest::newRow("file URL") << QUrl::fromLocalFile(m_red).toString() << QSize() << m_red << QSize(16, 8);
        QTest::newRow("plain path") << m_red << QSize() << m_red << QSize(16, 8);
        QTest::newRow("scaled") << m_red << QSize(8, 4) << m_red << QSize(8, 4);
        QTest::newRow("one side asked: natural size") << m_red << QSize(8, 0) << m_red << QSize(16, 8);
        const QString broken = path(QStringLiteral("broken.png")), missing = QStringLiteral("/nonexistent/image.png");
        QTest::newRow("unreadable") << broken << QSize() << broken << QSize(0, 0);
        QTest::newRow("missing") << missing << QSize() << missing << QSize(0, 0);
    }

    void transientTexture()
    {
        QFETCH(QString, id);
        QFETCH(QSize, requested);
        QFETCH(QString, file);
        QFETCH(QSize, expected);
        if (expected.isEmpty()) { // once from the provider's factory, once from the direct one
            for (int i = 0; i < 2; ++i)
                QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^TransientImageProvider: cannot read ")
                                                                      + QRegularExpression::escape(file)));
        }
        TransientImageProvider provider;
        QSize size(-2, -2);
        QScopedPointer<QQuickTextureFactory> factory(provider.requestTexture(id, &size, requested));
        QCOMPARE(size, expected);
        if (expected.isEmpty()) {
            // No factory, so the image element ends in its error state; the factory itself
            // makes no texture and does not report the failure twice.
            QVERIFY(!factory);
            TransientImageTextureFactory direct(file, requested);
            QQuickWindow window;
            QVERIFY(!direct.createTexture(&window));
            return;
        }
        auto transient = qobject_cast<TransientImageTextureFactory *>(factory.data());
        QVERIFY(transient);
        QCOMPARE(transient->path(), file);
        QCOMPARE(transient->image().size(), expected);
    }

    void transientOnScreen()
    {
        QQuickView view;
        view.engine()->addImageProvider(QStringLiteral("transientimage"), new TransientImageProvider);
        view.setColor(Qt::black);
        QQuickItem *root = showScene(view, "import QtQuick 2.6\nItem { width: 100; height: 100\n"
                                           "  Image { x: 10; y: 10; width: 64; height: 32; source: 'image://transientimage/"
                                           + QUrl::fromLocalFile(m_red).toEncoded() + "' }\n"
                                           "  property Image broken: Image { source: 'image://transientimage/"
                                           + QUrl::fromLocalFile(path(QStringLiteral("broken.png"))).toEncoded() + "' } }\n");
        QVERIFY(root);
        QTRY_COMPARE(root->property("broken").value<QObject *>()->property("status").toInt(), 3); // Image.Error
        QCOMPARE(pixelsDiffer(view, { { { 40, 25 }, qRgb(255, 0, 0) }, { { 90, 90 }, qRgb(0, 0, 0) } }, 15), QString());
    }

    void decodedImageAfterTexture()
    {
        const bool transient = qEnvironmentVariableIsSet("QSG_TRANSIENT_IMAGES");
        QCOMPARE(TransientImageTextureFactory::dropsDecodedImages(), transient);
        TransientImageTextureFactory factory(m_red, QSize());
        QCOMPARE(factory.textureSize(), QSize(16, 8));
        QVERIFY(!factory.image().isNull());

        // Textures are made (and let go) where the scene graph renders.
        QQuickView view;
        view.resize(50, 50);
        QSize textureSize;
        bool imageDropped = false;
        QObject::connect(&view, &QQuickWindow::beforeRendering, &view, [&] {
            if (textureSize.isValid())
                return;
            QScopedPointer<QSGTexture> texture(factory.createTexture(&view));
            textureSize = texture ? texture->textureSize() : QSize(0, 0);
            imageDropped = factory.image().isNull();
        }, Qt::DirectConnection);
        view.show();
        QVERIFY(QTest::qWaitForWindowExposed(&view));
        QTRY_VERIFY(textureSize.isValid());
        QCOMPARE(textureSize, QSize(16, 8));
        QCOMPARE(imageDropped, transient);
        QCOMPARE(factory.textureSize(), QSize(16, 8)); // the size stays known either way
    }

    void backgroundSizes_data()
    {
        QTest::addColumn<QSize>("requested");
        QTest::addColumn<QSize>("expected"); // empty: the source's size at the theme's pixel ratio
        QTest::newRow("both sides") << QSize(20, 10) << QSize(20, 10);
        QTest::newRow("both sides, other aspect: cut") << QSize(10, 10) << QSize(10, 10);
        QTest::newRow("width only") << QSize(10, 0) << QSize(10, 5);
        QTest::newRow("height only") << QSize(0, 5) << QSize(10, 5);
        QTest::newRow("tiny sides become 4") << QSize(2, 1) << QSize(4, 4);
        QTest::newRow("larger than the source: no larger than the scale") << QSize(0, 1000) << QSize();
        QTest::newRow("no size: the screen's height, more than the source has") << QSize() << QSize();
    }

    void backgroundSizes()
    {
        QFETCH(QSize, requested);
        QFETCH(QSize, expected);
        QVERIFY(Pelkan::Screen::instance()->height() >= 1000);
        if (expected.isEmpty())
            expected = QSize(40, 20) * Pelkan::Theme::instance()->pixelRatio();
        BackgroundImageProvider provider;
        QSize size;
        QCOMPARE(provider.requestImage(writeSource(QStringLiteral("sizes-%1.png").arg(QTest::currentDataTag())), &size, requested).size(),
                 expected);
        QCOMPARE(size, expected);
    }

    void backgroundProcessedAndCached()
    {
        const QString source = writeSource(QStringLiteral("cached.png"));
        BackgroundImageProvider provider;
        QSize size;
        QImage image = provider.requestImage(QUrl::fromLocalFile(source).toString(), &size, QSize(40, 20));
        QCOMPARE(size, QSize(40, 20));
        QVERIFY(!image.hasAlphaChannel());
        QCOMPARE(image.pixel(5, 10), qRgb(255, 255, 255));
        QCOMPARE(image.pixel(35, 10), qRgb(0, 0, 0));
        const QString cached = BackgroundImageCache().cachePath(source, QSize(40, 20), true);
        QVERIFY2(cached.startsWith(QStandardPaths::writableLocation(QStandardPaths::GenericCacheLocation)
                                   + QLatin1String("/org.quorvaneos/pelkan/backgrounds/")), qPrintable(cached));
        QVERIFY(QFileInfo::exists(cached));
        const QDateTime written = QFileInfo(cached).lastModified();
        // Asked again, by path this time: the same file serves.
        QTest::qWait(20);
        image = provider.requestImage(source, &size, QSize(40, 20));
        QCOMPARE(image.pixel(5, 10), qRgb(255, 255, 255));
        QCOMPARE(QFileInfo(cached).lastModified(), written);
    }

    void backgroundChangedSourceIsMadeAgain_data()
    {
        QTest::addColumn<int>("shift"); // seconds the new file's time lies from the old one's
        QTest::addColumn<bool>("sameSize");
        QTest::newRow("newer file") << 10 << true;
        QTest::newRow("older file, as cp -p leaves it") << -3600 << true;
        QTest::newRow("same time, other size") << 0 << false;
    }

    void backgroundChangedSourceIsMadeAgain()
    {
        QFETCH(int, shift);
        QFETCH(bool, sameSize);
        const QString name = QStringLiteral("changed-%1.png").arg(QTest::currentDataTag());
        const QString source = writeSource(name);
        BackgroundImageProvider provider;
        QSize size;
        QCOMPARE(provider.requestImage(source, &size, QSize(40, 20)).pixel(5, 10), qRgb(255, 255, 255));
        const qint64 sizeBefore = QFileInfo(source).size();
        const QDateTime timeBefore = QFileInfo(source).lastModified();
        QCOMPARE(writeSource(name, Qt::blue, sameSize ? QString() : QStringLiteral("a longer file, the same picture")), source);
        QFile file(source);
        QVERIFY(file.open(QIODevice::ReadWrite));
        QVERIFY(file.setFileTime(timeBefore.addSecs(shift), QFileDevice::FileModificationTime));
        file.close();
        QCOMPARE(QFileInfo(source).size() == sizeBefore, sameSize);
        QCOMPARE(provider.requestImage(source, &size, QSize(40, 20)).pixel(5, 10), qRgb(0, 0, 255));
    }

    void backgroundUnreadableSource()
    {
        const QString source = path(QStringLiteral("broken.png"));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Thumbnail: cannot read")));
        BackgroundImageProvider provider;
        QSize size(-2, -2);
        QVERIFY(provider.requestImage(source, &size, QSize(10, 10)).isNull());
        QVERIFY(!size.isValid() || size.isEmpty());
        QVERIFY(!QFileInfo::exists(BackgroundImageCache().cachePath(source, QSize(10, 10), true)));
    }

    // Image loader threads each use their own cache, on the same folder.
    void backgroundLoaderThreads()
    {
        const QString source = writeSource(QStringLiteral("threads.png"));
        BackgroundImageProvider provider;
        QAtomicInt good;
        std::vector<std::thread> threads;
        for (int i = 0; i < 4; ++i) {
            threads.emplace_back([&, i] {
                for (int j = 0; j < 5; ++j) {
                    QSize size;
                    const QImage image = provider.requestImage(source, &size, QSize(8 + i, 0));
                    if (image.width() == 8 + i && image.pixel(0, 0) == qRgb(255, 255, 255))
                        good.ref();
                }
            });
        }
        for (std::thread &thread : threads)
            thread.join();
        QCOMPARE(good.loadAcquire(), 20);
    }

    void hostileFiles_data()
    {
        QTest::addColumn<QString>("provider");
        QTest::addColumn<QString>("file");
        QTest::addColumn<QSize>("requested");
        QTest::addColumn<QString>("warning"); // a pattern, or empty for none
        QTest::addColumn<QSize>("largest");   // the most a result may have, or empty for nothing
        const QString declares = QStringLiteral("^Image .*%1 declares %2x%2 pixels, more than the limit");
        const QString notRegular = QStringLiteral("^Image %1 is not a regular file; not loaded$");
        for (const char *provider : { "theme", "transientimage", "pelkan-background" }) {
            const QString p = QString::fromLatin1(provider);
            QTest::addRow("%s: 46341 x 46341 declared", provider) << p << "bomb.png" << QSize() << declares.arg("bomb.png").arg(46341) << QSize();
            QTest::addRow("%s: 23200 x 23200 declared, small size asked", provider) << p << "wide.png" << QSize(64, 64)
                                                                                  << declares.arg("wide.png").arg(23200) << QSize();
            QTest::addRow("%s: FIFO", provider) << p << "fifo.png" << QSize() << notRegular.arg(".*fifo\\.png") << QSize();
            QTest::addRow("%s: device", provider) << p << "/dev/zero" << QSize() << notRegular.arg("/dev/zero") << QSize();
        }
        const QSize huge(1000000, 1000000);
        QTest::newRow("theme: huge size asked") << "theme" << "red.png" << huge << "" << QSize(8194, 8194); // with its border
        QTest::newRow("transientimage: huge size asked") << "transientimage" << "red.png" << huge << "" << QSize(8192, 8192);
        QTest::newRow("pelkan-background: one huge side asked") << "pelkan-background" << "red.png" << QSize(0, 2000000) << ""
                                                                << QSize(16384, 8192);
    }

    void hostileFiles()
    {
        QFETCH(QString, provider);
        QFETCH(QString, file);
        QFETCH(QSize, requested);
        QFETCH(QString, warning);
        QFETCH(QSize, largest);
        if (!warning.isEmpty())
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(warning));
        bool finished = false;
        const QSize size = request(m_providers.value(provider), file.startsWith(QLatin1Char('/')) ? file : path(file), requested, &finished);
        QVERIFY2(finished, "the provider blocked its loader thread");
        const QString shown = QStringLiteral("%1x%2").arg(size.width()).arg(size.height());
        if (largest.isEmpty())
            QVERIFY2(size.isEmpty(), qPrintable(shown));
        else
            QVERIFY2(!size.isEmpty() && qint64(size.width()) * size.height() <= qint64(largest.width()) * largest.height(), qPrintable(shown));
    }
};

QTEST_MAIN(tst_ImageProviders)
#include "tst_imageproviders.moc"
