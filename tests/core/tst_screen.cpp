#include "../common/configfixture.h"
#include "screen.h"

#include <QGuiApplication>
#include <QScreen>
#include <QtTest>

using Pelkan::Screen;

static const QString DiagonalKey = QStringLiteral("/desktop/quorvane/pelkan/screen/diagonal");

class tst_Screen : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { QVERIFY(ConfigFixture::reset(DiagonalKey)); }
    void cleanupTestCase() { ConfigFixture::reset(DiagonalKey); }

    void categoryForDiagonal_data()
    {
        QTest::addColumn<qreal>("inches");
        QTest::addColumn<int>("category");
        QTest::newRow("just below medium") << 4.49 << int(Screen::Small);
        QTest::newRow("medium starts") << 4.5 << int(Screen::Medium);
        QTest::newRow("large starts") << 7.0 << int(Screen::Large);
        QTest::newRow("extra large starts") << 11.0 << int(Screen::ExtraLarge);
        QTest::newRow("monitor") << 24.0 << int(Screen::ExtraLarge);
    }

    void categoryForDiagonal()
    {
        QFETCH(qreal, inches);
        QFETCH(int, category);
        QCOMPARE(int(Screen::categoryForDiagonal(inches)), category);
    }

    // A configured diagonal overrides the display's and moves the size category; an
    // unusable one gives the display's own measurement back.
    void configuredDiagonal()
    {
        const qreal display = Screen().diagonal();
        Screen screen;
        QVERIFY(ConfigFixture::write(DiagonalKey, QStringLiteral("5.5")));
        QTRY_COMPARE(screen.diagonal(), 5.5);
        QCOMPARE(screen.sizeCategory(), Screen::Medium);

        QSignalSpy changed(&screen, &Screen::sizeCategoryChanged);
        QVERIFY(ConfigFixture::write(DiagonalKey, QStringLiteral("10.0")));
        QTRY_COMPARE(changed.count(), 1);
        QCOMPARE(screen.sizeCategory(), Screen::Large);
        QTRY_COMPARE(Screen::instance()->sizeCategory(), Screen::Large);

        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^Screen: ignoring invalid diagonal")));
        QVERIFY(ConfigFixture::write(DiagonalKey, QStringLiteral("-3.0")));
        QTRY_COMPARE(screen.diagonal(), display);
    }
};

QTEST_MAIN(tst_Screen)
#include "tst_screen.moc"
