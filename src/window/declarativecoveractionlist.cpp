#include "declarativecoveractionlist.h"
#include "window/coveractioncaller.h"
#include "window/declarativecoveraction.h"
#include "core/pelkanlogging.h"
#include "window/windowpropertypublisher.h"

#include <QCoreApplication>
#include <QDBusConnection>
#include <QDBusConnectionInterface>
#include <QDBusReply>
#include <QQuickItem>
#include <QQuickWindow>

namespace {

const QString PayloadProperty = QStringLiteral("_APP_COVER_ACTION");
const QString ServicePrefix = QStringLiteral("org.quorvaneos.coveraction.pid");

int s_listCount = 0;
// Every list of the process, for finding the one a window shows.
QVector<DeclarativeCoverActionList *> s_lists;
// Counts enablings: the list enabled most recently is the one its window shows.
quint64 s_enableCount = 0;

} // namespace

DeclarativeCoverActionList::DeclarativeCoverActionList(QObject *parent)
    : QObject(parent)
    , m_wayland(WindowPropertyPublisher::isWayland())
{
    const int number = ++s_listCount;
    m_serviceName = QStringLiteral("org.quorvaneos.coveraction.pid%1.id%2").arg(QCoreApplication::applicationPid()).arg(number);
    m_objectPath = QLatin1Char('/') + QString(m_serviceName).replace(QLatin1Char('.'), QLatin1Char('/'));
    m_enableTimer.setSingleShot(true);
    m_enableTimer.setInterval(5);
    connect(&m_enableTimer, &QTimer::timeout, this, &DeclarativeCoverActionList::enableActiveCovers);
    m_enabledOrder = ++s_enableCount;
    s_lists.append(this);
}

DeclarativeCoverActionList::~DeclarativeCoverActionList()
{
    s_lists.removeOne(this);
    leaveWindow(m_window);
    unregisterFromBus();
}

DeclarativeCoverActionList *DeclarativeCoverActionList::shownList(QWindow *window)
{
    DeclarativeCoverActionList *shown = nullptr;
    if (!window)
        return shown;
    for (DeclarativeCoverActionList *list : qAsConst(s_lists)) {
        if (list->m_window == window && list->m_enabled && !list->m_actions.isEmpty()
                && (!shown || list->m_enabledOrder > shown->m_enabledOrder))
            shown = list;
    }
    return shown;
}

// Actions -------------------------------------------------------------------------------

QQmlListProperty<DeclarativeCoverAction> DeclarativeCoverActionList::actions()
{
    return QQmlListProperty<DeclarativeCoverAction>(
            this, nullptr,
            [](QQmlListProperty<DeclarativeCoverAction> *list, DeclarativeCoverAction *action) {
                static_cast<DeclarativeCoverActionList *>(list->object)->appendAction(action);
            },
            [](QQmlListProperty<DeclarativeCoverAction> *list) {
                return static_cast<DeclarativeCoverActionList *>(list->object)->m_actions.size();
            },
            [](QQmlListProperty<DeclarativeCoverAction> *list, int index) {
                return static_cast<DeclarativeCoverActionList *>(list->object)->m_actions.value(index);
            },
            [](QQmlListProperty<DeclarativeCoverAction> *list) {
                static_cast<DeclarativeCoverActionList *>(list->object)->clearActions();
            });
}

void DeclarativeCoverActionList::appendAction(DeclarativeCoverAction *action)
{
    if (!action)
        return;
    m_actions.append(action);
    connect(action, &DeclarativeCoverAction::iconSourceChanged, this, &DeclarativeCoverActionList::coversUpdated);
    connect(action, &QObject::destroyed, this, [this, action] {
        m_actions.removeAll(action);
        coversUpdated();
    });
    coversUpdated();
}

void DeclarativeCoverActionList::clearActions()
{
    for (DeclarativeCoverAction *action : qAsConst(m_actions))
        disconnect(action, nullptr, this, nullptr);
    m_actions.clear();
    coversUpdated();
}

void DeclarativeCoverActionList::coversUpdated()
{
    m_enableTimer.start();
}

// Properties ----------------------------------------------------------------------------

void DeclarativeCoverActionList::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return;
    m_enabled = enabled;
    if (enabled)
        m_enabledOrder = ++s_enableCount;
    m_enableTimer.start();
    Q_EMIT enabledChanged();
}

void DeclarativeCoverActionList::setIconBackground(bool iconBackground)
{
    if (iconBackground == m_iconBackground)
        return;
    m_iconBackground = iconBackground;
    m_enableTimer.start();
    Q_EMIT iconBackgroundChanged();
}

QWindow *DeclarativeCoverActionList::window() const
{
    return m_window;
}

void DeclarativeCoverActionList::setWindow(QWindow *window)
{
    m_windowSet = true;
    attachToWindow(window);
}

void DeclarativeCoverActionList::resetWindow()
{
    m_windowSet = false;
    attachToWindow(automaticWindow());
}

void DeclarativeCoverActionList::switcherWindowChanged(QWindow *window)
{
    if (!m_windowSet)
        attachToWindow(window);
}

QWindow *DeclarativeCoverActionList::automaticWindow() const
{
    for (QObject *ancestor = parent(); ancestor; ancestor = ancestor->parent()) {
        if (auto item = qobject_cast<QQuickItem *>(ancestor))
            return item->window();
        if (auto window = qobject_cast<QWindow *>(ancestor))
            return window;
    }
    return nullptr;
}

void DeclarativeCoverActionList::attachToWindow(QWindow *window)
{
    if (window == m_window)
        return;
    if (m_window)
        disconnect(m_window, nullptr, this, nullptr);
    QWindow *previous = m_window;
    m_window = window;
    if (window) {
        // The native id arrives with the first showing.
        connect(window, &QWindow::visibleChanged, this, &DeclarativeCoverActionList::coversUpdated);
        connect(window, &QObject::destroyed, this, [this] {
            m_window = nullptr;
            Q_EMIT windowChanged(nullptr);
        });
    }
    leaveWindow(previous);
    m_enableTimer.start();
    Q_EMIT windowChanged(window);
}

quint64 DeclarativeCoverActionList::windowId() const
{
    return m_window && m_window->handle() ? quint64(m_window->winId()) : 0;
}

void DeclarativeCoverActionList::componentComplete()
{
    if (!m_windowSet) {
        attachToWindow(automaticWindow());
        // The cover item may be put into its window after this list completes.
        for (QObject *ancestor = parent(); ancestor; ancestor = ancestor->parent()) {
            if (auto item = qobject_cast<QQuickItem *>(ancestor)) {
                connect(item, &QQuickItem::windowChanged, this, [this](QQuickWindow *window) {
                    if (!m_windowSet)
                        attachToWindow(window);
                });
                break;
            }
        }
    }
    registerOnBus();
    m_enableTimer.start();
}

// Bus -----------------------------------------------------------------------------------

void DeclarativeCoverActionList::registerOnBus()
{
    if (m_registered)
        return;
    QDBusConnection bus = QDBusConnection::sessionBus();
    if (!bus.isConnected()) {
        qCWarning(lcPelkanCoverLog, "Cannot connect to the D-Bus session bus");
        return;
    }
    if (!bus.registerObject(m_objectPath, this, QDBusConnection::ExportScriptableSlots)) {
        qCWarning(lcPelkanCoverLog).noquote() << QStringLiteral("Failed to register object: %1, error %2")
                                                         .arg(m_objectPath, describe(bus.lastError()));
        return;
    }
    const QDBusReply<QDBusConnectionInterface::RegisterServiceReply> reply = bus.interface()->registerService(
            m_serviceName, QDBusConnectionInterface::DontQueueService, QDBusConnectionInterface::DontAllowReplacement);
    if (!reply.isValid() || reply.value() != QDBusConnectionInterface::ServiceRegistered) {
        const QString error = reply.isValid() ? QStringLiteral("the name is owned by another connection")
                                              : describe(reply.error());
        qCWarning(lcPelkanCoverLog).noquote() << QStringLiteral("Failed to register service: %1, error %2")
                                                         .arg(m_serviceName, error);
        bus.unregisterObject(m_objectPath);
        return;
    }
    m_registered = true;
    qCDebug(lcPelkanCoverLog).noquote() << QStringLiteral("dbus ready %1").arg(m_serviceName);
}

void DeclarativeCoverActionList::unregisterFromBus()
{
    if (!m_registered)
        return;
    QDBusConnection bus = QDBusConnection::sessionBus();
    bus.unregisterObject(m_objectPath);
    bus.interface()->unregisterService(m_serviceName);
    m_registered = false;
}

QString DeclarativeCoverActionList::describe(const QDBusError &error)
{
    if (!error.isValid())
        return QStringLiteral("unknown error");
    return error.name() + QLatin1String(": ") + error.message();
}

void DeclarativeCoverActionList::trigger(int id)
{
    if (calledFromDBus()) {
        const CoverActionCaller caller = CoverActionCaller::fromBus(connection(), message().service());
        if (!caller.isPrivileged()) {
            sendErrorReply(QDBusError::AccessDenied, QStringLiteral("PID %1 is not in privileged group").arg(caller.pid()));
            return;
        }
    }
    if (id < 0 || id >= m_actions.size()) {
        qCWarning(lcPelkanCoverLog).noquote() << QStringLiteral("CoverActionList: no action at index %1").arg(id);
        return;
    }
    Q_EMIT m_actions.at(id)->triggered();
}

// Payload -------------------------------------------------------------------------------

QString DeclarativeCoverActionList::buildPayload(quint64 windowId, bool enabled, const QString &serviceName,
                                                 const QList<QUrl> &icons, bool iconBackground)
{
    if (windowId == 0 || icons.isEmpty() || !enabled)
        return QString();
    QStringList entries;
    for (int i = 0; i < icons.size(); ++i) {
        entries << QStringLiteral("%1\n%2\n%3\n%4").arg(serviceName, QStringLiteral("trigger"), QString::number(i),
                                                        icons.at(i).toString());
    }
    entries << (iconBackground ? QStringLiteral("1") : QStringLiteral("0"));
    return entries.join(QLatin1Char('\n'));
}

QString DeclarativeCoverActionList::removeEntries(const QString &payload, const QString &serviceName)
{
    const QStringList lines = payload.split(QLatin1Char('\n'));
    QStringList kept;
    int i = 0;
    while (i < lines.size()) {
        if (lines.at(i).startsWith(ServicePrefix)) {
            if (i + 3 >= lines.size() || lines.at(i + 1) != QLatin1String("trigger")) {
                qCDebug(lcPelkanCoverLog).noquote() << QStringLiteral("Bad action: %1").arg(lines.at(i));
                ++i;
                continue;
            }
            if (lines.at(i) != serviceName)
                kept << lines.mid(i, 4);
            i += 4;
        } else if (i == lines.size() - 1 && (lines.at(i) == QLatin1String("0") || lines.at(i) == QLatin1String("1"))) {
            // The icon background line closes the payload; it stays only with actions left.
            if (!kept.isEmpty())
                kept << lines.at(i);
            ++i;
        } else {
            qCDebug(lcPelkanCoverLog).noquote() << QStringLiteral("Bad action: %1").arg(lines.at(i));
            ++i;
        }
    }
    return kept.join(QLatin1Char('\n'));
}

void DeclarativeCoverActionList::enableActiveCovers()
{
    qCDebug(lcPelkanCoverLog).noquote()
            << QStringLiteral("enableActiveCovers, process: %1, winId: %2, action count: %3, enabled: %4")
                       .arg(QCoreApplication::applicationPid()).arg(windowId()).arg(m_actions.size()).arg(m_enabled ? 1 : 0);
    // The window shows one list: this one, or one enabled later, or, when this one has
    // nothing to offer, the one before it; with none left its entries simply go.
    if (DeclarativeCoverActionList *shown = shownList(m_window))
        shown->publish();
    else
        disableActiveCovers();
}

void DeclarativeCoverActionList::leaveWindow(QWindow *window)
{
    if (!window)
        return;
    if (DeclarativeCoverActionList *next = shownList(window)) {
        next->publish(); // replaces this list's entries as a whole
    } else {
        QPointer<QWindow> current = m_window;
        m_window = window;
        disableActiveCovers();
        m_window = current;
    }
}

void DeclarativeCoverActionList::publish()
{
    QList<QUrl> icons;
    for (DeclarativeCoverAction *action : qAsConst(m_actions))
        icons << action->iconSource();
    const QString payload = buildPayload(windowId(), m_enabled, m_serviceName, icons, m_iconBackground);
    if (payload.isEmpty() || !m_wayland)
        return;
    qCDebug(lcPelkanCoverLog).noquote() << QStringLiteral("CoverActionList::setWindowProperty: %1").arg(payload);
    WindowPropertyPublisher::setProperty(m_window, PayloadProperty, payload);
}

void DeclarativeCoverActionList::disableActiveCovers()
{
    if (!m_window || !m_wayland)
        return;
    qCDebug(lcPelkanCoverLog).noquote()
            << QStringLiteral("disableActiveCovers, process: %1, winId: %2, action count: %3, enabled: %4")
                       .arg(QCoreApplication::applicationPid()).arg(windowId()).arg(m_actions.size()).arg(m_enabled ? 1 : 0);
    const QVariant current = WindowPropertyPublisher::property(m_window, PayloadProperty);
    if (!current.isValid()) {
        qCDebug(lcPelkanCoverLog) << "property does not yet exist";
        return;
    }
    const QString left = removeEntries(current.toString(), m_serviceName);
    if (left != current.toString())
        WindowPropertyPublisher::setProperty(m_window, PayloadProperty, left);
}
