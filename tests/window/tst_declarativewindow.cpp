#include "../common/configfixture.h"
#include "window/declarativecover.h"
#include "window/declarativecoverwindow.h"
#include "window/declarativewindow.h"
#include "screen.h"
#include "theme.h"
#include "window/windoweventobserver.h"
#include "window/windowpropertypublisher.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QQuickWindow>
#include <QtTest>

#include <cmath>

using O = DeclarativeOrientation;

static const QString AngleKey = QStringLiteral("/desktop/kavoa/components/screen_rotation_angle");
static const QString AllowedKey = QStringLiteral("/desktop/quorvane/pelkan/default_allowed_orientations");
static const QString DiagonalKey = QStringLiteral("/desktop/quorvane/pelkan/screen/diagonal");

class RecordingObserver : public WindowEventObserver
{
public:
    void windowEvent(QEvent *event) override { types.append(event->type()); }
    int count(QEvent::Type type) const { return types.count(type); }
    QVector<QEvent::Type> types;
};

// A plain item that takes presses, standing in for a button under the finger.
class PressTarget : public QQuickItem
{
public:
    explicit PressTarget(QQuickItem *parent) : QQuickItem(parent) { setAcceptedMouseButtons(Qt::LeftButton); }
    int presses = 0;

protected:
    void mousePressEvent(QMouseEvent *event) override { ++presses; event->accept(); }
};

struct PublishedProperty {
    QString name;
    QVariant value;
    QWindow *window;
};

// The application window: orientation, configuration read at start (with the screen's size
// category it depends on), events, publications to the home screen, the cover and its window.
class tst_DeclarativeWindow : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        QVERIFY(ConfigFixture::reset(AngleKey));
        QVERIFY(ConfigFixture::reset(AllowedKey));
        QVERIFY(ConfigFixture::reset(DiagonalKey));
        m_published.clear();
    }

    void cleanup()
    {
        WindowPropertyPublisher::setSinkForTesting({});
        m_window.reset();
    }

    void cleanupTestCase()
    {
        ConfigFixture::reset(AngleKey);
        ConfigFixture::reset(AllowedKey);
        ConfigFixture::reset(DiagonalKey);
    }

    void selectOrientation_data()
    {
        QTest::addColumn<int>("allowed");
        QTest::addColumn<int>("device");
        QTest::addColumn<int>("current");
        QTest::addColumn<int>("expected");
        QTest::newRow("device allowed") << int(O::All) << int(O::Landscape) << int(O::Portrait) << int(O::Landscape);
        QTest::newRow("landscape|inverted portrait, device portrait") << 6 << int(O::Portrait) << int(O::Portrait) << int(O::Landscape);
        QTest::newRow("inverted portrait only, device landscape") << int(O::PortraitInverted) << int(O::Landscape) << int(O::Portrait) << int(O::PortraitInverted);
        QTest::newRow("device disallowed keeps current") << int(O::Portrait | O::Landscape) << int(O::LandscapeInverted) << int(O::Landscape) << int(O::Landscape);
        QTest::newRow("inverted landscape before inverted portrait") << int(O::PortraitInverted | O::LandscapeInverted) << int(O::Portrait) << int(O::Portrait) << int(O::LandscapeInverted);
        QTest::newRow("nothing allowed") << 0 << int(O::Portrait) << int(O::Portrait) << 0;
        QTest::newRow("no orientation bits") << 16 << int(O::Portrait) << int(O::Portrait) << 0;
    }

    void selectOrientation()
    {
        QFETCH(int, allowed);
        QFETCH(int, device);
        QFETCH(int, current);
        QFETCH(int, expected);
        DeclarativeWindow window;
        window.setAllowedOrientations(O::All);
        window.setDeviceOrientation(O::Orientation(current));
        QCOMPARE(int(window.orientation()), current);
        QCOMPARE(window._selectOrientation(allowed, device), expected);
    }

    // The window turns with the device within what is allowed and not while locked; the
    // page orientation follows it until a page sets its own.
    void orientationFollowsDevice()
    {
        DeclarativeWindow window;
        window.setDeviceOrientation(O::Portrait);
        window.setAllowedOrientations(O::Portrait | O::Landscape);
        QCOMPARE(window.orientation(), O::Portrait);
        QSignalSpy changed(&window, &DeclarativeWindow::orientationChanged);
        QSignalSpy pageChanged(&window, &DeclarativeWindow::pageOrientationChanged);

        window.setDeviceOrientation(O::LandscapeInverted);
        QCOMPARE(window.orientation(), O::Portrait);
        window.setDeviceOrientation(O::Landscape);
        QCOMPARE(window.orientation(), O::Landscape);
        QCOMPARE(window.pageOrientation(), O::Landscape);
        QCOMPARE(changed.count(), 1);
        QCOMPARE(pageChanged.count(), 1);

        window.setPageOrientation(O::PortraitInverted);
        window.setDeviceOrientation(O::Portrait);
        QCOMPARE(window.pageOrientation(), O::PortraitInverted);
        QCOMPARE(pageChanged.count(), 2);
        window.resetPageOrientation();
        QCOMPARE(window.pageOrientation(), O::Portrait);
        QCOMPARE(pageChanged.count(), 3);

        window.setDeviceOrientation(O::Landscape);
        window.setOrientationLocked(true);
        window.setDeviceOrientation(O::Portrait);
        window.setAllowedOrientations(O::Portrait);
        QCOMPARE(window.orientation(), O::Landscape);
        QCOMPARE(changed.count(), 3);
        // Unlocking applies what happened meanwhile.
        window.setOrientationLocked(false);
        QCOMPARE(window.orientation(), O::Portrait);
        QCOMPARE(changed.count(), 4);
    }

    void invalidOrientationsAreRefused_data()
    {
        QTest::addColumn<QByteArray>("property");
        QTest::addColumn<int>("value");
        QTest::addColumn<QString>("warning");
        QTest::newRow("no allowed orientation") << QByteArray("_allowedOrientations") << 0 << "Invalid allowedOrientations value: 0";
        QTest::newRow("device facing two ways") << QByteArray("deviceOrientation") << 5 << "Invalid deviceOrientation value: 5";
        QTest::newRow("device facing nowhere") << QByteArray("deviceOrientation") << 0 << "Invalid deviceOrientation value: 0";
        QTest::newRow("device past the four") << QByteArray("deviceOrientation") << 16 << "Invalid deviceOrientation value: 10";
    }

    void invalidOrientationsAreRefused()
    {
        QFETCH(QByteArray, property);
        QFETCH(int, value);
        QFETCH(QString, warning);
        DeclarativeWindow window;
        window.setAllowedOrientations(O::Landscape | O::Portrait);
        window.setDeviceOrientation(O::Landscape);
        QSignalSpy allowedChanged(&window, &DeclarativeWindow::_allowedOrientationsChanged);
        QSignalSpy deviceChanged(&window, &DeclarativeWindow::deviceOrientationChanged);
        QTest::ignoreMessage(QtWarningMsg, qPrintable(warning));
        QVERIFY(window.setProperty(property, value));
        QCOMPARE(window.allowedOrientations(), O::Landscape | O::Portrait);
        QCOMPARE(window.deviceOrientation(), O::Landscape);
        QCOMPARE(window.orientation(), O::Landscape);
        QCOMPARE(allowedChanged.count() + deviceChanged.count(), 0);
    }

    void sizeCategoryForDiagonal_data()
    {
        QTest::addColumn<qreal>("inches");
        QTest::addColumn<int>("category");
        QTest::newRow("just below medium") << 4.49 << int(Pelkan::Screen::Small);
        QTest::newRow("medium starts") << 4.5 << int(Pelkan::Screen::Medium);
        QTest::newRow("large starts") << 7.0 << int(Pelkan::Screen::Large);
        QTest::newRow("extra large starts") << 11.0 << int(Pelkan::Screen::ExtraLarge);
        QTest::newRow("monitor") << 24.0 << int(Pelkan::Screen::ExtraLarge);
    }

    void sizeCategoryForDiagonal()
    {
        QFETCH(qreal, inches);
        QFETCH(int, category);
        QCOMPARE(int(Pelkan::Screen::categoryForDiagonal(inches)), category);
    }

    // A configured diagonal overrides the display's and moves the size category; an
    // unusable one gives the display's own measurement back.
    void configuredDiagonal()
    {
        using Pelkan::Screen;
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

    void defaultAllowedOrientations_data()
    {
        QTest::addColumn<double>("diagonal");
        QTest::addColumn<QString>("configured");
        QTest::addColumn<int>("expected");
        QTest::addColumn<bool>("warns");
        QTest::newRow("phone") << 5.0 << "" << 11 << false;
        QTest::newRow("tablet") << 10.0 << "" << 15 << false;
        QTest::newRow("phone, configured 5") << 5.0 << "5" << 5 << false;
        QTest::newRow("phone, 16 rejected") << 5.0 << "16" << 11 << true;
        QTest::newRow("tablet, 0 rejected") << 10.0 << "0" << 15 << true;
        QTest::newRow("phone, text rejected") << 5.0 << "'all'" << 11 << true;
        QTest::newRow("phone, boolean rejected") << 5.0 << "true" << 11 << true;
        QTest::newRow("phone, 2^32 + 1 not cut to 1") << 5.0 << "int64 4294967297" << 11 << true;
    }

    void defaultAllowedOrientations()
    {
        QFETCH(double, diagonal);
        QFETCH(QString, configured);
        QFETCH(int, expected);
        QFETCH(bool, warns);

        QVERIFY(ConfigFixture::write(DiagonalKey, QString::number(diagonal, 'f', 1)));
        QTRY_COMPARE(Pelkan::Screen::instance()->diagonal(), diagonal);
        if (!configured.isEmpty())
            QVERIFY(ConfigFixture::write(AllowedKey, configured));
        if (warns) {
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral(
                    "^Invalid default allowed orientations defined. Check your device configuration! Defaulting to:")));
        }
        DeclarativeWindow window;
        QCOMPARE(int(window.defaultAllowedOrientations()), expected);
    }

    void screenRotation()
    {
        QVERIFY(ConfigFixture::write(AngleKey, QStringLiteral("270")));
        QCOMPARE(DeclarativeWindow().screenRotation(), 270);

        QVERIFY(ConfigFixture::write(AngleKey, QStringLiteral("45")));
        QTest::ignoreMessage(QtWarningMsg, "Invalid screenOrientation angle configured: 45");
        QCOMPARE(DeclarativeWindow().screenRotation(), 270);

        QVERIFY(ConfigFixture::write(AngleKey, QStringLiteral("-90")));
        QCOMPARE(DeclarativeWindow().screenRotation(), -90);
        QVERIFY(ConfigFixture::write(AngleKey, QStringLiteral("0")));
        QCOMPARE(DeclarativeWindow().screenRotation(), 0);
    }

    // Observers see every mouse and touch event and the loss of a grab, once however often
    // they registered, and consume nothing.
    void observersSeeEveryEventOnce()
    {
        DeclarativeWindow *window = showWindow();
        QVERIFY(window);
        auto target = new PressTarget(window);
        target->setSize(window->size());
        auto thief = new QQuickItem(window);
        RecordingObserver observer;
        window->registerObserver(&observer);
        window->registerObserver(&observer);
        const auto unregister = qScopeGuard([&] { window->unregisterObserver(&observer); });

        QTest::mousePress(m_window.data(), Qt::LeftButton, {}, QPoint(50, 50));
        QTest::mouseMove(m_window.data(), QPoint(60, 80));
        QTest::mouseRelease(m_window.data(), Qt::LeftButton, {}, QPoint(60, 80));
        // (Qt may add a move of its own before the press.)
        QCOMPARE(observer.count(QEvent::MouseButtonPress), 1);
        QCOMPARE(observer.count(QEvent::MouseButtonRelease), 1);
        QVERIFY(observer.types.indexOf(QEvent::MouseMove, observer.types.indexOf(QEvent::MouseButtonPress)) > 0);
        QCOMPARE(target->presses, 1);

        QTest::mousePress(m_window.data(), Qt::LeftButton, {}, QPoint(50, 50));
        QCOMPARE(m_window->mouseGrabberItem(), target);
        const int ungrabs = observer.count(QEvent::UngrabMouse);
        thief->grabMouse();
        QCOMPARE(observer.count(QEvent::UngrabMouse), ungrabs + 1);
        QTest::mouseRelease(m_window.data(), Qt::LeftButton, {}, QPoint(50, 50));

        QTouchDevice *device = QTest::createTouchDevice();
        QTest::touchEvent(m_window.data(), device).press(0, QPoint(40, 40));
        QTest::touchEvent(m_window.data(), device).move(0, QPoint(40, 90));
        QTest::touchEvent(m_window.data(), device).release(0, QPoint(40, 90));
        QCOMPARE(observer.count(QEvent::TouchBegin), 1);
        QCOMPARE(observer.count(QEvent::TouchUpdate), 1);
        QCOMPARE(observer.count(QEvent::TouchEnd), 1);

        window->unregisterObserver(&observer);
        observer.types.clear();
        QTest::mouseClick(m_window.data(), Qt::LeftButton, {}, QPoint(50, 50));
        QVERIFY(observer.types.isEmpty());
        QCOMPARE(target->presses, 4); // the touch reached it as a press too
    }

    void leavingTheWindowWarnsOnlyForATree()
    {
        DeclarativeWindow *window = showWindow();
        QVERIFY(window);
        QQuickItem holder(m_window->contentItem());
        window->setParentItem(&holder);
        QTest::ignoreMessage(QtWarningMsg, "DeclarativeWindow::Item does not belong to a window");
        holder.setParentItem(nullptr);
        QVERIFY(!window->window());

        // Torn down or detached on purpose: no parent, nothing to say.
        window->setParentItem(m_window->contentItem());
        static int warnings;
        warnings = 0;
        QtMessageHandler previous = qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &, const QString &) {
            if (type == QtWarningMsg)
                ++warnings;
        });
        window->setParentItem(nullptr);
        delete window;
        qInstallMessageHandler(previous);
        QCOMPARE(warnings, 0);
    }

    // Off wayland, and on it for a window without a native handle, nothing is published.
    void nothingPublishedOffWaylandOrWithoutAHandle()
    {
        record(QStringLiteral("wayland"));
        QQuickWindow hidden;
        DeclarativeWindow unshown(hidden.contentItem());
        unshown.setPublishCategory(true);
        unshown.setBackgroundRect(QRectF(0, 10, 100, 50));
        QVERIFY(m_published.isEmpty());

        record(QString());
        DeclarativeWindow *window = showWindow();
        QVERIFY(window);
        QCOMPARE(QGuiApplication::platformName(), QStringLiteral("xcb"));
        window->setPublishCategory(true);
        window->setBackgroundVisible(false);
        window->setBackgroundRect(QRectF(0, 0, 10, 10));
        auto cover = new QWindow;
        window->_setCover(cover);
        delete cover;
        QVERIFY(m_published.isEmpty());

        // The colour is the window's own, not a compositor property: it applies everywhere,
        // also when declared before the item has a window.
        window->setParentItem(nullptr);
        window->setBackgroundColor(QColor(Qt::darkCyan));
        window->setParentItem(m_window->contentItem());
        QCOMPARE(m_window->color(), QColor(Qt::darkCyan));
        QCOMPARE(window->backgroundColor(), QColor(Qt::darkCyan));
    }

    // A cover window finds its cover and publishes each change of its transparency once.
    // Attached to the application window: the home screen is told, the two pair, the cover
    // shows while the application is away (or always, as the primary window), and its end
    // is announced too.
    void coverAttachAndDestroy()
    {
        record(QStringLiteral("wayland"));
        DeclarativeWindow *window = showWindow();
        QVERIFY(window);
        QSignalSpy switcher(window, &DeclarativeWindow::switcherWindowChanged);
        QQuickWindow::setDefaultAlphaBuffer(true);
        auto coverWindow = new DeclarativeCoverWindow;
        QQuickWindow::setDefaultAlphaBuffer(false);
        auto cover = new DeclarativeCover(coverWindow->contentItem());
        coverWindow->show();
        QVERIFY(QTest::qWaitForWindowExposed(coverWindow));
        QCOMPARE(coverWindow->cover(), cover);
        QCOMPARE(coverWindow->windowReference(), QStringLiteral("__winref:%1").arg(coverWindow->winId()));
        m_published.clear();
        cover->setTransparent(true);
        cover->setTransparent(true);
        cover->setTransparent(false);
        QVariantList transparent;
        for (const PublishedProperty &property : publishedBy(coverWindow)) {
            if (property.name == QLatin1String("TRANSPARENT"))
                transparent << property.value;
        }
        QCOMPARE(transparent, QVariantList({ true, false }));
        coverWindow->hide();

        m_published.clear();
        window->_setCover(coverWindow);
        QVector<PublishedProperty> own = publishedBy(m_window.data());
        QCOMPARE(own.first().name, QStringLiteral("QUORVANE_RETAIN_COVER"));
        QCOMPARE(own.first().value, QVariant(true));
        QCOMPARE(own.at(3).name, QStringLiteral("QUORVANE_COVER_WINDOW"));
        QCOMPARE(own.at(3).value.toULongLong(), qulonglong(coverWindow->winId()));
        // The home screen is told there is a cover with the same publication.
        QCOMPARE(own.at(4).name, QStringLiteral("QUORVANE_HAVE_COVER"));
        QCOMPARE(own.at(4).value, QVariant(true));
        QCOMPARE(switcher.count(), 1);
        QCOMPARE(switcher.last().first().value<QQuickWindow *>(), coverWindow);
        QCOMPARE(coverWindow->mainWindow(), window);

        // The application is in the foreground: its cover is not on show until it leaves.
        QVERIFY(!window->coverVisible());
        m_window->hide();
        QVERIFY(window->coverVisible());
        QTRY_VERIFY(coverWindow->isVisible());
        window->setCoverIsPrimaryWindow(true);
        m_window->show();
        QVERIFY(window->coverVisible());

        m_published.clear();
        delete coverWindow;
        QVERIFY(!window->coverWindow());
        own = publishedBy(m_window.data());
        QCOMPARE(own.first().name, QStringLiteral("QUORVANE_RETAIN_COVER"));
        QCOMPARE(own.first().value, QVariant(false));
        QCOMPARE(own.at(4).value, QVariant(false));
        QVERIFY(!window->haveCoverHint());
        QVERIFY(!window->coverVisible());
        QCOMPARE(switcher.count(), 2);
    }

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

    void queuedDeletionWaitsForAFrame()
    {
        DeclarativeWindow *window = showWindow();
        QVERIFY(window);
        auto item = new QQuickItem(window);
        QPointer<QQuickItem> guard(item);
        item->setParentItem(nullptr);
        window->queueDeletion(item);
        QVERIFY(guard);
        QTRY_VERIFY(guard.isNull());

        // Outside a window there is no frame to wait for.
        DeclarativeWindow loose;
        auto object = new QObject;
        QPointer<QObject> looseGuard(object);
        loose.queueDeletion(object);
        QTRY_VERIFY(looseGuard.isNull());
    }

private:
    DeclarativeWindow *showWindow();
    static void sendStatus(int status)
    {
        QDBusMessage signal = QDBusMessage::createSignal(QStringLiteral("/com/kavoa/trevanel"),
                                                         QStringLiteral("com.kavoa.trevanel"), QStringLiteral("coverstatus"));
        signal << status;
        QVERIFY(QDBusConnection::sessionBus().send(signal));
    }

    QVector<PublishedProperty> publishedBy(QWindow *window) const
    {
        QVector<PublishedProperty> own;
        std::copy_if(m_published.cbegin(), m_published.cend(), std::back_inserter(own),
                     [window](const PublishedProperty &property) { return property.window == window; });
        return own;
    }
    void record(const QString &platform)
    {
        WindowPropertyPublisher::setSinkForTesting([this](QWindow *window, const QString &name, const QVariant &value) {
            m_published.append({ name, value, window });
        }, platform);
    }
    QScopedPointer<QQuickWindow> m_window;
    QVector<PublishedProperty> m_published;
};

DeclarativeWindow *tst_DeclarativeWindow::showWindow()
{
    m_window.reset(new QQuickWindow);
    m_window->resize(400, 600);
    auto item = new DeclarativeWindow(m_window->contentItem());
    item->setSize(QSizeF(400, 600));
    m_window->show();
    if (!QTest::qWaitForWindowExposed(m_window.data()))
        return nullptr;
    return item;
}

QTEST_MAIN(tst_DeclarativeWindow)
#include "tst_declarativewindow.moc"
