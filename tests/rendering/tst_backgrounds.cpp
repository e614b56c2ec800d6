#include "../common/configfixture.h"
#include "../common/sceneview.h"
#include "rendering/backgrounds/declarativedimmedregion.h"
#include "rendering/debug/framerateoverlay.h"
#include "rendering/glass/declarativeglassitem.h"
#include "rendering/glass/glassitemnode.h"
#include "rendering/glass/glassmaterial.h"

#include <QQuickItem>
#include <QQuickView>
#include <QTemporaryDir>
#include <QtTest>

// The drawn backgrounds and glass, checked by the pixels they leave: the shapes' edges,
// radius, border and tail, the gradient's ramp, dimming around holes, the glass glow and its
// dashes, the frosted backdrop showing what lies behind, theme colours arriving from a
// `dconf write`, and the frame-rate overlay leaving an idle window idle. Each case opens a
// window of its own, so windows come and go.
Q_DECLARE_METATYPE(QVector<Probe>)

namespace {

const QString ThemeKeys = QStringLiteral("/desktop/quorvane/pelkan/theme/");

QByteArray scene(const QByteArray &body)
{
    return "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\nimport Quorvane.Pelkan.private 1.0\n"
           "Rectangle { width: 240; height: 200; color: 'white'\n" + body + "\n}\n";
}

const QByteArray RedBlue = "Item { id: content; width: 240; height: 200\n"
                           "  Rectangle { width: 120; height: 200; color: 'red' }\n"
                           "  Rectangle { x: 120; width: 120; height: 200; color: 'blue' } }\n";

} // namespace

class tst_Backgrounds : public QObject
{
    Q_OBJECT

    QTemporaryDir m_dir;

private Q_SLOTS:
    void initTestCase()
    {
        QImage white(1024, 16, QImage::Format_ARGB32); // too large for Qt's atlas: a texture of its own
        white.fill(Qt::white);
        QVERIFY(white.save(m_dir.filePath(QStringLiteral("white.png"))));
    }

    void cleanup() { ConfigFixture::reset(ThemeKeys); }

    void pixels_data()
    {
        QTest::addColumn<QByteArray>("body");
        QTest::addColumn<QVector<Probe>>("probes");
        const QRgb white = qRgb(255, 255, 255), red = qRgb(255, 0, 0), blue = qRgb(0, 0, 255), grey = qRgb(128, 128, 128);
        const QByteArray glass = "GlassBackgroundBase { x: 20; y: 20; width: 160; height: 100; color: 'red'; patternOpacity: 0; radius: 20";
        QTest::newRow("glass: fill and rounded corners")
                << glass + " }"
                << QVector<Probe> { { { 100, 70 }, red }, { { 22, 22 }, white }, { { 21, 70 }, red }, { { 100, 21 }, red },
                                    { { 18, 70 }, white }, { { 178, 118 }, white }, { { 100, 122 }, white } };
        QTest::newRow("glass: border inside the edge")
                << glass + "; borderWidth: 6; borderColor: 'blue' }"
                << QVector<Probe> { { { 23, 70 }, blue }, { { 100, 23 }, blue }, { { 30, 70 }, red }, { { 18, 70 }, white } };
        QTest::newRow("glass: translucent fill over the window")
                << QByteArray("GlassBackgroundBase { x: 20; y: 20; width: 160; height: 100; color: Qt.rgba(0, 0, 0, 0.5); patternOpacity: 0 }")
                << QVector<Probe> { { { 100, 70 }, grey }, { { 10, 70 }, white } };
        // Body 20..180 x 20..120 (the tail's 20 px taken from the bottom), tail base centred at x 60.
        const QByteArray bubble = "BubbleBackground { x: 20; y: 20; width: 160; height: 120; color: 'red'; radius: 10; tailSize: 20; tailOffset: 40";
        QTest::newRow("bubble: tail below, straight")
                << bubble + " }"
                << QVector<Probe> { { { 100, 100 }, red }, { { 60, 124 }, red }, { { 60, 132 }, red }, { { 45, 130 }, white },
                                    { { 150, 130 }, white }, { { 21, 21 }, white } };
        QTest::newRow("bubble: tail leaning towards the end")
                << bubble + "; tailDirection: 45 }" << QVector<Probe> { { { 67, 126 }, red }, { { 57, 126 }, white } };
        // Body 40..180 x 20..140; offset counted from the end: 40 above the bottom.
        QTest::newRow("bubble: tail on the left, from the end")
                << QByteArray("BubbleBackground { x: 20; y: 20; width: 160; height: 120; color: 'blue'; tailSize: 20; "
                              "tailEdge: Qt.LeftEdge; tailOffset: -40 }")
                << QVector<Probe> { { { 25, 100 }, blue }, { { 25, 60 }, white }, { { 100, 60 }, blue } };
        const QByteArray gradient = "OverlayGradientBase { width: 200; height: 100; color: 'black'";
        QTest::newRow("gradient: left to right, linear")
                << gradient + " }"
                << QVector<Probe> { { { 1, 50 }, qRgb(254, 254, 254) }, { { 50, 50 }, qRgb(191, 191, 191) }, { { 100, 50 }, grey },
                                    { { 198, 50 }, qRgb(2, 2, 2) } };
        QTest::newRow("gradient: clear half, then steeper")
                << gradient + "; offset: 0.5; slope: 2 }"
                << QVector<Probe> { { { 40, 50 }, white }, { { 99, 50 }, white }, { { 150, 50 }, grey }, { { 199, 50 }, qRgb(3, 3, 3) } };
        QTest::newRow("gradient: bottom to top")
                << gradient + "; direction: OpacityRamp.BottomToTop }"
                << QVector<Probe> { { { 100, 98 }, qRgb(253, 253, 253) }, { { 100, 25 }, qRgb(64, 64, 64) } };
        // Black at 0.5 around an 80 px hole at (60, 60): grey outside, white in the hole.
        const QByteArray dimmed = "Item { id: target; x: 60; y: 60; width: 80; height: 80 }\n"
                                  "DimmedRegion { anchors.fill: parent; color: Qt.rgba(0, 0, 0, 0.5); holes: [target]";
        QTest::newRow("dimmed: inside and outside, a square corner")
                << dimmed + " }" << QVector<Probe> { { { 100, 100 }, white }, { { 30, 100 }, grey }, { { 62, 62 }, white },
                                                     { { 58, 58 }, grey } };
        QTest::newRow("dimmed: a rounded corner") << dimmed + "; radius: 30 }"
                                                  << QVector<Probe> { { { 100, 62 }, white }, { { 62, 62 }, grey } };
        QTest::newRow("dimmed: the hole follows its item")
                << dimmed + " }\nTimer { running: true; interval: 100; onTriggered: target.x = 120 }"
                << QVector<Probe> { { { 160, 100 }, white }, { { 80, 100 }, grey } };
        // The glass item over black: a glow brightest in the middle; along a stretched strip,
        // dashes 20 long every 40 screen pixels only when dashed; a pattern that never loads
        // leaves it as a clear pattern does (#333333 at brightness 0.2), not reading whatever
        // texture the image drawn before it left bound.
        const QByteArray item = "Rectangle { width: 200; height: 200; color: 'black' }\nGlassItem { color: 'white'; ";
        const QRgb black = qRgb(0, 0, 0);
        QTest::newRow("glass item: the glow") << item + "width: 200; height: 200 }"
                                              << QVector<Probe> { { { 100, 100 }, white }, { { 100, 4 }, black }, { { 3, 3 }, black } };
        const QByteArray strip = item + "y: 100; width: 200; height: 60; ratio: 0; dashLength: 20; dashMargin: 20; dashed: ";
        QTest::newRow("glass item: dashed") << strip + "true }" << QVector<Probe> { { { 90, 130 }, white }, { { 110, 130 }, black },
                                                                                     { { 130, 130 }, white }, { { 150, 130 }, black } };
        QTest::newRow("glass item: not dashed") << strip + "false }" << QVector<Probe> { { { 90, 130 }, white }, { { 110, 130 }, white },
                                                                                           { { 150, 130 }, white } };
        QTest::newRow("glass item: a pattern that never loads")
                << "Rectangle { width: 200; height: 200; color: 'black' }\nImage { width: 8; height: 8; source: '"
                           + QUrl::fromLocalFile(m_dir.filePath(QStringLiteral("white.png"))).toEncoded() + "' }\n"
                   "GlassItem { width: 200; height: 200; color: 'white'; brightness: 0.2; pattern: '"
                           + QUrl::fromLocalFile(m_dir.filePath(QStringLiteral("missing.png"))).toEncoded() + "' }"
                << QVector<Probe> { { { 4, 4 }, white }, { { 100, 100 }, qRgb(0x33, 0x33, 0x33) } };
        // The glass lies over the red half and the blue half; blurred, the halves meet in purple.
        const QByteArray backdrop = RedBlue + "OverlayBackgroundSource { id: source; sourceItem: content }\n";
        const QVector<Probe> behind { { { 50, 100 }, red }, { { 190, 100 }, blue }, { { 120, 100 }, qRgb(128, 0, 128) } };
        QTest::newRow("glass: backdrop shows what lies behind")
                << backdrop + "GlassBackgroundBase { x: 20; y: 60; width: 200; height: 80; color: 'transparent'; backdrop: source }"
                << behind;
        QTest::newRow("overlay background: shared source, found in the window")
                << backdrop + "Item { x: 20; y: 60; width: 200; height: 80; OverlayBackground.enabled: true\n"
                              "  OverlayBackground.color: 'transparent' }" << behind;
        QTest::newRow("overlay background: tinted, following a moved overlay")
                << backdrop + "Item { x: 20; y: 60; width: 200; height: 80; OverlayBackground.enabled: true\n"
                              "  OverlayBackground.color: Qt.rgba(1, 1, 1, 0.5)\n  Component.onCompleted: x = -100 }"
                << QVector<Probe> { { { 50, 100 }, qRgb(255, 128, 128) }, { { 150, 100 }, blue } };
    }

    void pixels()
    {
        QFETCH(QByteArray, body);
        QFETCH(QVector<Probe>, probes);
        QQuickView view;
        QVERIFY(showScene(view, scene(body)));
        const QString failure = pixelsDiffer(view, probes, 40);
        QVERIFY2(failure.isEmpty(), qPrintable(failure));
    }

    // The dimming triangles cover the area less the holes exactly once: any triangle drawn
    // twice, or inside a hole, would add to the area.
    void dimmedTriangles_data()
    {
        QTest::addColumn<QVector<QRectF>>("holes");
        QTest::addColumn<qreal>("radius");
        QTest::addColumn<qreal>("dimmed"); // area, in square pixels
        const qreal whole = 200 * 100;
        const qreal corners = 4 * (20 * 20 - M_PI * 20 * 20 / 4); // what rounding gives back, roughly
        QTest::newRow("no hole") << QVector<QRectF>() << 0.0 << whole;
        QTest::newRow("one hole") << QVector<QRectF> { QRectF(50, 20, 40, 30) } << 0.0 << whole - 1200;
        QTest::newRow("two holes side by side") << QVector<QRectF> { QRectF(10, 10, 40, 40), QRectF(60, 30, 50, 60) } << 0.0
                                                << whole - 1600 - 3000;
        QTest::newRow("hole at the edge") << QVector<QRectF> { QRectF(0, 0, 200, 50) } << 0.0 << whole / 2;
        QTest::newRow("rounded") << QVector<QRectF> { QRectF(50, 20, 100, 60) } << 20.0 << whole - 6000 + corners;
    }

    void dimmedTriangles()
    {
        QFETCH(QVector<QRectF>, holes);
        QFETCH(qreal, radius);
        QFETCH(qreal, dimmed);
        const QVector<QPointF> t = DeclarativeDimmedRegion::triangles(QRectF(0, 0, 200, 100), holes, radius);
        QCOMPARE(t.size() % 3, 0);
        qreal area = 0;
        for (int i = 0; i + 2 < t.size(); i += 3)
            area += qAbs((t[i + 1].x() - t[i].x()) * (t[i + 2].y() - t[i].y()) - (t[i + 2].x() - t[i].x()) * (t[i + 1].y() - t[i].y())) / 2;
        QVERIFY2(qAbs(area - dimmed) < (radius > 0 ? 20 : 0.01), qPrintable(QString::number(area)));
    }

    // The capture is a render of the whole source each time it changes: only while shown.
    void captureOnlyWhileShown()
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
        QVERIFY(!source->property("active").toBool() && captured().isEmpty());
        overlay->setVisible(true);
        QVERIFY(source->property("active").toBool());
        QVERIFY(captured().contains(QRectF(0, 0, 100, 100)) && !captured().contains(QRectF(0, 0, 240, 200)));
        overlay->setX(100);
        QTRY_VERIFY(captured().contains(QRectF(100, 0, 100, 100)));
        overlay->setVisible(false);
        QVERIFY(!source->property("active").toBool() && captured().isEmpty());

        // An overlay inside what the source captures would show itself: it is told, and drawn plain.
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression("lies inside .* drawn without the backdrop"));
        QQmlComponent component(view.engine());
        component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                          "GlassBackgroundBase { width: 50; height: 50; color: 'green' }", QUrl());
        QScopedPointer<QQuickItem> glass(qobject_cast<QQuickItem *>(component.create()));
        glass->setParentItem(root->findChild<QQuickItem *>(QStringLiteral("inside")));
        glass->setProperty("backdrop", QVariant::fromValue(source));
        QVERIFY2(pixelsDiffer(view, { { { 25, 25 }, qRgb(0, 128, 0) } }, 40).isEmpty(), "the glass is not drawn plain");
    }

    void themeColours_data()
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

    void themeColours()
    {
        QFETCH(QByteArray, item);
        QFETCH(QString, key);
        QFETCH(QRgb, expected);
        QQuickView view;
        QVERIFY(showScene(view, scene(item)));
        QVERIFY(ConfigFixture::write(ThemeKeys + key, QStringLiteral("'#00ff00'")));
        const QString failure = pixelsDiffer(view, { { { 50, 50 }, expected } }, 12);
        QVERIFY2(failure.isEmpty(), qPrintable(failure));
    }

    void frameRateOverlay()
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

    // The glass item's setters, with their deliberate exceptions.
    void glassSetters()
    {
        DeclarativeGlassItem glass;
        QSignalSpy radius(&glass, &DeclarativeGlassItem::radiusChanged);
        QSignalSpy color(&glass, &DeclarativeGlassItem::colorChanged);
        QSignalSpy background(&glass, &DeclarativeGlassItem::backgroundColorChanged);
        QSignalSpy dashLength(&glass, &DeclarativeGlassItem::dashLengthChanged);
        glass.setRadius(DeclarativeGlassItem::DefaultRadius);
        QCOMPARE(radius.count(), 0);
        glass.setRadius(0.3f);
        glass.resetRadius();
        QCOMPARE(radius.count(), 2);
        QCOMPARE(glass.radius(), 0.15f);
        glass.setBackgroundColor(Qt::red); // announced as a colour change
        QCOMPARE(color.count(), 1);
        QCOMPARE(background.count(), 0);
        glass.setDashLength(50);
        QCOMPARE(dashLength.count(), 1);
        QCOMPARE(glass.defaultFalloffRadius(), 0.15f);
    }

    // One material type per display rotation, blending, comparing field by field; none for
    // another angle.
    void glassMaterials()
    {
        QSet<QSGMaterialType *> types;
        for (int angle : { 0, 90, 180, 270 }) {
            GlassItemNode node(angle);
            QVERIFY(node.glassMaterial());
            QCOMPARE(node.glassMaterial()->angle(), angle);
            QVERIFY(node.glassMaterial()->flags() & QSGMaterial::Blending);
            types.insert(node.glassMaterial()->type());
        }
        QCOMPARE(types.size(), 4);
        QTest::ignoreMessage(QtWarningMsg, "GlassItemNode: invalid angle 45");
        GlassItemNode node(45);
        QVERIFY(!node.material());

        GlassMaterial a(0), b(0);
        a.state().color = b.state().color = Qt::white;
        QCOMPARE(a.compare(&b), 0);
        b.state().dash = QVector3D(0, 50, 1);
        QVERIFY(a.compare(&b) != 0);
        QCOMPARE(a.compare(&b), -b.compare(&a));
    }
};

QTEST_MAIN(tst_Backgrounds)
#include "tst_backgrounds.moc"
