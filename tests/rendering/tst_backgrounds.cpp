#include "../common/configfixture.h"
#include "../common/sceneview.h"
#include "rendering/debug/framerateoverlay.h"

#include <QQuickItem>
#include <QQuickView>
#include <QtTest>

// The drawn backgrounds, checked by the pixels they leave on a white window: the shape's
// edges, radius, border and tail, the gradient's ramp, the frosted backdrop showing what
// lies behind, theme colours arriving from a `dconf write`, and the frame-rate overlay
// leaving an idle window idle. Each case opens a window of its own, so windows come and go.
class tst_Backgrounds : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();
    void pixels_data();
    void pixels();
    void captureOnlyWhileShown();
    void themeColours_data();
    void themeColours();
    void frameRateOverlay();
};

struct Probe {
    QPoint at;
    QRgb expected;
};
Q_DECLARE_METATYPE(QVector<Probe>)

namespace {

const QString ThemeKeys = QStringLiteral("/desktop/quorvane/pelkan/theme/");

QByteArray scene(const QByteArray &body)
{
    return "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\nimport Quorvane.Pelkan.private 1.0\n"
           "Rectangle { width: 240; height: 200; color: 'white'\n" + body + "\n}\n";
}

bool near(QRgb a, QRgb b, int tolerance)
{
    return qAbs(qRed(a) - qRed(b)) <= tolerance && qAbs(qGreen(a) - qGreen(b)) <= tolerance
            && qAbs(qBlue(a) - qBlue(b)) <= tolerance;
}

// Waits for the probes to show (a backdrop takes a frame or two to be captured).
QString mismatch(QQuickView &view, const QVector<Probe> &probes, int tolerance)
{
    QString failure;
    (void)QTest::qWaitFor([&] {
        const QImage image = view.grabWindow();
        failure.clear();
        for (const Probe &p : probes) {
            if (!near(image.pixel(p.at), p.expected, tolerance)) {
                failure = QStringLiteral("at (%1, %2): %3, expected %4")
                                  .arg(p.at.x()).arg(p.at.y())
                                  .arg(QColor(image.pixel(p.at)).name(), QColor(p.expected).name());
                return false;
            }
        }
        return true;
    }, 3000);
    return failure;
}

const QByteArray RedBlue = "Item { id: content; width: 240; height: 200\n"
                           "  Rectangle { width: 120; height: 200; color: 'red' }\n"
                           "  Rectangle { x: 120; width: 120; height: 200; color: 'blue' } }\n";

} // namespace

void tst_Backgrounds::cleanup()
{
    ConfigFixture::reset(ThemeKeys);
}

void tst_Backgrounds::pixels_data()
{
    QTest::addColumn<QByteArray>("body");
    QTest::addColumn<QVector<Probe>>("probes");
    const QRgb white = qRgb(255, 255, 255), red = qRgb(255, 0, 0), blue = qRgb(0, 0, 255);
    const QByteArray glass = "GlassBackgroundBase { x: 20; y: 20; width: 160; height: 100; color: 'red'; "
                             "patternOpacity: 0; radius: 20";
    QTest::newRow("glass: fill and rounded corners")
            << glass + " }"
            << QVector<Probe> { { { 100, 70 }, red }, { { 22, 22 }, white }, { { 21, 70 }, red }, { { 100, 21 }, red },
                                { { 18, 70 }, white }, { { 178, 118 }, white }, { { 100, 122 }, white } };
    QTest::newRow("glass: border inside the edge")
            << glass + "; borderWidth: 6; borderColor: 'blue' }"
            << QVector<Probe> { { { 23, 70 }, blue }, { { 100, 23 }, blue }, { { 30, 70 }, red }, { { 18, 70 }, white } };
    QTest::newRow("glass: translucent fill over the window")
            << QByteArray("GlassBackgroundBase { x: 20; y: 20; width: 160; height: 100; color: Qt.rgba(0, 0, 0, 0.5); "
                          "patternOpacity: 0 }")
            << QVector<Probe> { { { 100, 70 }, qRgb(128, 128, 128) }, { { 10, 70 }, white } };
    // Body 20..180 x 20..120 (the tail's 20 px taken from the bottom), tail base centred at x 60.
    const QByteArray bubble = "BubbleBackground { x: 20; y: 20; width: 160; height: 120; color: 'red'; radius: 10; "
                              "tailSize: 20; tailOffset: 40";
    QTest::newRow("bubble: tail below, straight")
            << bubble + " }"
            << QVector<Probe> { { { 100, 100 }, red }, { { 60, 124 }, red }, { { 60, 132 }, red }, { { 45, 130 }, white },
                                { { 150, 130 }, white }, { { 21, 21 }, white } };
    QTest::newRow("bubble: tail leaning towards the end")
            << bubble + "; tailDirection: 45 }"
            << QVector<Probe> { { { 67, 126 }, red }, { { 57, 126 }, white } };
    // Body 40..180 x 20..140; offset counted from the end: 40 above the bottom.
    QTest::newRow("bubble: tail on the left, from the end")
            << QByteArray("BubbleBackground { x: 20; y: 20; width: 160; height: 120; color: 'blue'; tailSize: 20; "
                          "tailEdge: Qt.LeftEdge; tailOffset: -40 }")
            << QVector<Probe> { { { 25, 100 }, blue }, { { 25, 60 }, white }, { { 100, 60 }, blue } };
    const QByteArray gradient = "OverlayGradientBase { width: 200; height: 100; color: 'black'";
    QTest::newRow("gradient: left to right, linear")
            << gradient + " }"
            << QVector<Probe> { { { 1, 50 }, qRgb(254, 254, 254) }, { { 50, 50 }, qRgb(191, 191, 191) },
                                { { 100, 50 }, qRgb(128, 128, 128) }, { { 198, 50 }, qRgb(2, 2, 2) } };
    QTest::newRow("gradient: clear half, then steeper")
            << gradient + "; offset: 0.5; slope: 2 }"
            << QVector<Probe> { { { 40, 50 }, white }, { { 99, 50 }, white }, { { 150, 50 }, qRgb(128, 128, 128) },
                                { { 199, 50 }, qRgb(3, 3, 3) } };
    QTest::newRow("gradient: bottom to top")
            << gradient + "; direction: OpacityRamp.BottomToTop }"
            << QVector<Probe> { { { 100, 98 }, qRgb(253, 253, 253) }, { { 100, 25 }, qRgb(64, 64, 64) } };
    // The glass lies over the red half and the blue half; blurred, the halves meet in purple.
    const QByteArray backdrop = RedBlue + "OverlayBackgroundSource { id: source; sourceItem: content }\n";
    const QVector<Probe> behind { { { 50, 100 }, red }, { { 190, 100 }, blue }, { { 120, 100 }, qRgb(128, 0, 128) } };
    QTest::newRow("glass: backdrop shows what lies behind")
            << backdrop + "GlassBackgroundBase { x: 20; y: 60; width: 200; height: 80; color: 'transparent'; "
                          "backdrop: source }" << behind;
    QTest::newRow("overlay background: shared source, found in the window")
            << backdrop + "Item { x: 20; y: 60; width: 200; height: 80; OverlayBackground.enabled: true\n"
                          "  OverlayBackground.color: 'transparent' }" << behind;
    QTest::newRow("overlay background: tinted, following a moved overlay")
            << backdrop + "Item { x: 20; y: 60; width: 200; height: 80; OverlayBackground.enabled: true\n"
                          "  OverlayBackground.color: Qt.rgba(1, 1, 1, 0.5)\n"
                          "  Component.onCompleted: x = -100 }"
            << QVector<Probe> { { { 50, 100 }, qRgb(255, 128, 128) }, { { 150, 100 }, blue } };
}

void tst_Backgrounds::pixels()
{
    QFETCH(QByteArray, body);
    QFETCH(QVector<Probe>, probes);
    QQuickView view;
    QVERIFY(showScene(view, scene(body)));
    const QString failure = mismatch(view, probes, 40);
    QVERIFY2(failure.isEmpty(), qPrintable(failure));
}

// The capture is a render of the whole source each time it changes: only while shown.
void tst_Backgrounds::captureOnlyWhileShown()
{
    QQuickView view;
    QQuickItem *root = showScene(view, scene(RedBlue + "OverlayBackgroundSource { objectName: 'source'; sourceItem: content }\n"
                                                      "Item { objectName: 'overlay'; visible: false; width: 100; height: 100\n"
                                                      "  OverlayBackground.enabled: true }\n"
                                                      "Item { objectName: 'inside'; parent: content; width: 50; height: 50 }"));
    QVERIFY(root);
    auto source = root->findChild<QQuickItem *>(QStringLiteral("source"));
    auto overlay = root->findChild<QQuickItem *>(QStringLiteral("overlay"));
    // Only the part behind the overlay, with room for the blur.
    const auto captured = [source] { return source->property("captureRect").toRectF(); };
    QVERIFY(!source->property("active").toBool());
    QVERIFY(captured().isEmpty());
    overlay->setVisible(true);
    QVERIFY(source->property("active").toBool());
    QVERIFY(captured().contains(QRectF(0, 0, 100, 100)));
    QVERIFY(!captured().contains(QRectF(0, 0, 240, 200)));
    overlay->setX(100);
    QTRY_VERIFY(captured().contains(QRectF(100, 0, 100, 100)));
    overlay->setVisible(false);
    QVERIFY(!source->property("active").toBool());
    QVERIFY(captured().isEmpty());

    // An overlay inside what the source captures would show itself: it is told, and drawn plain.
    auto inside = root->findChild<QQuickItem *>(QStringLiteral("inside"));
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression("lies inside .* drawn without the backdrop"));
    QQmlComponent component(view.engine());
    component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                      "GlassBackgroundBase { width: 50; height: 50; color: 'green' }", QUrl());
    QScopedPointer<QQuickItem> glass(qobject_cast<QQuickItem *>(component.create()));
    glass->setParentItem(inside);
    glass->setProperty("backdrop", QVariant::fromValue(source));
    QVERIFY2(mismatch(view, { { { 25, 25 }, qRgb(0, 128, 0) } }, 40).isEmpty(), "the glass is not drawn plain");
}

void tst_Backgrounds::themeColours_data()
{
    QTest::addColumn<QByteArray>("item");
    QTest::addColumn<QString>("key");
    QTest::addColumn<QRgb>("expected"); // over white, after writing #00ff00
    QTest::newRow("glass: overlay colour at 0.6") << QByteArray("GlassBackgroundBase { width: 100; height: 100; patternOpacity: 0 }")
                                                  << "overlay_background_color" << qRgb(102, 255, 102);
    QTest::newRow("bubble: highlight background at 0.3") << QByteArray("BubbleBackground { width: 100; height: 120 }")
                                                         << "highlight_background_color" << qRgb(179, 255, 179);
    QTest::newRow("gradient: overlay colour") << QByteArray("OverlayGradientBase { width: 100; height: 100 }")
                                              << "overlay_background_color" << qRgb(128, 255, 128);
    QTest::newRow("dimmed region: overlay colour at 0.7") << QByteArray("DimmedRegion { width: 100; height: 100 }")
                                                          << "overlay_background_color" << qRgb(77, 255, 77);
    QTest::newRow("underline: error colour") << QByteArray("Underline { width: 100; height: 100; lineWidth: 100; errorHighlight: true }")
                                             << "error_color" << qRgb(0, 255, 0);
}

void tst_Backgrounds::themeColours()
{
    QFETCH(QByteArray, item);
    QFETCH(QString, key);
    QFETCH(QRgb, expected);
    QQuickView view;
    QVERIFY(showScene(view, scene(item)));
    QVERIFY(ConfigFixture::write(ThemeKeys + key, QStringLiteral("'#00ff00'")));
    const QString failure = mismatch(view, { { { 50, 50 }, expected } }, 12);
    QVERIFY2(failure.isEmpty(), qPrintable(failure));
}

void tst_Backgrounds::frameRateOverlay()
{
    QQuickView view;
    QQuickItem *root = showScene(view, scene("property bool spinning: true\n"
                                             "Rectangle { x: 120; y: 120; width: 40; height: 40; color: 'red'\n"
                                             "  NumberAnimation on rotation { running: spinning; from: 0; to: 360; "
                                             "duration: 400; loops: Animation.Infinite } }"));
    QVERIFY(root);
    FrameRateOverlay::setShown(&view, true);
    FrameRateOverlay *overlay = FrameRateOverlay::find(&view);
    QVERIFY(overlay);
    QTRY_VERIFY(overlay->framesPerSecond() > 10);
    QTRY_COMPARE(overlay->frameTimes().size(), int(FrameRateOverlay::History));
    // Drawn over the scene: dark where the white window was.
    QTRY_VERIFY(qRed(view.grabWindow().pixel(overlay->position().toPoint() + QPoint(2, 2))) < 150);

    // Once the animation stops, the overlay's own redraws do not keep the window busy.
    root->setProperty("spinning", false);
    QTest::qWait(1200);
    int swaps = 0;
    connect(&view, &QQuickWindow::frameSwapped, this, [&swaps] { ++swaps; });
    QTest::qWait(1500);
    QVERIFY2(swaps <= 1, qPrintable(QString::number(swaps)));

    FrameRateOverlay::setShown(&view, false);
    QVERIFY(!FrameRateOverlay::find(&view));
}

QTEST_MAIN(tst_Backgrounds)
#include "tst_backgrounds.moc"
