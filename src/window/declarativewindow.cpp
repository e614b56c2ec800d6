#include "declarativewindow.h"
#include "configvalue.h"
#include "mgconfitem.h"
#include "pelkanlogging.h"
#include "screen.h"
#include "windoweventobserver.h"
#include "windowpropertypublisher.h"

#include <QGuiApplication>
#include <QOpenGLContext>
#include <QQuickWindow>
#include <QScreen>

namespace {

const Qt::ScreenOrientations AllScreenOrientations = Qt::PortraitOrientation | Qt::LandscapeOrientation
        | Qt::InvertedPortraitOrientation | Qt::InvertedLandscapeOrientation;

// The configured rotation of the display, shared by every window of the process.
int s_screenRotation = 0;

bool isPointerEvent(QEvent::Type type)
{
    switch (type) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        return true;
    default:
        return false;
    }
}

} // namespace

DeclarativeWindow::DeclarativeWindow(QQuickItem *parent)
    : Pelkan::Control(parent)
{
    readConfiguration();

    if (QScreen *screen = QGuiApplication::primaryScreen()) {
        screen->setOrientationUpdateMask(AllScreenOrientations);
        m_deviceOrientation = fromScreenOrientation(screen->orientation(), screen);
        setSize(screen->size());
        connect(screen, &QScreen::geometryChanged, this, &DeclarativeWindow::screenGeometryChanged);
    } else {
        setSize(QSizeF(540, 960));
    }

    if (!m_orientationLocked)
        updateOrientation();

    setFlag(ItemIsFocusScope);
    setAcceptedMouseButtons(Qt::LeftButton);
    setFiltersChildMouseEvents(true);

    if (QCoreApplication *app = QCoreApplication::instance())
        connect(app, &QCoreApplication::aboutToQuit, this, &DeclarativeWindow::aboutToQuit);

    // A parent given at construction put the item in its window before this class's
    // itemChange() could see it.
    if (window())
        enterWindow(window());
}

DeclarativeWindow::~DeclarativeWindow()
{
    if (m_window)
        m_window->removeEventFilter(this);
    _processPendingDeletions();
}

void DeclarativeWindow::readConfiguration()
{
    const QVariant angle = MGConfItem(QStringLiteral("/desktop/kavoa/components/screen_rotation_angle")).value();
    if (angle.isValid()) {
        int degrees = 0;
        const bool ok = ConfigValue::toInt(angle, &degrees);
        if (ok && degrees % 90 == 0)
            s_screenRotation = degrees;
        else if (ok)
            qCWarning(lcPelkanCoreLog, "Invalid screenOrientation angle configured: %d", degrees);
        else
            qCWarning(lcPelkanCoreLog) << "Invalid screenOrientation angle configured:" << angle;
    }

    // Inverted portrait is left out on phones on purpose: it is rarely wanted and easily
    // reached by accident.
    m_defaultAllowedOrientations = Pelkan::Screen::instance()->sizeCategory() > Pelkan::Screen::Medium
            ? Orientations(DeclarativeOrientation::All)
            : Orientations(DeclarativeOrientation::Portrait | DeclarativeOrientation::Landscape
                           | DeclarativeOrientation::LandscapeInverted);

    const QVariant allowed = MGConfItem(QStringLiteral("/desktop/quorvane/pelkan/default_allowed_orientations")).value();
    if (allowed.isValid()) {
        int value = 0;
        if (ConfigValue::toInt(allowed, &value) && value > 0 && value <= DeclarativeOrientation::All) {
            m_defaultAllowedOrientations = Orientations(value);
        } else {
            qCWarning(lcPelkanCoreLog) << "Invalid default allowed orientations defined. Check your device configuration! Defaulting to:"
                                       << m_defaultAllowedOrientations;
        }
    }
}

DeclarativeWindow *DeclarativeWindow::findWindow(QQuickItem *item)
{
    for (QQuickItem *ancestor = item ? item->parentItem() : nullptr; ancestor; ancestor = ancestor->parentItem()) {
        if (auto window = qobject_cast<DeclarativeWindow *>(ancestor))
            return window;
    }
    return nullptr;
}

void DeclarativeWindow::registerObserver(WindowEventObserver *observer)
{
    if (observer)
        m_observers.insert(observer);
}

void DeclarativeWindow::unregisterObserver(WindowEventObserver *observer)
{
    m_observers.remove(observer);
}

// Orientation ---------------------------------------------------------------------------

int DeclarativeWindow::_selectOrientation(int allowed, int deviceOrientation) const
{
    if (deviceOrientation & allowed)
        return deviceOrientation;
    if (m_orientation & allowed)
        return m_orientation;
    // Landscape before inverted portrait, deliberately.
    for (int candidate : { DeclarativeOrientation::Portrait, DeclarativeOrientation::Landscape,
                           DeclarativeOrientation::LandscapeInverted, DeclarativeOrientation::PortraitInverted }) {
        if (allowed & candidate)
            return candidate;
    }
    return DeclarativeOrientation::None;
}

int DeclarativeWindow::_selectOrientation(int allowed) const
{
    return _selectOrientation(allowed, m_deviceOrientation);
}

void DeclarativeWindow::updateOrientation()
{
    const int selected = _selectOrientation(int(m_allowedOrientations), m_deviceOrientation);
    if (selected == DeclarativeOrientation::None || selected == m_orientation)
        return;
    m_orientation = Orientation(selected);
    reportContentOrientation();
    Q_EMIT orientationChanged();
    if (!m_pageOrientationSet)
        Q_EMIT pageOrientationChanged();
}

void DeclarativeWindow::reportContentOrientation()
{
    const Qt::ScreenOrientation orientation = toScreenOrientation(m_orientation);
    if (m_window && orientation != Qt::PrimaryOrientation)
        m_window->reportContentOrientationChange(orientation);
}

Qt::ScreenOrientation DeclarativeWindow::toScreenOrientation(int orientation)
{
    switch (orientation) {
    case DeclarativeOrientation::Portrait:
        return Qt::PortraitOrientation;
    case DeclarativeOrientation::Landscape:
        return Qt::LandscapeOrientation;
    case DeclarativeOrientation::PortraitInverted:
        return Qt::InvertedPortraitOrientation;
    case DeclarativeOrientation::LandscapeInverted:
        return Qt::InvertedLandscapeOrientation;
    default:
        return Qt::PrimaryOrientation;
    }
}

DeclarativeWindow::Orientation DeclarativeWindow::fromScreenOrientation(Qt::ScreenOrientation orientation,
                                                                        const QScreen *screen)
{
    if (orientation == Qt::PrimaryOrientation && screen)
        orientation = screen->primaryOrientation();
    switch (orientation) {
    case Qt::LandscapeOrientation:
        return DeclarativeOrientation::Landscape;
    case Qt::InvertedPortraitOrientation:
        return DeclarativeOrientation::PortraitInverted;
    case Qt::InvertedLandscapeOrientation:
        return DeclarativeOrientation::LandscapeInverted;
    default:
        return DeclarativeOrientation::Portrait;
    }
}

void DeclarativeWindow::setScreenOrientation(Qt::ScreenOrientation orientation)
{
    m_deviceOrientation = fromScreenOrientation(orientation, m_screen);
    Q_EMIT deviceOrientationChanged();
    if (!m_orientationLocked)
        updateOrientation();
}

void DeclarativeWindow::setDeviceOrientation(Orientation orientation)
{
    // A device faces one way at a time.
    switch (orientation) {
    case DeclarativeOrientation::Portrait:
    case DeclarativeOrientation::Landscape:
    case DeclarativeOrientation::PortraitInverted:
    case DeclarativeOrientation::LandscapeInverted:
        break;
    default:
        qCWarning(lcPelkanCoreLog, "Invalid deviceOrientation value: %x", uint(orientation));
        return;
    }
    if (orientation == m_deviceOrientation)
        return;
    m_deviceOrientation = orientation;
    Q_EMIT deviceOrientationChanged();
    if (!m_orientationLocked)
        updateOrientation();
}

void DeclarativeWindow::setAllowedOrientations(Orientations allowed)
{
    if (!allowed) {
        qCWarning(lcPelkanCoreLog, "Invalid allowedOrientations value: %x", uint(allowed));
        return;
    }
    if (allowed == m_allowedOrientations)
        return;
    m_allowedOrientations = allowed;
    Q_EMIT _allowedOrientationsChanged();
    if (!m_orientationLocked)
        updateOrientation();
}

void DeclarativeWindow::setOrientationLocked(bool locked)
{
    if (locked == m_orientationLocked)
        return;
    m_orientationLocked = locked;
    Q_EMIT _orientationLockedChanged();
    if (!locked)
        updateOrientation();
}

DeclarativeWindow::Orientation DeclarativeWindow::pageOrientation() const
{
    return m_pageOrientationSet ? m_pageOrientation : m_orientation;
}

void DeclarativeWindow::setPageOrientation(Orientation orientation)
{
    const Orientation before = pageOrientation();
    m_pageOrientation = orientation;
    m_pageOrientationSet = true;
    if (pageOrientation() != before)
        Q_EMIT pageOrientationChanged();
}

void DeclarativeWindow::resetPageOrientation()
{
    const Orientation before = pageOrientation();
    m_pageOrientationSet = false;
    if (pageOrientation() != before)
        Q_EMIT pageOrientationChanged();
}

int DeclarativeWindow::screenRotation() const
{
    return s_screenRotation;
}

int DeclarativeWindow::configuredScreenRotation()
{
    return s_screenRotation;
}

// Window state mirrored to the compositor -----------------------------------------------

void DeclarativeWindow::setBackgroundVisible(bool visible)
{
    if (visible == m_backgroundVisible)
        return;
    m_backgroundVisible = visible;
    publishWindowProperties();
    Q_EMIT backgroundVisibleChanged();
}

void DeclarativeWindow::setPersistentOpenGLContext(bool persistent)
{
    m_persistentOpenGLContext = persistent;
}

void DeclarativeWindow::setPersistentSceneGraph(bool persistent)
{
    m_persistentSceneGraph = persistent;
}

void DeclarativeWindow::setHaveCoverHint(bool haveCover)
{
    if (haveCover == m_haveCoverHint)
        return;
    m_haveCoverHint = haveCover;
    publishWindowProperties();
    Q_EMIT haveCoverChanged();
}

void DeclarativeWindow::setPublishCategory(bool publish)
{
    if (publish == m_publishCategory)
        return;
    m_publishCategory = publish;
    publishWindowProperties();
    Q_EMIT publishCategoryChanged();
}

QColor DeclarativeWindow::backgroundColor() const
{
    return m_window ? m_window->color() : m_backgroundColor;
}

void DeclarativeWindow::setBackgroundColor(const QColor &color)
{
    const QColor before = backgroundColor();
    m_backgroundColor = color;
    if (m_window) {
        // The window announces its colour change, which is ours.
        if (m_window->color() != color) {
            m_window->setColor(color);
            m_window->update();
        }
    } else if (before != color) {
        Q_EMIT backgroundColorChanged();
    }
}

void DeclarativeWindow::setCoverIsPrimaryWindow(bool primary)
{
    if (primary == m_coverIsPrimaryWindow)
        return;
    m_coverIsPrimaryWindow = primary;
    Q_EMIT coverIsPrimaryWindowChanged();
    _updateCoverVisibility();
}

void DeclarativeWindow::setCoverVisible(bool visible)
{
    if (visible == m_coverVisible)
        return;
    m_coverVisible = visible;
    Q_EMIT coverVisibleChanged();
}

void DeclarativeWindow::setProxyWindow(QQuickWindow *window)
{
    if (window == m_proxyWindow)
        return;
    if (m_proxyWindow)
        disconnect(m_proxyWindow, &QObject::destroyed, this, &DeclarativeWindow::proxyWindowDestroyed);
    m_proxyWindow = window;
    if (window)
        connect(window, &QObject::destroyed, this, &DeclarativeWindow::proxyWindowDestroyed);
    Q_EMIT proxyWindowChanged();
}

void DeclarativeWindow::setMainWindow(QWindow *window)
{
    if (window == m_mainWindow)
        return;
    if (m_mainWindow)
        disconnect(m_mainWindow, &QObject::destroyed, this, &DeclarativeWindow::mainWindowDestroyed);
    m_mainWindow = window;
    if (window)
        connect(window, &QObject::destroyed, this, &DeclarativeWindow::mainWindowDestroyed);
    publishWindowProperties();
    Q_EMIT mainWindowChanged();
}

void DeclarativeWindow::setWindowOpacity(float opacity)
{
    if (qFuzzyCompare(opacity, m_windowOpacity))
        return;
    m_windowOpacity = opacity;
    publishWindowProperties();
    Q_EMIT windowOpacityChanged();
}

void DeclarativeWindow::setBackgroundRect(const QRectF &rect)
{
    if (rect == m_backgroundRect)
        return;
    m_backgroundRect = rect;
    publishWindowProperties();
    Q_EMIT backgroundRectChanged();
}

QWindow *DeclarativeWindow::publicationTarget() const
{
    return m_mainWindow ? m_mainWindow.data() : static_cast<QWindow *>(m_window.data());
}

void DeclarativeWindow::publishWindowProperties()
{
    QWindow *target = publicationTarget();
    if (!WindowPropertyPublisher::canPublish(target))
        return;

    using P = WindowPropertyPublisher;
    P::setProperty(target, QStringLiteral("BACKGROUND_VISIBLE"), m_backgroundVisible);
    P::setProperty(target, QStringLiteral("WINID"), qulonglong(target->winId()));
    P::setProperty(target, QStringLiteral("QUORVANE_COVER_WINDOW"),
                   m_coverWindow ? QVariant(qulonglong(m_coverWindow->winId())) : QVariant());
    P::setProperty(target, QStringLiteral("QUORVANE_HAVE_COVER"), m_haveCoverHint);
    if (m_publishCategory)
        P::setProperty(target, QStringLiteral("CATEGORY"), QStringLiteral("pelkan"));
    P::setProperty(target, QStringLiteral("WINDOW_OPACITY"), QVariant::fromValue(m_windowOpacity));
    if (m_backgroundRect.width() > 0 && m_backgroundRect.height() > 0)
        P::setProperty(target, QStringLiteral("BACKGROUND_RECT"), m_backgroundRect);

    // The cover window keeps its own properties matching ours.
    if (m_coverWindow && m_coverWindow->metaObject()->indexOfMethod("publishWindowProperties()") >= 0)
        QMetaObject::invokeMethod(m_coverWindow, "publishWindowProperties");
}

// Cover ---------------------------------------------------------------------------------

void DeclarativeWindow::_setCover(QObject *window)
{
    QWindow *cover = qobject_cast<QWindow *>(window);
    if (window && !cover) {
        qCWarning(lcPelkanCoreLog) << "DeclarativeWindow: a cover must be a window, not" << window;
        return;
    }
    if (cover == m_coverWindow)
        return;
    if (m_coverWindow)
        disconnect(m_coverWindow, &QObject::destroyed, this, &DeclarativeWindow::coverWindowDestroyed);
    m_coverWindow = cover;
    if (cover) {
        connect(cover, &QObject::destroyed, this, &DeclarativeWindow::coverWindowDestroyed);
        // A cover window pairs itself with the application window it belongs to.
        if (cover->metaObject()->indexOfProperty("mainWindow") >= 0)
            cover->setProperty("mainWindow", QVariant::fromValue<QObject *>(this));
    }

    WindowPropertyPublisher::setRetainCover(publicationTarget(), cover != nullptr);
    publishWindowProperties();
    Q_EMIT switcherWindowChanged(qobject_cast<QQuickWindow *>(cover));
    _updateCoverVisibility();
}

void DeclarativeWindow::coverWindowDestroyed()
{
    m_coverWindow = nullptr;
    WindowPropertyPublisher::setRetainCover(publicationTarget(), false);
    publishWindowProperties();
    Q_EMIT switcherWindowChanged(nullptr);
    _updateCoverVisibility();
}

void DeclarativeWindow::_updateCoverVisibility()
{
    const bool foreground = m_window && m_window->isVisible()
            && !(m_window->windowStates() & Qt::WindowMinimized);
    setCoverVisible(m_coverWindow && (m_coverIsPrimaryWindow || !foreground));
}

void DeclarativeWindow::proxyWindowDestroyed()
{
    m_proxyWindow = nullptr;
    Q_EMIT proxyWindowChanged();
}

void DeclarativeWindow::mainWindowDestroyed()
{
    m_mainWindow = nullptr;
    publishWindowProperties();
    Q_EMIT mainWindowChanged();
}

// Window life ---------------------------------------------------------------------------

void DeclarativeWindow::itemChange(ItemChange change, const ItemChangeData &data)
{
    Pelkan::Control::itemChange(change, data);
    if (change == ItemSceneChange)
        enterWindow(data.window);
}

void DeclarativeWindow::enterWindow(QQuickWindow *window)
{
    // A window that is being destroyed has already let go of its content item.
    const bool previousDestroyed = m_window && !m_window->contentItem();
    if (m_window) {
        disconnect(m_window, nullptr, this, nullptr);
        m_window->removeEventFilter(this);
    }
    m_window = window;
    m_publishedSinceShown = false;
    if (!window) {
        // Torn down with its window, or detached on purpose: nothing worth a warning.
        if (parentItem() && !previousDestroyed)
            qCWarning(lcPelkanCoreLog, "DeclarativeWindow::Item does not belong to a window");
        return;
    }

    if (m_backgroundColor.isValid())
        window->setColor(m_backgroundColor);
    if (WindowPropertyPublisher::isWayland()) {
        window->setPersistentOpenGLContext(m_persistentOpenGLContext);
        window->setPersistentSceneGraph(m_persistentSceneGraph);
        publishWindowProperties();
    }

    connect(window, &QQuickWindow::colorChanged, this, &DeclarativeWindow::backgroundColorChanged);
    connect(window, &QWindow::visibleChanged, this, &DeclarativeWindow::updateVisibility);
    connect(window, &QWindow::windowStateChanged, this, &DeclarativeWindow::_updateCoverVisibility);
    connect(window, &QQuickWindow::sceneGraphInitialized, this, [this, window] {
        // Render thread: hear about the context going away on the GUI thread.
        if (QOpenGLContext *context = window->openglContext())
            connect(context, &QObject::destroyed, this, &DeclarativeWindow::glContextDestroyed, Qt::QueuedConnection);
    }, Qt::DirectConnection);
    connect(window, &QQuickWindow::frameSwapped, this, &DeclarativeWindow::_processPendingDeletions, Qt::QueuedConnection);
    connect(window, &QWindow::screenChanged, this, &DeclarativeWindow::trackScreen);
    window->installEventFilter(this);

    trackScreen(window->screen());
}

void DeclarativeWindow::trackScreen(QScreen *screen)
{
    if (m_screen)
        disconnect(m_screen, &QScreen::orientationChanged, this, &DeclarativeWindow::setScreenOrientation);
    m_screen = screen;
    if (!screen)
        return;
    screen->setOrientationUpdateMask(AllScreenOrientations);
    connect(screen, &QScreen::orientationChanged, this, &DeclarativeWindow::setScreenOrientation);
    setScreenOrientation(screen->orientation());
    reportContentOrientation();
}

void DeclarativeWindow::updateVisibility(bool visible)
{
    // A window gets its native handle when it is first shown, and a hidden window's
    // compositor side may be gone when it shows again.
    if (visible)
        publishWindowProperties();
    else
        m_publishedSinceShown = false;
    _updateCoverVisibility();
}

void DeclarativeWindow::screenGeometryChanged(const QRect &geometry)
{
    setSize(geometry.size());
}

void DeclarativeWindow::activate()
{
    if (!m_window)
        return;
    m_window->showFullScreen();
    m_window->requestActivate();
    m_window->raise();
}

void DeclarativeWindow::deactivate()
{
    if (m_window)
        m_window->showMinimized();
}

void DeclarativeWindow::_queueDeletion(QObject *object)
{
    if (!object)
        return;
    if (!m_window || !m_window->isExposed()) {
        object->deleteLater();
        return;
    }
    m_pendingDeletions.append(object);
    m_window->update();
}

void DeclarativeWindow::_processPendingDeletions()
{
    const QVector<QPointer<QObject>> pending = std::exchange(m_pendingDeletions, {});
    for (const QPointer<QObject> &object : pending)
        delete object.data();
}

void DeclarativeWindow::glContextDestroyed(QObject *)
{
    _processPendingDeletions();
}

void DeclarativeWindow::aboutToQuit()
{
    _processPendingDeletions();
}

// Event hub -----------------------------------------------------------------------------

bool DeclarativeWindow::eventFilter(QObject *watched, QEvent *event)
{
    if (watched != m_window)
        return false;
    if (!m_observers.isEmpty() && isPointerEvent(event->type())) {
        dispatch(event);
    } else if (event->type() == QEvent::Expose && !m_publishedSinceShown && m_window->handle()) {
        // The compositor's side of a window exists once it is first exposed: properties
        // set before that are lost, so they go out again now.
        m_publishedSinceShown = true;
        publishWindowProperties();
    }
    return false;
}

bool DeclarativeWindow::childMouseEventFilter(QQuickItem *item, QEvent *event)
{
    // The window sends the grab loss to the item and its filtering ancestors only.
    if (event->type() == QEvent::UngrabMouse && !m_observers.isEmpty())
        dispatch(event);
    return Pelkan::Control::childMouseEventFilter(item, event);
}

void DeclarativeWindow::dispatch(QEvent *event)
{
    const bool accepted = event->isAccepted();
    const QList<WindowEventObserver *> observers = m_observers.values();
    for (WindowEventObserver *observer : observers) {
        // An earlier observer may have unregistered this one.
        if (!m_observers.contains(observer))
            continue;
        observer->windowEvent(event);
        event->setAccepted(accepted);
    }

    // Qt Quick turns touches into mouse events only inside its item delivery, where the
    // window never sees them; observers written for the mouse get the same here. Like a
    // mouse, they follow one finger: the first to go down, until it lifts; the others are
    // ignored until a finger goes down again after that.
    const QEvent::Type type = event->type();
    if (type == QEvent::TouchCancel) {
        m_touchPointId = -1;
        return;
    }
    if (type != QEvent::TouchBegin && type != QEvent::TouchUpdate && type != QEvent::TouchEnd)
        return;
    if (type == QEvent::TouchBegin)
        m_touchPointId = -1; // no finger was down, whatever was missed before
    const QList<QTouchEvent::TouchPoint> points = static_cast<QTouchEvent *>(event)->touchPoints();
    const QTouchEvent::TouchPoint *followed = nullptr;
    for (const QTouchEvent::TouchPoint &point : points) {
        const bool candidate = m_touchPointId < 0 ? point.state() == Qt::TouchPointPressed : point.id() == m_touchPointId;
        if (candidate) {
            followed = &point;
            break;
        }
    }
    if (!followed)
        return;

    QEvent::Type mouseType = QEvent::MouseMove;
    if (m_touchPointId < 0) {
        m_touchPointId = followed->id();
        mouseType = QEvent::MouseButtonPress;
    } else if (followed->state() == Qt::TouchPointReleased || type == QEvent::TouchEnd) {
        m_touchPointId = -1;
        mouseType = QEvent::MouseButtonRelease;
    } else if (followed->state() != Qt::TouchPointMoved) {
        return;
    }
    const Qt::MouseButtons buttons = mouseType == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent mouse(mouseType, followed->pos(), followed->pos(), followed->screenPos(), Qt::LeftButton, buttons,
                      Qt::NoModifier, Qt::MouseEventSynthesizedByQt);
    mouse.setTimestamp(static_cast<QTouchEvent *>(event)->timestamp());
    dispatch(&mouse);
}
