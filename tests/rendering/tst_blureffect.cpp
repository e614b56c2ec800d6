#include "../common/sceneview.h"
#include "rendering/blur/blureffect.h"
#include "rendering/blur/blurkernel.h"

#include <QQmlEngine>
#include <QQuickView>
#include <QSignalSpy>
#include <QtTest>

// Colours on screen are compared with room for filtering and rounding.
static bool near(QRgb pixel, int grey, int tolerance = 10)
{
    return qAbs(qRed(pixel) - grey) <= tolerance && qAbs(qGreen(pixel) - grey) <= tolerance
            && qAbs(qBlue(pixel) - grey) <= tolerance;
}

// Over blue (what a blur not drawn yet shows), 300 x 100: the source at 0 (white on the left,
// black on the right), the effect with `blur` set beside it at 100 (none when empty), `more`.
static QQuickItem *showSource(QQuickView &view, const QByteArray &blur, const QByteArray &more = {})
{
    return showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                           "Rectangle { width: 300; height: 100; color: 'blue'\n"
                           "  Rectangle { id: source; objectName: 'source'; width: 100; height: 100; color: 'black'\n"
                           "    Rectangle { objectName: 'white'; width: 50; height: 100; color: 'white' } }\n"
                           + (blur.isNull() ? QByteArray() : "  BlurEffect { id: blur; x: 100; width: 100; height: 100; "
                                                             "sourceItem: source; " + blur + " }\n")
                           + more + "}\n");
}

class tst_BlurEffect : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void weights_data()
    {
        QTest::addColumn<int>("kernel");
        QTest::addColumn<float>("sigma");
        QTest::newRow("5 taps") << 0 << 1.2f;
        QTest::newRow("9 taps") << 1 << 1.8f;
        QTest::newRow("33 taps, narrow") << 7 << 1.0f;
        QTest::newRow("33 taps, wide") << 7 << 5.4f;
    }

    void weights()
    {
        QFETCH(int, kernel);
        QFETCH(float, sigma);
        const QVector<float> w = BlurKernel::weights(sigma, kernel);
        QCOMPARE(w.size(), 2 * (kernel + 1) + 1);
        double sum = w[0];
        for (int i = 1; i < w.size(); ++i) {
            QVERIFY(w[i] <= w[i - 1] && w[i] >= 0); // far taps of a narrow kernel may vanish, never grow
            sum += 2.0 * w[i];
        }
        QVERIFY(qAbs(sum - 1.0) < 1e-5);
        // The ratio of neighbours is the Gaussian's, whatever the normalisation.
        QVERIFY(qAbs(w[1] / w[0] - std::exp(-1.0 / (2.0 * sigma * sigma))) < 1e-5);
    }

    // Values are clamped; the kernel brings its own deviation until one is written; blur
    // follows the visibility until written.
    void setters()
    {
        BlurEffect blur;
        QSignalSpy deviation(&blur, &BlurEffect::deviationChanged);
        blur.setKernel(BlurEffect::Gaussian33);
        QCOMPARE(blur.deviation(), 5.4f);
        blur.setKernel(99);
        QCOMPARE(blur.kernel(), BlurEffect::Gaussian33);
        blur.setKernel(-3);
        QCOMPARE(blur.kernel(), BlurEffect::Gaussian5);
        QCOMPARE(blur.deviation(), 1.2f);
        QCOMPARE(deviation.count(), 2);
        blur.setDeviation(3.0f);
        blur.setKernel(BlurEffect::Gaussian13);
        QCOMPARE(blur.deviation(), 3.0f);
        blur.resetDeviation();
        QCOMPARE(blur.deviation(), 2.4f);
        blur.setLevels(9);
        QCOMPARE(blur.levels(), 5);
        blur.setLevels(0);
        QCOMPARE(blur.levels(), 1);
        blur.setIterations(-2);
        QCOMPARE(blur.iterations(), 1);

        QSignalSpy changed(&blur, &BlurEffect::blurChanged);
        blur.setVisible(false);
        QVERIFY(!blur.blur());
        blur.setBlur(true);
        blur.setVisible(true);
        blur.setVisible(false);
        QVERIFY(blur.blur());
        blur.resetBlur();
        QVERIFY(!blur.blur());
        QCOMPARE(changed.count(), 3);
    }

    void onScreen_data()
    {
        QTest::addColumn<QString>("settings");
        QTest::addColumn<int>("inside"); // grey level well inside the white half
        QTest::addColumn<int>("edge");   // at the edge between the halves, -1: a sharp edge
        QTest::newRow("no blur") << "intensity: 0" << 255 << -1;
        QTest::newRow("one level, one pass") << "levels: 1" << 255 << 128;
        QTest::newRow("two levels, wide kernel") << "kernel: BlurEffect.Gaussian33; levels: 2" << 255 << 128;
        QTest::newRow("iterated on every level") << "iterations: 3; iterationBehavior: BlurEffect.IterateAllLayers" << 255 << 128;
        QTest::newRow("half red overlay") << "overlayColor: '#80ff0000'; intensity: 0" << -1 << -1;
    }

    void onScreen()
    {
        QFETCH(QString, settings);
        QFETCH(int, inside);
        QFETCH(int, edge);
        QQuickView view;
        QQuickItem *root = showSource(view, settings.toUtf8());
        QVERIFY(root);
        QImage grab;
        QTRY_VERIFY((grab = view.grabWindow(), qBlue(grab.pixel(195, 50)) < 200 || qRed(grab.pixel(195, 50)) > 100));
        if (inside < 0) { // the overlay over white, and over black
            QCOMPARE(qRed(grab.pixel(110, 50)), 255);
            QVERIFY(qAbs(qGreen(grab.pixel(110, 50)) - 127) < 4);
            QVERIFY(qAbs(qRed(grab.pixel(190, 50)) - 128) < 4 && qGreen(grab.pixel(190, 50)) == 0);
            return;
        }
        QVERIFY2(near(grab.pixel(105, 50), inside), qPrintable(QColor(grab.pixel(105, 50)).name()));
        // Nothing is read beyond the source: its far edge stays black.
        QVERIFY2(near(grab.pixel(199, 50), 0), qPrintable(QColor(grab.pixel(199, 50)).name()));
        if (edge < 0) {
            QVERIFY(near(grab.pixel(149, 50), 255) && near(grab.pixel(150, 50), 0));
        } else {
            QVERIFY2(near(grab.pixel(150, 50), edge, 40), qPrintable(QColor(grab.pixel(150, 50)).name()));
            QVERIFY(qRed(grab.pixel(148, 50)) < 250 && qRed(grab.pixel(151, 50)) > 5); // greys on both sides
        }
        // A live source: the white half widened reaches the far edge.
        root->findChild<QQuickItem *>(QStringLiteral("white"))->setWidth(100);
        QTRY_VERIFY(near(view.grabWindow().pixel(199, 50), 255));
    }

    // A white square in the middle of black spreads alike across and down, on every level.
    void sameBothWays()
    {
        QQuickView view;
        QVERIFY(showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                                "Item { width: 240; height: 120\n"
                                "  Rectangle { id: source; width: 120; height: 120; color: 'black'\n"
                                "    Rectangle { x: 50; y: 50; width: 20; height: 20; color: 'white' } }\n"
                                "  BlurEffect { x: 120; width: 120; height: 120; sourceItem: source; kernel: BlurEffect.Gaussian17 }\n"
                                "}\n"));
        QImage grab;
        QTRY_VERIFY((grab = view.grabWindow(), qRed(grab.pixel(180, 60)) > 20));
        for (int distance : { 0, 8, 16, 24 }) {
            const int across = qRed(grab.pixel(180 + distance, 60)), down = qRed(grab.pixel(180, 60 + distance));
            QVERIFY2(qAbs(across - down) <= 8, qPrintable(QStringLiteral("%1: %2 across, %3 down").arg(distance).arg(across).arg(down)));
        }
        // And it does spread: the middle is no longer white, beside the square is lit.
        QVERIFY(qRed(grab.pixel(180, 60)) < 200 && qRed(grab.pixel(180 + 16, 60)) > 10);
    }

    // Three levels leave the result in a corner of the offscreen texture: whoever reads the
    // blur as a texture must see the result alone, as the effect itself draws it.
    void asTextureProvider_data()
    {
        QTest::addColumn<QByteArray>("consumer");
        QTest::newRow("ShaderEffect") << QByteArray("ShaderEffect { property variant source: blur");
        QTest::newRow("ShaderEffectSource") << QByteArray("ShaderEffectSource { sourceItem: blur");
    }

    void asTextureProvider()
    {
        QFETCH(QByteArray, consumer);
        QQuickView view;
        QVERIFY(showSource(view, "levels: 3", "  " + consumer + "; x: 200; width: 100; height: 100 }\n"));
        QImage grab;
        QTRY_VERIFY((grab = view.grabWindow(), qBlue(grab.pixel(150, 50)) < 200 && qBlue(grab.pixel(250, 50)) < 200));
        for (int x : { 5, 30, 50, 70, 95 }) {
            for (int y : { 10, 50, 90 }) {
                const int own = qRed(grab.pixel(100 + x, y)), read = qRed(grab.pixel(200 + x, y));
                QVERIFY2(qAbs(own - read) <= 12, qPrintable(QStringLiteral("at %1,%2: %3 drawn, %4 read").arg(x).arg(y).arg(own).arg(read)));
            }
        }
    }

    void layerGivenBack_data()
    {
        QTest::addColumn<bool>("layerWasOn");
        QTest::addColumn<bool>("destroyBlur"); // otherwise the source changes
        QTest::newRow("source changed") << false << false;
        QTest::newRow("blur destroyed") << false << true;
        QTest::newRow("a layer the application enabled stays") << true << true;
    }

    void layerGivenBack()
    {
        QFETCH(bool, layerWasOn);
        QFETCH(bool, destroyBlur);
        QQuickItem source, other;
        auto layerOn = [](QQuickItem &item) { return item.property("layer").value<QObject *>()->property("enabled").toBool(); };
        source.property("layer").value<QObject *>()->setProperty("enabled", layerWasOn);
        QScopedPointer<BlurEffect> blur(new BlurEffect);
        blur->setSourceItem(&source);
        QVERIFY(layerOn(source));
        if (destroyBlur) {
            blur.reset();
        } else {
            blur->setSourceItem(&other);
            QVERIFY(layerOn(other));
        }
        QCOMPARE(layerOn(source), layerWasOn);
    }

    void sameAfterAnother_data()
    {
        QTest::addColumn<float>("intensity");
        QTest::newRow("blurred") << 1.0f;
        QTest::newRow("half mixed") << 0.5f;
    }

    // An effect made as another on the same source goes (destroy() from QML: deleted a moment
    // later) draws what the first did.
    void sameAfterAnother()
    {
        QFETCH(float, intensity);
        QQuickView view;
        QQuickItem *root = showSource(view, QByteArray());
        QVERIFY(root);
        auto make = [&] {
            auto blur = new BlurEffect(root);
            blur->setPosition(QPointF(100, 0));
            blur->setSize(QSizeF(100, 100));
            blur->setIntensity(intensity);
            blur->setSourceItem(root->findChild<QQuickItem *>(QStringLiteral("source")));
            return blur;
        };
        // The reds along the middle row of the effect, once it draws at all.
        auto row = [&](QVector<int> *reds) {
            QImage grab;
            QTRY_VERIFY_WITH_TIMEOUT((grab = view.grabWindow(), qBlue(grab.pixel(190, 50)) < 100), 5000);
            for (int x = 100; x < 200; ++x)
                reds->append(qRed(grab.pixel(x, 50)));
        };
        QPointer<BlurEffect> first = make();
        QVector<int> before, after;
        row(&before);
        first->deleteLater();
        QScopedPointer<BlurEffect> second(make());
        QTRY_VERIFY(!first);
        row(&after);
        QVERIFY(!QTest::currentTestFailed());
        // The first is blurred: a soft edge, greys between white and black.
        QVERIFY(std::count_if(before.begin(), before.end(), [](int red) { return red > 20 && red < 235; }) >= 4);
        for (int x = 0; x < before.size(); ++x)
            QVERIFY2(qAbs(before.at(x) - after.at(x)) <= 8, qPrintable(QStringLiteral("at %1: %2 first, %3 second").arg(x).arg(before.at(x)).arg(after.at(x))));
    }
};

QTEST_MAIN(tst_BlurEffect)
#include "tst_blureffect.moc"
