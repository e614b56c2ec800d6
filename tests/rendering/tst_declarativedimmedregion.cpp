#include "../common/sceneview.h"
#include "rendering/backgrounds/declarativedimmedregion.h"

#include <QQuickItem>
#include <QQuickView>
#include <QtTest>

// Dimming around holes: the triangles cover the area less the holes exactly once, and the
// window shows the holes clear (rounded where asked) and following a moving item.
class tst_DeclarativeDimmedRegion : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void coversEverythingButTheHolesOnce_data();
    void coversEverythingButTheHolesOnce();
    void pixels_data();
    void pixels();
};

static qreal area(const QVector<QPointF> &triangles)
{
    qreal sum = 0;
    for (int i = 0; i + 2 < triangles.size(); i += 3) {
        const QPointF a = triangles.at(i), b = triangles.at(i + 1), c = triangles.at(i + 2);
        sum += qAbs((b.x() - a.x()) * (c.y() - a.y()) - (c.x() - a.x()) * (b.y() - a.y())) / 2;
    }
    return sum;
}

void tst_DeclarativeDimmedRegion::coversEverythingButTheHolesOnce_data()
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

void tst_DeclarativeDimmedRegion::coversEverythingButTheHolesOnce()
{
    QFETCH(QVector<QRectF>, holes);
    QFETCH(qreal, radius);
    QFETCH(qreal, dimmed);
    const QVector<QPointF> triangles = DeclarativeDimmedRegion::triangles(QRectF(0, 0, 200, 100), holes, radius);
    QCOMPARE(triangles.size() % 3, 0);
    // Any triangle drawn twice, or inside a hole, would add to the area.
    QVERIFY2(qAbs(area(triangles) - dimmed) < (radius > 0 ? 20 : 0.01), qPrintable(QString::number(area(triangles))));
}

// Black at 0.5 over white: grey outside, white in the holes.
void tst_DeclarativeDimmedRegion::pixels_data()
{
    QTest::addColumn<qreal>("radius");
    QTest::addColumn<int>("moveTo");  // the hole item's new x, or -1
    QTest::addColumn<QPoint>("clear");
    QTest::addColumn<QPoint>("dim");
    QTest::newRow("inside and outside") << 0.0 << -1 << QPoint(100, 100) << QPoint(30, 100);
    QTest::newRow("square corner is clear") << 0.0 << -1 << QPoint(62, 62) << QPoint(58, 58);
    QTest::newRow("rounded corner is dimmed") << 30.0 << -1 << QPoint(100, 62) << QPoint(62, 62);
    QTest::newRow("the hole follows its item") << 0.0 << 120 << QPoint(160, 100) << QPoint(80, 100);
}

void tst_DeclarativeDimmedRegion::pixels()
{
    QFETCH(qreal, radius);
    QFETCH(int, moveTo);
    QFETCH(QPoint, clear);
    QFETCH(QPoint, dim);
    QQuickView view;
    QQuickItem *root = showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                                       "Rectangle { width: 240; height: 200; color: 'white'\n"
                                       "  Item { id: target; objectName: 'target'; x: 60; y: 60; width: 80; height: 80 }\n"
                                       "  DimmedRegion { objectName: 'dim'; anchors.fill: parent; color: Qt.rgba(0, 0, 0, 0.5)\n"
                                       "    holes: [target] } }\n");
    QVERIFY(root);
    root->findChild<QObject *>(QStringLiteral("dim"))->setProperty("radius", radius);
    if (moveTo >= 0)
        root->findChild<QQuickItem *>(QStringLiteral("target"))->setX(moveTo);
    QImage image;
    QTRY_VERIFY([&] {
        image = view.grabWindow();
        return qRed(image.pixel(clear)) > 240 && qAbs(qRed(image.pixel(dim)) - 128) < 12;
    }());
}

QTEST_MAIN(tst_DeclarativeDimmedRegion)
#include "tst_declarativedimmedregion.moc"
