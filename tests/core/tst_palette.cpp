#include "control.h"
#include "palette.h"
#include "theme.h"

#include <QtTest>

using namespace Pelkan;

// Colours are set on a parent palette or the theme and read through a child, so the tests
// only need the process theme's current values, whatever the configuration holds.
class tst_Palette : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void followsThemeUntilSet_data()
    {
        QTest::addColumn<int>("role");
        QTest::addColumn<QByteArray>("property");
        for (int role = 0; role < Theme::ColorRoleCount; ++role) {
            const QByteArray name = QMetaEnum::fromType<Theme::ColorRole>().valueToKey(role);
            QByteArray property = name;
            property[0] = QChar::toLower(uint(property[0]));
            QTest::newRow(name) << role << property;
        }
    }

    void followsThemeUntilSet()
    {
        QFETCH(int, role);
        QFETCH(QByteArray, property);
        Palette palette;
        QCOMPARE(palette.property(property).value<QColor>(), Theme::instance()->color(Theme::ColorRole(role)));

        QSignalSpy changed(&palette, palette.metaObject()->property(palette.metaObject()->indexOfProperty(property)).notifySignal());
        QVERIFY(palette.setProperty(property, QColor(1, 2, 3)));
        QCOMPARE(palette.property(property).value<QColor>(), QColor(1, 2, 3));
        QCOMPARE(changed.count(), 1);
        QVERIFY(palette.isSet(Theme::ColorRole(role)));

        // Setting the same colour again announces nothing.
        palette.setProperty(property, QColor(1, 2, 3));
        QCOMPARE(changed.count(), 1);

        QVERIFY(palette.metaObject()->property(palette.metaObject()->indexOfProperty(property)).reset(&palette));
        QCOMPARE(palette.property(property).value<QColor>(), Theme::instance()->color(Theme::ColorRole(role)));
        QCOMPARE(changed.count(), 2);
        QVERIFY(!palette.isSet(Theme::ColorRole(role)));
    }

    // A child palette shows its parent's colours, announced, until it sets its own; once the
    // parent goes, the theme's.
    void inheritsFromParentPalette()
    {
        Palette child;
        QSignalSpy highlight(&child, &Palette::highlightColorChanged);
        QSignalSpy primary(&child, &Palette::primaryColorChanged);
        {
            Palette parent;
            child.setInheritedPalette(&parent);
            parent.setHighlightColor(Qt::magenta);
            QCOMPARE(child.highlightColor(), QColor(Qt::magenta));
            QCOMPARE(highlight.count(), 1);
            QCOMPARE(primary.count(), 0);
            child.setHighlightColor(Qt::cyan);
            parent.setHighlightColor(Qt::yellow);
            parent.setPrimaryColor(Qt::magenta);
            QCOMPARE(child.highlightColor(), QColor(Qt::cyan));
            QCOMPARE(child.primaryColor(), QColor(Qt::magenta));
            QCOMPARE(highlight.count(), 2);
            parent.setColorScheme(Theme::DarkOnLight);
            QCOMPARE(child.colorScheme(), Theme::DarkOnLight);
        }
        QVERIFY(!child.inheritedPalette());
        QCOMPARE(child.primaryColor(), Theme::instance()->primaryColor());
    }

    // A control takes the palette of its nearest ancestor control, through plain items and
    // also when the plain item joins later; moved out, it follows the theme again.
    void controlsInheritFromNearestAncestorControl()
    {
        Control page;
        QQuickItem plain(&page), container;
        Control button(&plain), later(&container);
        QCOMPARE(button.palette()->inheritedPalette(), page.palette());
        QVERIFY(!later.palette()->inheritedPalette());
        container.setParentItem(&page);
        QCOMPARE(later.palette()->inheritedPalette(), page.palette());
        page.palette()->setHighlightColor(Qt::magenta);
        QCOMPARE(button.palette()->highlightColor(), QColor(Qt::magenta));
        button.setParentItem(nullptr);
        QVERIFY(!button.palette()->inheritedPalette());
        QCOMPARE(button.palette()->highlightColor(), Theme::instance()->highlightColor());
    }
};

QTEST_MAIN(tst_Palette)
#include "tst_palette.moc"
