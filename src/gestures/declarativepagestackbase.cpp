#include "declarativepagestackbase.h"
#include "gestures/declarativedragfilter.h"
#include "core/pelkanlogging.h"
#include "window/windowpropertypublisher.h"

#include <QDir>
#include <QLibraryInfo>
#include <QFile>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QRegularExpression>
#include <QStyleHints>
#include <QUrl>

DeclarativePageStackBase::DeclarativePageStackBase(QQuickItem *parent)
    : Pelkan::Control(parent)
{
    setFiltersChildMouseEvents(true);
    setAcceptedMouseButtons(Qt::LeftButton);
    installEventFilter(this);
}

// Setters -----------------------------------------------------------------------------

void DeclarativePageStackBase::setDepth(int depth)
{
    if (depth == m_depth)
        return;
    m_depth = depth;
    Q_EMIT depthChanged();
}

void DeclarativePageStackBase::setBackNavigation(bool enabled)
{
    if (enabled == m_backNavigation)
        return;
    m_backNavigation = enabled;
    Q_EMIT backNavigationChanged();
}

void DeclarativePageStackBase::setForwardNavigation(bool enabled)
{
    if (enabled == m_forwardNavigation)
        return;
    m_forwardNavigation = enabled;
    Q_EMIT forwardNavigationChanged();
}

void DeclarativePageStackBase::setNavigationStyle(DeclarativePageNavigation::Style style)
{
    if (style == m_navigationStyle)
        return;
    m_navigationStyle = style;
    Q_EMIT navigationStyleChanged();
    Q_EMIT horizontalNavigationStyleChanged();
}

void DeclarativePageStackBase::setOngoingTransitionCount(int count)
{
    if (count == m_ongoingTransitionCount)
        return;
    const bool wasBusy = busy();
    m_ongoingTransitionCount = count;
    Q_EMIT ongoingTransitionCountChanged();
    if (wasBusy != busy())
        Q_EMIT busyChanged();
}

void DeclarativePageStackBase::setCurrentContainer(QQuickItem *container)
{
    if (container == m_currentContainer.data())
        return;
    m_currentContainer = container;
    Q_EMIT currentContainerChanged();
}

void DeclarativePageStackBase::setCurrentPage(QQuickItem *page)
{
    if (page == m_currentPage.data())
        return;
    m_currentPage = page;
    Q_EMIT currentPageChanged();
}

void DeclarativePageStackBase::setNoGrabbing(bool noGrabbing)
{
    if (noGrabbing == m_noGrabbing)
        return;
    m_noGrabbing = noGrabbing;
    Q_EMIT noGrabbingChanged();
}

// Events ------------------------------------------------------------------------------

void DeclarativePageStackBase::mousePressEvent(QMouseEvent *event)
{
    // A press is never taken: the page's content gets it, and the swipe is stolen later.
    m_claimedByChild = {};
    handleMouse(event);
    event->ignore();
}

void DeclarativePageStackBase::mouseMoveEvent(QMouseEvent *event)
{
    handleMouse(event);
}

void DeclarativePageStackBase::mouseReleaseEvent(QMouseEvent *event)
{
    handleMouse(event);
}

void DeclarativePageStackBase::mouseUngrabEvent()
{
    reset();
}

bool DeclarativePageStackBase::childMouseEventFilter(QQuickItem *item, QEvent *event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        // A drag the item under the finger claims for itself is not a swipe.
        m_claimedByChild = DeclarativeDragFilter::claimed(item, this);
        m_releasedByChild = DeclarativeDragFilter::released(
                item, this, m_navigationStyle == DeclarativePageNavigation::Vertical ? Qt::Vertical : Qt::Horizontal);
        return handleMouse(static_cast<QMouseEvent *>(event));
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
        return handleMouse(static_cast<QMouseEvent *>(event));
    case QEvent::UngrabMouse:
        if (window() && window()->mouseGrabberItem() && window()->mouseGrabberItem() != this)
            reset();
        return false;
    default:
        return false;
    }
}

bool DeclarativePageStackBase::handleMouse(QMouseEvent *event)
{
    if (event->type() == QEvent::MouseButtonRelease) {
        handleRelease();
        return false;
    }
    if (!m_currentContainer || !m_currentPage || !isVisible() || !parentItem())
        return false;
    if (event->type() != QEvent::MouseButtonPress && event->type() != QEvent::MouseMove)
        return false;
    // Most moves reach the stack while no gesture is tracked (another item took the touch,
    // or navigation is off): they change nothing, so the position is not worked out.
    if (event->type() == QEvent::MouseMove && !m_pressed && !m_noGrabbing)
        return m_mouseGrabbed;

    const QPointF inParent = parentItem()->mapFromScene(event->windowPos())
            + QPointF(m_currentContainer->x(), m_currentContainer->y());
    const QPointF position = mapToItem(m_currentPage, inParent);
    if (event->type() == QEvent::MouseButtonPress) {
        // Qt filters one touch press twice: as the touch and as the mouse made from it.
        // Both carry the same time and place; a later press of the same finger does not.
        const bool repeated = m_pressed && event->timestamp() == m_pressTimestamp
                && event->windowPos() == m_pressWindowPosition;
        m_pressTimestamp = event->timestamp();
        m_pressWindowPosition = event->windowPos();
        if (!repeated)
            handlePress(position);
        return false;
    }
    return handleMove(position);
}

bool DeclarativePageStackBase::keptGrabElsewhere() const
{
    QQuickItem *grabber = window() ? window()->mouseGrabberItem() : nullptr;
    return grabber && grabber->keepMouseGrab() && grabber != this;
}

// Gesture -----------------------------------------------------------------------------

bool DeclarativePageStackBase::handlePress(QPointF pos)
{
    m_pressPosition = pos;
    qCDebug(lcPelkanPageStackLog) << "Press x:" << pos.x() << "y:" << pos.y();
    if (keptGrabElsewhere())
        return m_pressed;
    if (!m_backNavigation && !m_forwardNavigation && !m_noGrabbing)
        return m_pressed;
    setPressedAndAnnounce();
    return m_pressed;
}

void DeclarativePageStackBase::setPressedAndAnnounce()
{
    m_pressed = true;
    Q_EMIT pressed();
    Q_EMIT pressedChanged();
}

bool DeclarativePageStackBase::handleMove(QPointF pos)
{
    if (!m_pressed && !m_noGrabbing)
        return m_mouseGrabbed;
    if (keptGrabElsewhere() && !m_noGrabbing) {
        reset();
        return false;
    }
    qCDebug(lcPelkanPageStackLog) << "Move x:" << pos.x() << "y:" << pos.y();

    const bool vertical = m_navigationStyle == DeclarativePageNavigation::Vertical;
    if (m_gestureCaptured) {
        if (!m_mouseGrabbed && !m_noGrabbing)
            _grabMouse();
    } else {
        const int threshold = int(QGuiApplication::styleHints()->startDragDistance() * 1.5);
        const qreal dx = pos.x() - m_pressPosition.x();
        const qreal dy = pos.y() - m_pressPosition.y();
        if (m_claimedByChild & (vertical ? Qt::Vertical : Qt::Horizontal)) {
            // Claimed, unless the child gives this way back (a view at its first item).
            const qreal along = vertical ? qAbs(dy) : dx;
            const int way = along > 0 ? DeclarativePageNavigation::Back
                          : along < 0 ? DeclarativePageNavigation::Forward : 0;
            if (!(way & m_releasedByChild))
                return false;
        }
        qCDebug(lcPelkanPageStackLog) << "FlickDifference x:" << dx << "y:" << dy;

        if (qAbs(dy) > qAbs(dx) && !vertical && qAbs(dy) > threshold) {
            m_verticalBlocked = true;
            qCDebug(lcPelkanPageStackLog) << "Vertical block";
        }
        if (m_verticalBlocked)
            return false;

        enum { Nothing, Horizontal, Vertical, Reanchor } action = Nothing;
        if (!m_forwardNavigation && dx < 0) {
            action = Reanchor;
        } else if (m_backNavigation) {
            if ((!vertical && dx > threshold) || (m_forwardNavigation && dx < -threshold))
                action = Horizontal;
            else if (vertical && qAbs(dy) > threshold)
                action = Vertical;
        } else {
            if (!vertical && dx > 0)
                action = Reanchor;
            else if (m_forwardNavigation && dx < -threshold)
                action = Horizontal;
        }

        switch (action) {
        case Horizontal:
            m_pressPosition.setX(pos.x());
            m_gestureCaptured = true;
            qCDebug(lcPelkanPageStackLog) << "Capture horizontal";
            break;
        case Vertical:
            m_pressPosition.setY(pos.y());
            m_gestureCaptured = true;
            qCDebug(lcPelkanPageStackLog) << "Capture vertical";
            break;
        case Reanchor:
            // A movement in a forbidden direction never adds up toward the threshold.
            qCDebug(lcPelkanPageStackLog) << "Update press pos x:" << pos.x() << "y:" << pos.y();
            m_pressPosition = pos;
            break;
        case Nothing:
            break;
        }

        // Grabbing mode grabs on the move after the capture; no-grabbing goes straight on.
        if (!(m_noGrabbing && m_gestureCaptured))
            return m_mouseGrabbed;
    }

    // Differences, each axis re-anchored when it was not tracked on the previous move.
    if (!m_trackingLeft && !m_trackingRight)
        m_pressPosition.setX(pos.x());
    if (!m_trackingUp && !m_trackingDown)
        m_pressPosition.setY(pos.y());

    float left = 0, right = 0, up = 0, down = 0;
    if (m_backNavigation && !vertical) {
        left = float(qMax<qreal>(0, pos.x() - m_pressPosition.x()));
    } else if (m_backNavigation) {
        up = float(qMax<qreal>(0, pos.y() - m_pressPosition.y()));
        down = float(qMax<qreal>(0, m_pressPosition.y() - pos.y()));
    }
    if (m_forwardNavigation)
        right = float(qMax<qreal>(0, m_pressPosition.x() - pos.x()));

    m_trackingLeft = m_backNavigation && !vertical;
    m_trackingUp = m_trackingDown = m_backNavigation && vertical;
    m_trackingRight = m_forwardNavigation;

    if (m_noGrabbing && !m_pressed)
        setPressedAndAnnounce();

    qCDebug(lcPelkanPageStackLog) << "Flick difference forward:" << right << "backward:" << left
                                  << "up:" << up << "down:" << down;

    // A reversal shows the shrinking difference at 0 before the growing one moves.
    if (right == 0 && m_right > 0)
        publish(m_right, right, &DeclarativePageStackBase::forwardFlickDifferenceChanged);
    else if (left == 0 && m_left > 0)
        publish(m_left, left, &DeclarativePageStackBase::backFlickDifferenceChanged);
    if (up == 0 && m_up > 0)
        publish(m_up, up, &DeclarativePageStackBase::upFlickDifferenceChanged);
    else if (down == 0 && m_down > 0)
        publish(m_down, down, &DeclarativePageStackBase::downFlickDifferenceChanged);
    publish(m_left, left, &DeclarativePageStackBase::backFlickDifferenceChanged);
    publish(m_down, down, &DeclarativePageStackBase::downFlickDifferenceChanged);
    publish(m_right, right, &DeclarativePageStackBase::forwardFlickDifferenceChanged);
    publish(m_up, up, &DeclarativePageStackBase::upFlickDifferenceChanged);
    return m_mouseGrabbed;
}

void DeclarativePageStackBase::publish(float &field, float value, void (DeclarativePageStackBase::*signal)())
{
    if (field == value)
        return;
    field = value;
    Q_EMIT (this->*signal)();
}

void DeclarativePageStackBase::_grabMouse()
{
    grabMouse();
    setKeepMouseGrab(true);
    m_mouseGrabbed = true;
    qCDebug(lcPelkanPageStackLog) << "Grab mouse";
}

void DeclarativePageStackBase::handleRelease()
{
    if (m_pressed) {
        m_pressed = false;
        Q_EMIT pressedChanged();
        Q_EMIT released();
        qCDebug(lcPelkanPageStackLog) << "Release";
        if (m_mouseGrabbed) {
            ungrabMouse();
            setKeepMouseGrab(false);
        }
    }
    reset();
}

void DeclarativePageStackBase::reset()
{
    m_gestureCaptured = false;
    m_mouseGrabbed = false;
    m_verticalBlocked = false;
    if (m_pressed) {
        m_pressed = false;
        Q_EMIT pressedChanged();
        Q_EMIT canceled();
    }
    setKeepMouseGrab(false);
    m_trackingLeft = m_trackingRight = m_trackingUp = m_trackingDown = false;
    publish(m_left, 0, &DeclarativePageStackBase::backFlickDifferenceChanged);
    publish(m_right, 0, &DeclarativePageStackBase::forwardFlickDifferenceChanged);
    publish(m_up, 0, &DeclarativePageStackBase::upFlickDifferenceChanged);
    publish(m_down, 0, &DeclarativePageStackBase::downFlickDifferenceChanged);
}

// Back key ----------------------------------------------------------------------------

bool DeclarativePageStackBase::eventFilter(QObject *object, QEvent *event)
{
    if (event->type() == QEvent::KeyRelease && static_cast<QKeyEvent *>(event)->key() == Qt::Key_Back
            && m_ongoingTransitionCount < 1 && WindowPropertyPublisher::isWayland()) {
        if (m_depth < 2) {
            if (window())
                window()->lower();
        } else {
            QVariant result;
            QMetaObject::invokeMethod(this, "pop", Q_RETURN_ARG(QVariant, result));
        }
        return true;
    }
    return Pelkan::Control::eventFilter(object, event);
}

// Pages by module ---------------------------------------------------------------------

QString DeclarativePageStackBase::resolveImportPage(const QString &page)
{
    const auto cached = m_importCache.constFind(page);
    if (cached != m_importCache.constEnd())
        return *cached;

    QString result;
    const int dot = page.lastIndexOf(QLatin1Char('.'));
    if (dot <= 0) {
        result = page + QLatin1String(".qml");
    } else {
        const QString module = page.left(dot);
        const QString name = page.mid(dot + 1);
        const QString modulePath = QString(module).replace(QLatin1Char('.'), QLatin1Char('/'));
        QQmlEngine *engine = qmlEngine(this);
        const QStringList importPaths = engine ? engine->importPathList()
                                               : QStringList { QLibraryInfo::location(QLibraryInfo::Qml2ImportsPath) };

        QString directory;
        QString file;
        int major = -1, minor = -1;
        for (const QString &importPath : importPaths) {
            QFile qmldir(importPath + QLatin1Char('/') + modulePath + QLatin1String("/qmldir"));
            if (!qmldir.open(QIODevice::ReadOnly | QIODevice::Text))
                continue;
            directory = importPath + QLatin1Char('/') + modulePath;
            while (!qmldir.atEnd()) {
                const QString line = QString::fromUtf8(qmldir.readLine()).trimmed();
                const QStringList words = line.split(QLatin1Char(' '), Qt::SkipEmptyParts);
                if (words.isEmpty() || words.first() != name)
                    continue;
                const QRegularExpressionMatch version = QRegularExpression(QStringLiteral("(\\d+)\\.(\\d+)")).match(line);
                if (version.hasMatch()) {
                    major = version.captured(1).toInt();
                    minor = version.captured(2).toInt();
                }
                if (words.size() > 2 && words.last().endsWith(QLatin1String(".qml")))
                    file = words.last();
                break;
            }
            break;
        }

        if (major >= 0 && engine) {
            QQmlComponent component(engine);
            component.setData(QStringLiteral("import QtQml 2.0;import %1 %2.%3;QtObject {}")
                                      .arg(module).arg(major).arg(minor).toUtf8(), QUrl());
            if (component.isError()) {
                qCWarning(lcPelkanCoreLog) << "Unable to import module:" << module << "for implicit import:" << page;
                qCWarning(lcPelkanCoreLog) << "Component errors:" << component.errors();
            }
        } else {
            qCWarning(lcPelkanCoreLog) << "resolveImportPage: no qmldir entry for" << name << "in module" << module;
        }
        if (directory.isEmpty())
            directory = importPaths.isEmpty() ? modulePath : importPaths.last() + QLatin1Char('/') + modulePath;
        if (file.isEmpty())
            file = name + QLatin1String(".qml");
        result = QUrl::fromLocalFile(QDir::cleanPath(directory + QLatin1Char('/') + file)).toString();
    }
    m_importCache.insert(page, result);
    return result;
}
