#include "declarativecoverwindow.h"
#include "window/declarativecover.h"
#include "window/declarativewindow.h"
#include "core/pelkanlogging.h"
#include "window/windowpropertypublisher.h"

#include <QExposeEvent>

DeclarativeCoverWindow::DeclarativeCoverWindow(QWindow *parent)
    : QQuickWindow(parent)
{
    if (WindowPropertyPublisher::isWayland())
        setObjectName(QStringLiteral("CoverWindow"));
    setFlags(flags() | Qt::CoverWindow | Qt::FramelessWindowHint);

    if (requestedFormat().alphaBufferSize() < 1) {
        qCWarning(lcPelkanCoverLog, "DeclarativeCoverWindow: You should be calling QQuickWindow::setDefaultAlphaBuffer(true) "
                                    "before creating windows. Failing to do so may result in suboptimal performance.");
        qCWarning(lcPelkanCoverLog, "DeclarativeCoverWindow: You also won't have cover transparency.");
        setColor(QColor(QStringLiteral("black")));
    } else {
        setColor(QColor(QStringLiteral("transparent")));
    }
}

DeclarativeCoverWindow::~DeclarativeCoverWindow()
{
    // The base class deletes the content item, and the cover with it, after this part of
    // the window is gone: its notifications must not reach us then.
    if (m_cover)
        disconnect(m_cover, nullptr, this, nullptr);
    if (m_mainWindow)
        disconnect(m_mainWindow, nullptr, this, nullptr);
}

DeclarativeCover *DeclarativeCoverWindow::cover() const
{
    return m_cover;
}

void DeclarativeCoverWindow::setCover(DeclarativeCover *cover)
{
    if (cover == m_cover)
        return;
    if (m_cover)
        disconnect(m_cover, nullptr, this, nullptr);
    m_cover = cover;
    if (cover) {
        connect(cover, &QObject::destroyed, this, &DeclarativeCoverWindow::coverDestroyed);
        connect(cover, &DeclarativeCover::transparentChanged, this, &DeclarativeCoverWindow::publishWindowProperties);
        if (cover->window() != this)
            cover->setParentItem(contentItem());
    }
    publishWindowProperties();
    Q_EMIT coverChanged();
}

void DeclarativeCoverWindow::setMainWindow(QObject *window)
{
    if (window == m_mainWindow)
        return;
    if (m_mainWindow)
        disconnect(m_mainWindow, nullptr, this, nullptr);
    m_mainWindow = window;
    if (auto applicationWindow = qobject_cast<DeclarativeWindow *>(window)) {
        connect(applicationWindow, &DeclarativeWindow::coverVisibleChanged, this, [this, applicationWindow] {
            updateCoverVisibility(applicationWindow->coverVisible());
        });
        connect(applicationWindow, &DeclarativeWindow::publishCategoryChanged, this, &DeclarativeCoverWindow::publishWindowProperties);
    }
    publishWindowProperties();
    Q_EMIT mainWindowChanged();
}

QString DeclarativeCoverWindow::referenceTo(QWindow *window)
{
    return window ? QStringLiteral("__winref:") + QString::number(window->winId()) : QString();
}

void DeclarativeCoverWindow::setContentSize(float w, float h)
{
    resize(qRound(w), qRound(h));
    if (m_cover)
        m_cover->setSize(QSizeF(w, h));
}

void DeclarativeCoverWindow::coverDestroyed()
{
    m_cover = nullptr;
    publishWindowProperties();
    Q_EMIT coverChanged();
}

void DeclarativeCoverWindow::updateCoverVisibility(bool visible)
{
    m_visibilityRequested = visible;
    setVisible(visible && m_cover);
}

void DeclarativeCoverWindow::exposeEvent(QExposeEvent *event)
{
    QQuickWindow::exposeEvent(event);
    // The native id exists from the first exposure on: publish and tell QML about it.
    if (!m_exposedOnce && handle()) {
        m_exposedOnce = true;
        publishWindowProperties();
        Q_EMIT windowReferenceChanged();
    }
}

void DeclarativeCoverWindow::publishWindowProperties()
{
    if (!WindowPropertyPublisher::canPublish(this))
        return;
    using P = WindowPropertyPublisher;
    P::setProperty(this, QStringLiteral("TRANSPARENT"), m_cover ? m_cover->transparent() : false);
    P::setProperty(this, QStringLiteral("WINID"), qulonglong(winId()));

    auto applicationWindow = qobject_cast<DeclarativeWindow *>(m_mainWindow);
    if (applicationWindow && applicationWindow->publishCategory()) {
        QWindow *target = applicationWindow->publicationTarget();
        P::setProperty(this, QStringLiteral("CATEGORY"), QStringLiteral("pelkan-cover"));
        P::setProperty(this, QStringLiteral("QUORVANE_COVER_WINDOW"), qulonglong(winId()));
        P::setProperty(this, QStringLiteral("QUORVANE_APPLICATION_WINDOW"),
                       target && target->handle() ? QVariant(qulonglong(target->winId())) : QVariant());
    } else {
        P::setProperty(this, QStringLiteral("CATEGORY"), QStringLiteral("cover"));
    }
}
