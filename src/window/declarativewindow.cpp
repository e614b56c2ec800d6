#include "declarativewindow.h"
#include "rendering/debug/framerateoverlay.h"
#include "core/pelkanlogging.h"
#include "window/windowpropertypublisher.h"

#include <QGuiApplication>
#include <QOpenGLContext>
#include <QQuickWindow>
#include <QScreen>

// The window item's life in its window, its cover and deferred deletions. Orientation,
// publication to the compositor and the event hub live in files of their own.

DeclarativeWindow::DeclarativeWindow(QQuickItem *parent)
    : Pelkan::Control(parent)
{
    readConfiguration();
    followPrimaryScreen();

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

    coverWindowChanged();
}

void DeclarativeWindow::coverWindowDestroyed()
{
    m_coverWindow = nullptr;
    coverWindowChanged();
}

void DeclarativeWindow::coverWindowChanged()
{
    // The home screen learns with the window whether there is a cover to show.
    const bool haveCover = m_coverWindow != nullptr;
    const bool hintChanged = haveCover != m_haveCoverHint;
    m_haveCoverHint = haveCover;
    WindowPropertyPublisher::setRetainCover(publicationTarget(), haveCover);
    publishWindowProperties();
    if (hintChanged)
        Q_EMIT haveCoverChanged();
    Q_EMIT switcherWindowChanged(qobject_cast<QQuickWindow *>(m_coverWindow.data()));
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

    if (FrameRateOverlay::requestedByEnvironment())
        FrameRateOverlay::setShown(window, true);

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

void DeclarativeWindow::queueDeletion(QObject *object)
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
