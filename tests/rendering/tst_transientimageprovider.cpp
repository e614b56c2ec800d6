#include "../common/sceneview.h"
#include "rendering/providers/transientimageprovider.h"
#include "rendering/providers/transientimagetexturefactory.h"

#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QSGTexture>
#include <QTemporaryDir>
#include <QtTest>

// Runs twice: as it is, and with QSG_TRANSIENT_IMAGES set (see decodedImageAfterTexture).
class tst_TransientImageProvider : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void requestTexture_data();
    void requestTexture();
    void drawnOnScreen();
    void decodedImageAfterTexture();

private:
    QTemporaryDir m_dir;
    QString m_image;
};

void tst_TransientImageProvider::initTestCase()
{
    QVERIFY(m_dir.isValid());
    m_image = m_dir.filePath(QStringLiteral("red.png"));
    QImage image(16, 8, QImage::Format_RGB32);
    image.fill(Qt::red);
    QVERIFY(image.save(m_image));
    QFile broken(m_dir.filePath(QStringLiteral("broken.png")));
    QVERIFY(broken.open(QIODevice::WriteOnly));
    broken.write("\x89PNG not really");
}

void tst_TransientImageProvider::requestTexture_data()
{
    QTest::addColumn<QString>("id");
    QTest::addColumn<QSize>("requested");
    QTest::addColumn<QString>("path");
    QTest::addColumn<QSize>("expected");
    QTest::newRow("file URL") << QUrl::fromLocalFile(m_image).toString() << QSize() << m_image << QSize(16, 8);
    QTest::newRow("plain path") << m_image << QSize() << m_image << QSize(16, 8);
    QTest::newRow("scaled") << m_image << QSize(8, 4) << m_image << QSize(8, 4);
    QTest::newRow("one side asked: natural size") << m_image << QSize(8, 0) << m_image << QSize(16, 8);
    const QString broken = m_dir.filePath(QStringLiteral("broken.png"));
    QTest::newRow("unreadable") << broken << QSize() << broken << QSize(0, 0);
    QTest::newRow("missing") << QStringLiteral("/nonexistent/image.png") << QSize()
                             << QStringLiteral("/nonexistent/image.png") << QSize(0, 0);
}

void tst_TransientImageProvider::requestTexture()
{
    QFETCH(QString, id);
    QFETCH(QSize, requested);
    QFETCH(QString, path);
    QFETCH(QSize, expected);
    if (expected.isEmpty()) // once from the provider's factory, once from the direct one
        for (int i = 0; i < 2; ++i)
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^TransientImageProvider: cannot read ") + QRegularExpression::escape(path)));

    TransientImageProvider provider;
    QSize size(-2, -2);
    QScopedPointer<QQuickTextureFactory> factory(provider.requestTexture(id, &size, requested));
    QCOMPARE(size, expected);
    if (expected.isEmpty()) {
        // No factory, so the image element ends in its error state; the factory itself
        // makes no texture and does not report the failure twice.
        QVERIFY(!factory);
        TransientImageTextureFactory direct(path, requested);
        QQuickWindow window;
        QVERIFY(!direct.createTexture(&window));
        return;
    }
    auto transient = qobject_cast<TransientImageTextureFactory *>(factory.data());
    QVERIFY(transient);
    QCOMPARE(transient->path(), path);
    QCOMPARE(transient->image().size(), expected);
}

void tst_TransientImageProvider::drawnOnScreen()
{
    QQuickView view;
    view.engine()->addImageProvider(QStringLiteral("transientimage"), new TransientImageProvider);
    view.setColor(Qt::black);
    QQuickItem *root = showScene(view, "import QtQuick 2.6\n"
                                   "Item { width: 100; height: 100\n"
                                   "  Image { x: 10; y: 10; width: 64; height: 32; source: 'image://transientimage/"
                                           + QUrl::fromLocalFile(m_image).toEncoded() + "' }\n"
                                   "  property Image broken: Image { source: 'image://transientimage/"
                                           + QUrl::fromLocalFile(m_dir.filePath(QStringLiteral("broken.png"))).toEncoded() + "' }\n"
                                   "}\n");
    QVERIFY(root);
    QTRY_COMPARE(root->property("broken").value<QObject *>()->property("status").toInt(), 3); // Image.Error
    QImage grab;
    QTRY_VERIFY((grab = view.grabWindow(), qRed(grab.pixel(40, 25)) > 240 && qGreen(grab.pixel(40, 25)) < 16));
    QCOMPARE(grab.pixel(90, 90), qRgb(0, 0, 0));
}

void tst_TransientImageProvider::decodedImageAfterTexture()
{
    const bool transient = qEnvironmentVariableIsSet("QSG_TRANSIENT_IMAGES");
    QCOMPARE(TransientImageTextureFactory::dropsDecodedImages(), transient);

    TransientImageTextureFactory factory(m_image, QSize());
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
    // The size stays known either way.
    QCOMPARE(factory.textureSize(), QSize(16, 8));
}

QTEST_MAIN(tst_TransientImageProvider)
#include "tst_transientimageprovider.moc"
