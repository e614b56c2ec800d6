#include "rendering/providers/backgroundimagecache.h"
#include "rendering/providers/backgroundimageprovider.h"
#include "screen.h"
#include "theme.h"

#include <QPainter>
#include <QTemporaryDir>
#include <QtTest>

#include <thread>

// A picture made into a background: opaque, cached on disk, made again when its source
// changes.
class tst_BackgroundImageProvider : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void sizes_data();
    void sizes();
    void processedAndCached();
    void changedSourceIsMadeAgain_data();
    void changedSourceIsMadeAgain();
    void unreadableSource();
    void loaderThreads();

private:
    // 40 x 20: the left half opaque white, the right half transparent.
    QString writeSource(const QString &name, QColor left = Qt::white);
    QTemporaryDir m_dir;
};

QString tst_BackgroundImageProvider::writeSource(const QString &name, QColor left)
{
    QImage image(40, 20, QImage::Format_ARGB32);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.fillRect(0, 0, 20, 20, left);
    painter.end();
    const QString path = m_dir.filePath(name);
    return image.save(path) ? path : QString();
}

void tst_BackgroundImageProvider::initTestCase()
{
    QVERIFY(m_dir.isValid());
}

void tst_BackgroundImageProvider::sizes_data()
{
    QTest::addColumn<QSize>("requested");
    QTest::addColumn<QSize>("expected");
    QTest::newRow("both sides") << QSize(20, 10) << QSize(20, 10);
    QTest::newRow("both sides, other aspect: cut") << QSize(10, 10) << QSize(10, 10);
    QTest::newRow("width only") << QSize(10, 0) << QSize(10, 5);
    QTest::newRow("height only") << QSize(0, 5) << QSize(10, 5);
    QTest::newRow("tiny sides become 4") << QSize(2, 1) << QSize(4, 4);
    // Enlarged no further than the application's scale (an empty expectation here).
    QTest::newRow("larger than the source") << QSize(0, 1000) << QSize();
    // Without a size: the screen's height, here more than the source has.
    QTest::newRow("no size") << QSize() << QSize();
}

void tst_BackgroundImageProvider::sizes()
{
    QFETCH(QSize, requested);
    QFETCH(QSize, expected);
    QVERIFY(Pelkan::Screen::instance()->height() >= 1000);
    if (expected.isEmpty())
        expected = QSize(40, 20) * Pelkan::Theme::instance()->pixelRatio();
    const QString source = writeSource(QStringLiteral("sizes-%1.png").arg(QTest::currentDataTag()));
    BackgroundImageProvider provider;
    QSize size;
    const QImage image = provider.requestImage(source, &size, requested);
    QCOMPARE(image.size(), expected);
    QCOMPARE(size, expected);
}

void tst_BackgroundImageProvider::processedAndCached()
{
    const QString source = writeSource(QStringLiteral("cached.png"));
    BackgroundImageProvider provider;
    QSize size;
    QImage image = provider.requestImage(QUrl::fromLocalFile(source).toString(), &size, QSize(40, 20));
    QCOMPARE(size, QSize(40, 20));
    QVERIFY(!image.hasAlphaChannel());
    QCOMPARE(image.pixel(5, 10), qRgb(255, 255, 255));
    QCOMPARE(image.pixel(35, 10), qRgb(0, 0, 0));

    BackgroundImageCache cache;
    const QString cached = cache.cachePath(source, QSize(40, 20), true);
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

void tst_BackgroundImageProvider::changedSourceIsMadeAgain_data()
{
    QTest::addColumn<int>("shift"); // seconds the new file's time lies from the old one's
    QTest::addColumn<bool>("sameSize");
    QTest::newRow("newer file") << 10 << true;
    QTest::newRow("older file, as cp -p leaves it") << -3600 << true;
    QTest::newRow("same time, other size") << 0 << false;
}

void tst_BackgroundImageProvider::changedSourceIsMadeAgain()
{
    QFETCH(int, shift);
    QFETCH(bool, sameSize);
    const QString source = writeSource(QStringLiteral("changed-%1.png").arg(QTest::currentDataTag()));
    BackgroundImageProvider provider;
    QSize size;
    QCOMPARE(provider.requestImage(source, &size, QSize(40, 20)).pixel(5, 10), qRgb(255, 255, 255));
    const qint64 sizeBefore = QFileInfo(source).size();
    const QDateTime timeBefore = QFileInfo(source).lastModified();

    QImage replacement(40, 20, QImage::Format_ARGB32);
    replacement.fill(Qt::transparent);
    QPainter(&replacement).fillRect(0, 0, 20, 20, Qt::blue);
    if (!sameSize)
        replacement.setText(QStringLiteral("Comment"), QStringLiteral("a longer file, the same picture"));
    QVERIFY(replacement.save(source));
    QFile file(source);
    QVERIFY(file.open(QIODevice::ReadWrite));
    QVERIFY(file.setFileTime(timeBefore.addSecs(shift), QFileDevice::FileModificationTime));
    file.close();
    QCOMPARE(QFileInfo(source).size() == sizeBefore, sameSize);

    QCOMPARE(provider.requestImage(source, &size, QSize(40, 20)).pixel(5, 10), qRgb(0, 0, 255));
}

void tst_BackgroundImageProvider::unreadableSource()
{
    const QString source = m_dir.filePath(QStringLiteral("broken.png"));
    QFile broken(source);
    QVERIFY(broken.open(QIODevice::WriteOnly));
    broken.write("not an image");
    broken.close();

    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Thumbnail: cannot read")));
    BackgroundImageProvider provider;
    QSize size(-2, -2);
    QVERIFY(provider.requestImage(source, &size, QSize(10, 10)).isNull());
    QVERIFY(!size.isValid() || size.isEmpty());
    QVERIFY(!QFileInfo::exists(BackgroundImageCache().cachePath(source, QSize(10, 10), true)));
}

void tst_BackgroundImageProvider::loaderThreads()
{
    // Image loader threads each use their own cache, on the same folder.
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

QTEST_MAIN(tst_BackgroundImageProvider)
#include "tst_backgroundimageprovider.moc"
