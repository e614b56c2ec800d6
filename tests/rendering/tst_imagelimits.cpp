#include "rendering/providers/backgroundimageprovider.h"
#include "rendering/themeimages/declarativeimageprovider.h"
#include "rendering/providers/transientimageprovider.h"

#include <QPainter>
#include <QSemaphore>
#include <QTemporaryDir>
#include <QThreadPool>
#include <QtTest>

#include <sys/stat.h>

// What the three image providers do with files an attacker or an accident hands them:
// images that declare more pixels than a device can hold, FIFOs and devices that would
// block a loader thread, sizes asked for that no screen needs.
class tst_ImageLimits : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase() { qDeleteAll(m_providers); }
    void hostileFiles_data();
    void hostileFiles();

private:
    QTemporaryDir m_dir;
    QHash<QString, QQuickImageProvider *> m_providers;
};

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

// A PNG of a few hundred bytes that declares width x height grey pixels: the declared size
// is all a reader sees before it allocates.
QByteArray pngDeclaring(quint32 width, quint32 height)
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

} // namespace

void tst_ImageLimits::initTestCase()
{
    QVERIFY(m_dir.isValid());
    m_providers.insert(QStringLiteral("theme"), new DeclarativeImageProvider);
    m_providers.insert(QStringLiteral("transientimage"), new TransientImageProvider);
    m_providers.insert(QStringLiteral("pelkan-background"), new BackgroundImageProvider);
    QFile bomb(m_dir.filePath(QStringLiteral("bomb.png")));
    QVERIFY(bomb.open(QIODevice::WriteOnly));
    bomb.write(pngDeclaring(46341, 46341));
    bomb.close();
    QFile wide(m_dir.filePath(QStringLiteral("wide.png")));
    QVERIFY(wide.open(QIODevice::WriteOnly));
    wide.write(pngDeclaring(23200, 23200));
    wide.close();
    QVERIFY(::mkfifo(QFile::encodeName(m_dir.filePath(QStringLiteral("fifo.png"))).constData(), 0600) == 0);
    QImage tiny(2, 1, QImage::Format_RGB32);
    tiny.fill(Qt::red);
    QVERIFY(tiny.save(m_dir.filePath(QStringLiteral("tiny.png"))));
}

void tst_ImageLimits::hostileFiles_data()
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
    QTest::newRow("theme: huge size asked") << "theme" << "tiny.png" << huge << "" << QSize(8194, 8194); // with its border
    QTest::newRow("transientimage: huge size asked") << "transientimage" << "tiny.png" << huge << "" << QSize(8192, 8192);
    QTest::newRow("pelkan-background: one huge side asked") << "pelkan-background" << "tiny.png" << QSize(0, 2000000) << ""
                                                            << QSize(16384, 8192);
}

void tst_ImageLimits::hostileFiles()
{
    QFETCH(QString, provider);
    QFETCH(QString, file);
    QFETCH(QSize, requested);
    QFETCH(QString, warning);
    QFETCH(QSize, largest);
    const QString path = file.startsWith(QLatin1Char('/')) ? file : m_dir.filePath(file);
    if (!warning.isEmpty())
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(warning));
    bool finished = false;
    const QSize size = request(m_providers.value(provider), path, requested, &finished);
    QVERIFY2(finished, "the provider blocked its loader thread");
    if (largest.isEmpty()) {
        QVERIFY2(size.isEmpty(), qPrintable(QStringLiteral("%1x%2").arg(size.width()).arg(size.height())));
    } else {
        QVERIFY(!size.isEmpty());
        QVERIFY2(qint64(size.width()) * size.height() <= qint64(largest.width()) * largest.height(),
                 qPrintable(QStringLiteral("%1x%2").arg(size.width()).arg(size.height())));
    }
}

QTEST_MAIN(tst_ImageLimits)
#include "tst_imagelimits.moc"
