#include "../common/sceneview.h"
#include "rendering/glass/declarativeglassitem.h"
#include "rendering/glass/glassitemnode.h"
#include "rendering/glass/glassmaterial.h"

#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QTemporaryDir>
#include <QtTest>

static int luminance(QRgb pixel)
{
    return (qRed(pixel) * 11 + qGreen(pixel) * 16 + qBlue(pixel) * 5) / 32;
}

class tst_DeclarativeGlassItem : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void setterRules();
    void materialPerRotation();
    void invalidAngleLeavesNoMaterial();
    void statesCompareFieldByField();
    void glowIsBrightestInTheMiddle();
    void dashesOnlyWhenDashed_data();
    void dashesOnlyWhenDashed();
    void missingPatternDrawsAsClear();

private:
    QImage render(const QByteArray &glass, const QSize &size);
};

void tst_DeclarativeGlassItem::setterRules()
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

    // The background colour announces itself as a colour change.
    glass.setBackgroundColor(Qt::red);
    QCOMPARE(color.count(), 1);
    QCOMPARE(background.count(), 0);

    glass.setDashLength(50);
    QCOMPARE(dashLength.count(), 1);
    QCOMPARE(glass.defaultFalloffRadius(), 0.15f);
}

void tst_DeclarativeGlassItem::materialPerRotation()
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
}

void tst_DeclarativeGlassItem::invalidAngleLeavesNoMaterial()
{
    QTest::ignoreMessage(QtWarningMsg, "GlassItemNode: invalid angle 45");
    GlassItemNode node(45);
    QVERIFY(!node.material());
}

void tst_DeclarativeGlassItem::statesCompareFieldByField()
{
    GlassMaterial a(0), b(0);
    a.state().color = b.state().color = Qt::white;
    QCOMPARE(a.compare(&b), 0);
    b.state().dash = QVector3D(0, 50, 1);
    QVERIFY(a.compare(&b) != 0);
    QCOMPARE(a.compare(&b), -b.compare(&a));
}

QImage tst_DeclarativeGlassItem::render(const QByteArray &glass, const QSize &size)
{
    QQuickView view;
    view.setColor(Qt::black);
    if (!showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                         "Item { width: " + QByteArray::number(size.width()) + "; height: " + QByteArray::number(size.height())
                         + "\n  GlassItem { anchors.fill: parent; " + glass + " } }\n"))
        return QImage();
    QTest::qWait(100); // the pattern arrives from the image provider
    return view.grabWindow();
}

void tst_DeclarativeGlassItem::glowIsBrightestInTheMiddle()
{
    const QImage image = render("color: 'white'", QSize(200, 200));
    QVERIFY(!image.isNull());
    const int centre = luminance(image.pixel(100, 100));
    const int edge = luminance(image.pixel(100, 4));
    const int corner = luminance(image.pixel(3, 3));
    QVERIFY2(centre > 150, qPrintable(QString::number(centre)));
    QVERIFY2(centre > edge + 60, qPrintable(QStringLiteral("%1 vs %2").arg(centre).arg(edge)));
    QVERIFY(corner <= edge);
}

void tst_DeclarativeGlassItem::dashesOnlyWhenDashed_data()
{
    QTest::addColumn<bool>("dashed");
    QTest::newRow("dashed") << true;
    QTest::newRow("plain") << false;
}

void tst_DeclarativeGlassItem::dashesOnlyWhenDashed()
{
    QFETCH(bool, dashed);
    // A stretched glow along a wide strip, sampled along its middle.
    const QImage image = render("color: 'white'; ratio: 0; dashed: " + QByteArray(dashed ? "true" : "false")
                                        + "; dashLength: 20; dashMargin: 20",
                                QSize(400, 60));
    QVERIFY(!image.isNull());
    int darkest = 255;
    for (int x = 60; x < 340; x += 2)
        darkest = qMin(darkest, luminance(image.pixel(x, 30)));
    if (dashed)
        QVERIFY2(darkest < 40, qPrintable(QString::number(darkest)));
    else
        QVERIFY2(darkest > 120, qPrintable(QString::number(darkest)));
}

// A pattern that never loads leaves the glass as a clear pattern would, not reading
// whatever texture the image drawn before it left bound (a white one, too large for
// Qt's atlas).
void tst_DeclarativeGlassItem::missingPatternDrawsAsClear()
{
    QTemporaryDir dir;
    QImage clear(8, 8, QImage::Format_ARGB32);
    clear.fill(Qt::transparent);
    QImage white(1024, 16, QImage::Format_ARGB32);
    white.fill(Qt::white);
    QVERIFY(clear.save(dir.filePath(QStringLiteral("clear.png"))) && white.save(dir.filePath(QStringLiteral("white.png"))));
    auto centre = [&](const QString &pattern) {
        QQuickView view;
        view.setColor(Qt::black);
        if (!showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                             "Item { width: 200; height: 200\n"
                             "  Image { width: 8; height: 8; source: '" + QUrl::fromLocalFile(dir.filePath(QStringLiteral("white.png"))).toEncoded() + "' }\n"
                             "  GlassItem { anchors.fill: parent; color: 'white'; brightness: 0.2; pattern: '" + QUrl::fromLocalFile(dir.filePath(pattern)).toEncoded() + "' } }\n"))
            return -1;
        for (int waited = 0; waited < 5000 && luminance(view.grabWindow().pixel(4, 4)) < 200; waited += 50)
            QTest::qWait(50);
        QTest::qWait(100); // the pattern, where there is one, arrives from its loader
        return luminance(view.grabWindow().pixel(100, 100));
    };
    const int withClear = centre(QStringLiteral("clear.png"));
    const int withMissing = centre(QStringLiteral("missing.png"));
    QVERIFY(withClear >= 0);
    QVERIFY2(qAbs(withClear - withMissing) <= 12, qPrintable(QStringLiteral("%1 with a clear pattern, %2 without").arg(withClear).arg(withMissing)));
}

QTEST_MAIN(tst_DeclarativeGlassItem)
#include "tst_declarativeglassitem.moc"
