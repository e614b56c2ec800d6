#include "window/declarativewindow.h"
#include "window/windowpropertypublisher.h"

#include <QQuickWindow>

// Window state the compositor is told about, as native window properties.

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
