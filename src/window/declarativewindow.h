#pragma once

#include "core/control.h"
#include "enums/declarativeorientation.h"

#include <QColor>
#include <QPointer>
#include <QQuickWindow>
#include <QRectF>
#include <QSet>
#include <QVector>

class QScreen;
class WindowEventObserver;

// The root item of an application's user interface.
//
// It chooses the orientation the content is laid out in from the device's orientation and
// the orientations the application allows, mirrors its window state into native window
// properties for the compositor, attaches the cover window, and is the hub through which
// helpers observe every mouse and touch event of the window (see WindowEventObserver).
//
// Decisions beyond the orientation and publication rules:
// - _pageOrientation follows orientation until it is written, and again after a reset.
// - _orientationLocked freezes the orientation; unlocking re-selects it at once.
// - publishCategory sets the "CATEGORY" property to "pelkan"; the cover window pairs
//   with application windows that publish it. ApplicationWindow turns it on.
// - _setCover(window) attaches a cover window: its properties and this window's are
//   republished and the compositor is asked to retain the cover; the cover is detached
//   again when it is destroyed or when _setCover(null) is called. _haveCoverHint follows:
//   true while a cover window is attached, false once it is gone (it can still be
//   written in between).
// - _coverVisible is true while a cover is attached and the application window is not
//   visible in the foreground (or the cover is the primary window); reset recomputes it.
// - queueDeletion(object) deletes the object once the next frame has been rendered, so
//   that the scene graph never sees a deleted item; _processPendingDeletions() does it
//   at once, and happens also when the GL context goes away and before the app quits.
// - deactivate() minimises the window, which sends the application to the background.
// - deviceOrientation follows shownOrientation() of the window's screen: on a desktop the
//   content is upright in the screen's shape, and the orientation says so.
class DeclarativeWindow : public Pelkan::Control
{
    Q_OBJECT
    Q_PROPERTY(DeclarativeOrientation::Orientation orientation READ orientation NOTIFY orientationChanged)
    Q_PROPERTY(DeclarativeOrientation::Orientation _pageOrientation READ pageOrientation WRITE setPageOrientation RESET resetPageOrientation NOTIFY pageOrientationChanged)
    Q_PROPERTY(DeclarativeOrientation::Orientation deviceOrientation READ deviceOrientation WRITE setDeviceOrientation NOTIFY deviceOrientationChanged)
    Q_PROPERTY(DeclarativeOrientation::Orientations defaultAllowedOrientations READ defaultAllowedOrientations CONSTANT)
    Q_PROPERTY(DeclarativeOrientation::Orientations _allowedOrientations READ allowedOrientations WRITE setAllowedOrientations NOTIFY _allowedOrientationsChanged)
    Q_PROPERTY(bool _orientationLocked READ orientationLocked WRITE setOrientationLocked NOTIFY _orientationLockedChanged)
    Q_PROPERTY(int screenRotation READ screenRotation CONSTANT)
    Q_PROPERTY(bool _backgroundVisible READ backgroundVisible WRITE setBackgroundVisible NOTIFY backgroundVisibleChanged)
    Q_PROPERTY(bool _persistentOpenGLContext READ persistentOpenGLContext WRITE setPersistentOpenGLContext)
    Q_PROPERTY(bool _persistentSceneGraph READ persistentSceneGraph WRITE setPersistentSceneGraph)
    Q_PROPERTY(bool _haveCoverHint READ haveCoverHint WRITE setHaveCoverHint NOTIFY haveCoverChanged)
    Q_PROPERTY(bool publishCategory READ publishCategory WRITE setPublishCategory NOTIFY publishCategoryChanged)
    Q_PROPERTY(QColor _backgroundColor READ backgroundColor WRITE setBackgroundColor NOTIFY backgroundColorChanged)
    Q_PROPERTY(bool _coverIsPrimaryWindow READ coverIsPrimaryWindow WRITE setCoverIsPrimaryWindow NOTIFY coverIsPrimaryWindowChanged)
    Q_PROPERTY(bool _coverVisible READ coverVisible WRITE setCoverVisible RESET _updateCoverVisibility NOTIFY coverVisibleChanged)
    Q_PROPERTY(QQuickWindow *_proxyWindow READ proxyWindow WRITE setProxyWindow NOTIFY proxyWindowChanged)
    Q_PROPERTY(QWindow *_mainWindow READ mainWindow WRITE setMainWindow NOTIFY mainWindowChanged)
    Q_PROPERTY(float _windowOpacity READ windowOpacity WRITE setWindowOpacity NOTIFY windowOpacityChanged)
    Q_PROPERTY(QRectF _backgroundRect READ backgroundRect WRITE setBackgroundRect NOTIFY backgroundRectChanged)

public:
    using Orientation = DeclarativeOrientation::Orientation;
    using Orientations = DeclarativeOrientation::Orientations;

    explicit DeclarativeWindow(QQuickItem *parent = nullptr);
    ~DeclarativeWindow() override;

    // The application window object above item (not item itself), or null.
    static DeclarativeWindow *findWindow(QQuickItem *item);

    void registerObserver(WindowEventObserver *observer);
    void unregisterObserver(WindowEventObserver *observer);

    Orientation orientation() const { return m_orientation; }
    Orientation pageOrientation() const;
    void setPageOrientation(Orientation orientation);
    void resetPageOrientation();
    Orientation deviceOrientation() const { return m_deviceOrientation; }
    void setDeviceOrientation(Orientation orientation);
    Orientations defaultAllowedOrientations() const { return m_defaultAllowedOrientations; }
    Orientations allowedOrientations() const { return m_allowedOrientations; }
    void setAllowedOrientations(Orientations allowed);
    bool orientationLocked() const { return m_orientationLocked; }
    void setOrientationLocked(bool locked);
    int screenRotation() const;
    // The configured rotation of the display, as last read by any window.
    static int configuredScreenRotation();

    bool backgroundVisible() const { return m_backgroundVisible; }
    void setBackgroundVisible(bool visible);
    bool persistentOpenGLContext() const { return m_persistentOpenGLContext; }
    void setPersistentOpenGLContext(bool persistent);
    bool persistentSceneGraph() const { return m_persistentSceneGraph; }
    void setPersistentSceneGraph(bool persistent);
    bool haveCoverHint() const { return m_haveCoverHint; }
    void setHaveCoverHint(bool haveCover);
    bool publishCategory() const { return m_publishCategory; }
    void setPublishCategory(bool publish);
    QColor backgroundColor() const;
    void setBackgroundColor(const QColor &color);
    bool coverIsPrimaryWindow() const { return m_coverIsPrimaryWindow; }
    void setCoverIsPrimaryWindow(bool primary);
    bool coverVisible() const { return m_coverVisible; }
    void setCoverVisible(bool visible);
    QQuickWindow *proxyWindow() const { return m_proxyWindow; }
    void setProxyWindow(QQuickWindow *window);
    QWindow *mainWindow() const { return m_mainWindow; }
    void setMainWindow(QWindow *window);
    float windowOpacity() const { return m_windowOpacity; }
    void setWindowOpacity(float opacity);
    QRectF backgroundRect() const { return m_backgroundRect; }
    void setBackgroundRect(const QRectF &rect);

    QWindow *coverWindow() const { return m_coverWindow; }
    // The window whose properties the compositor reads: the main window if set, else ours.
    QWindow *publicationTarget() const;

    void queueDeletion(QObject *object);

    // Whether the system turns the display for applications (a desktop), unlike the
    // device's compositor, which leaves the display as it is built and turning to them.
    static bool turnsDisplayItself();
    // The orientation the user sees the screen in: on the device how it is held; on a
    // desktop the screen's shape (in the orientation the screen reports where that fits).
    static Qt::ScreenOrientation shownOrientation(const QScreen *screen);
    static Qt::ScreenOrientation toScreenOrientation(int orientation);
    static Orientation fromScreenOrientation(Qt::ScreenOrientation orientation, const QScreen *screen);

public Q_SLOTS:
    void activate();
    void deactivate();
    void _processPendingDeletions();
    int _selectOrientation(int allowed, int deviceOrientation) const;
    int _selectOrientation(int allowed) const;
    void _setCover(QObject *window);
    void _updateCoverVisibility();

Q_SIGNALS:
    void orientationChanged();
    void deviceOrientationChanged();
    void _allowedOrientationsChanged();
    void _orientationLockedChanged();
    void screenRotationChanged();
    void backgroundColorChanged();
    void backgroundVisibleChanged();
    void coverIsPrimaryWindowChanged();
    void coverVisibleChanged();
    void proxyWindowChanged();
    void mainWindowChanged();
    void switcherWindowChanged(QQuickWindow *window);
    void haveCoverChanged();
    void windowOpacityChanged();
    void backgroundRectChanged();
    void pageOrientationChanged();
    void publishCategoryChanged();

protected:
    void itemChange(ItemChange change, const ItemChangeData &data) override;
    bool childMouseEventFilter(QQuickItem *item, QEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private Q_SLOTS:
    void setScreenOrientation(Qt::ScreenOrientation orientation);
    void glContextDestroyed(QObject *context);
    void aboutToQuit();
    void screenGeometryChanged(const QRect &geometry);
    void coverWindowDestroyed();
    void proxyWindowDestroyed();
    void mainWindowDestroyed();
    void updateVisibility(bool visible);

private:
    void readConfiguration();
    void followPrimaryScreen();
    void updateOrientation();
    void enterWindow(QQuickWindow *window);
    void trackScreen(QScreen *screen);
    void reportContentOrientation();
    void publishWindowProperties();
    void coverWindowChanged();
    void dispatch(QEvent *event);

    Orientation m_orientation = DeclarativeOrientation::None;
    Orientation m_pageOrientation = DeclarativeOrientation::None;
    bool m_pageOrientationSet = false;
    Orientation m_deviceOrientation = DeclarativeOrientation::Portrait;
    Orientations m_defaultAllowedOrientations;
    Orientations m_allowedOrientations = DeclarativeOrientation::All;
    QPointer<QWindow> m_coverWindow;
    QPointer<QQuickWindow> m_proxyWindow;
    QPointer<QWindow> m_mainWindow;
    QPointer<QQuickWindow> m_window;
    bool m_publishedSinceShown = false;
    QPointer<QScreen> m_screen;
    float m_windowOpacity = 1.0f;
    QRectF m_backgroundRect;
    bool m_orientationLocked = false;
    bool m_backgroundVisible = true;
    bool m_persistentOpenGLContext = false;
    bool m_persistentSceneGraph = false;
    bool m_publishCategory = false;
    bool m_haveCoverHint = false;
    bool m_coverIsPrimaryWindow = false;
    bool m_coverVisible = false;
    QColor m_backgroundColor;
    QSet<WindowEventObserver *> m_observers;
    QVector<QPointer<QObject>> m_pendingDeletions;
    int m_touchPointId = -1; // the finger observers follow, -1 while none
};
