#include "../common/configfixture.h"
#include "../common/sceneview.h"
#include "declarativeimageprovider.h"
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
    void themeColourChangeRetints();

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

void tst_DeclarativeImageProvider::themeColourChangeRetints()
{
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QStringLiteral("'#ffffff'")));
    QTRY_COMPARE(Pelkan::Theme::instance()->primaryColor(), QColor(Qt::white));
    QQuickView view;
    view.engine()->addImageProvider(QStringLiteral("theme"), new DeclarativeImageProvider);
    view.setColor(Qt::black);
    QQuickItem *root = showScene(view, "import QtQuick 2.6\n"
                                   "Item { width: 100; height: 100\n"
                                   "  Image { x: 10; y: 10; width: 32; height: 32; source: 'image://theme/icon-themed' } }\n");
    QVERIFY(root);
    QImage grab;
    QTRY_VERIFY((grab = view.grabWindow(), near(grab.pixel(26, 26), Qt::white)));

    // The same image element, not reloaded, takes the new colour.
    QVERIFY(ConfigFixture::write(ThemeKeys + QLatin1String("primary_color"), QStringLiteral("'#ff8000'")));
    QTRY_VERIFY2((grab = view.grabWindow(), near(grab.pixel(26, 26), QColor(0xff, 0x80, 0x00))),
                 qPrintable(QColor(grab.pixel(26, 26)).name()));
}

QTEST_MAIN(tst_DeclarativeImageProvider)
#include "tst_declarativeimageprovider.moc"
