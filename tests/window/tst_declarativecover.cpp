#include "window/declarativecover.h"
#include "window/declarativecoveractionarea.h"
#include "window/declarativecoverwindow.h"
#include "window/declarativewindow.h"
#include "theme.h"
#include "window/windowpropertypublisher.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QtTest>

#include <cmath>

class tst_DeclarativeCover : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void statusFromHomeScreen_data()
    {
        QTest::addColumn<int>("sent");
        QTest::addColumn<int>("expected");
        QTest::newRow("activating") << 1 << int(DeclarativeCover::Activating);
        QTest::newRow("active") << 2 << int(DeclarativeCover::Active);
        QTest::newRow("deactivating") << 3 << int(DeclarativeCover::Deactivating);
        QTest::newRow("inactive") << 0 << int(DeclarativeCover::Inactive);
    }

    // The status follows the home screen's signal, once for a repeat; an unknown status
    // leaves it as it is.
    void statusFromHomeScreen()
    {
        QFETCH(int, sent);
        QFETCH(int, expected);
        DeclarativeCover cover;
        if (sent == 0)
            cover.setStatus(DeclarativeCover::Active);
        QSignalSpy changed(&cover, &DeclarativeCover::statusChanged);
        sendStatus(sent);
        sendStatus(sent);
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("setStatus\\(int\\).*invalid status: 7")));
        sendStatus(7);
        QTRY_COMPARE(int(cover.status()), expected);
        QTest::qWait(100);
        QCOMPARE(int(cover.status()), expected);
        QCOMPARE(changed.count(), 1);
    }

    void resizeWithinPermission()
    {
        DeclarativeCover cover;
        const QSize small = Pelkan::Theme::instance()->coverSizeSmall();
        QCOMPARE(cover.size(), DeclarativeCover::Large);
        QSignalSpy size(&cover, &DeclarativeCover::sizeChanged);
        cover.requestResize(small.width(), small.height());
        QCOMPARE(cover.size(), DeclarativeCover::Large);

        cover.setAllowResize(true);
        cover.requestResize(small.width(), small.height());
        QCOMPARE(cover.size(), DeclarativeCover::Small);
        QCOMPARE(QSizeF(cover.width(), cover.height()), QSizeF(small));
        cover.tryResize(small.width() + 1, small.height(), true);
        QCOMPARE(cover.size(), DeclarativeCover::Large);
        QCOMPARE(size.count(), 2);
    }

    void actionArea_data()
    {
        Pelkan::Theme *theme = Pelkan::Theme::instance();
        const qreal large = theme->coverSizeLarge().width();
        QTest::addColumn<qreal>("width");
        QTest::addColumn<qreal>("expectedHeight");
        QTest::newRow("large cover") << large << qMin<qreal>(int(theme->itemSizeSmall()), std::round(large * 0.5));
        QTest::newRow("half size") << large / 2 << qMin<qreal>(int(theme->itemSizeSmall() * 0.5), std::round(large * 0.25));
        // The small item size is under half the large cover's width, so scaling keeps the
        // strip below half of any cover's width; a narrow cover scales it down likewise.
        QTest::newRow("narrow") << 21.0 << qreal(int(theme->itemSizeSmall() * 21.0 / large));
    }

    void actionArea()
    {
        QFETCH(qreal, width);
        QFETCH(qreal, expectedHeight);
        DeclarativeCover cover;
        cover.setSize(QSizeF(width, 400));
        QQuickItem *area = cover.coverActionArea();
        QCOMPARE(area->width(), width);
        QCOMPARE(area->height(), expectedHeight);
        QCOMPARE(area->y(), 400 - expectedHeight);
        // A taller cover keeps the strip at its foot.
        cover.setHeight(450);
        QCOMPARE(area->height(), expectedHeight);
        QCOMPARE(area->y(), 450 - expectedHeight);
    }

    void coverWindowWithoutAlphaIsBlack()
    {
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^DeclarativeCoverWindow: You should be calling")));
        QTest::ignoreMessage(QtWarningMsg, "DeclarativeCoverWindow: You also won't have cover transparency.");
        DeclarativeCoverWindow opaque;
        QCOMPARE(opaque.color(), QColor(Qt::black));
        QVERIFY(opaque.flags() & Qt::CoverWindow);

        QQuickWindow::setDefaultAlphaBuffer(true);
        DeclarativeCoverWindow clear;
        QCOMPARE(clear.color(), QColor(Qt::transparent));
        QQuickWindow::setDefaultAlphaBuffer(false);
    }

    // The cover window finds its cover, pairs with the application window, shows while that
    // is away, and publishes a change of transparency once.
    void coverWindowFollowsApplicationWindow()
    {
        QVector<QVariant> published;
        WindowPropertyPublisher::setSinkForTesting([&published](QWindow *, const QString &name, const QVariant &value) {
            if (name == QLatin1String("TRANSPARENT"))
                published.append(value);
        }, QStringLiteral("wayland"));
        QQuickWindow::setDefaultAlphaBuffer(true);
        DeclarativeCoverWindow coverWindow;
        QQuickWindow::setDefaultAlphaBuffer(false);
        auto cover = new DeclarativeCover(coverWindow.contentItem());
        coverWindow.show();
        QVERIFY(QTest::qWaitForWindowExposed(&coverWindow));
        QCOMPARE(coverWindow.cover(), cover);
        QCOMPARE(coverWindow.windowReference(), QStringLiteral("__winref:%1").arg(coverWindow.winId()));
        published.clear();
        cover->setTransparent(true);
        cover->setTransparent(true);
        cover->setTransparent(false);
        WindowPropertyPublisher::setSinkForTesting({});
        QCOMPARE(published, QVector<QVariant>({ true, false }));

        QQuickWindow main;
        auto applicationWindow = new DeclarativeWindow(main.contentItem());
        main.show();
        QVERIFY(QTest::qWaitForWindowExposed(&main));
        applicationWindow->_setCover(&coverWindow);
        QCOMPARE(coverWindow.mainWindow(), applicationWindow);
        main.hide();
        QTRY_VERIFY(coverWindow.isVisible());
        applicationWindow->_setCover(nullptr);
    }

private:
    static void sendStatus(int status)
    {
        QDBusMessage signal = QDBusMessage::createSignal(QStringLiteral("/com/kavoa/trevanel"),
                                                         QStringLiteral("com.kavoa.trevanel"), QStringLiteral("coverstatus"));
        signal << status;
        QVERIFY(QDBusConnection::sessionBus().send(signal));
    }
};

QTEST_MAIN(tst_DeclarativeCover)
#include "tst_declarativecover.moc"
