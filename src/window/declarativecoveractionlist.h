#pragma once

#include <QDBusContext>
#include <QDBusError>
#include <QObject>
#include <QPointer>
#include <QQmlListProperty>
#include <QQmlParserStatus>
#include <QTimer>
#include <QUrl>
#include <QVector>
#include <QWindow>

class DeclarativeCoverAction;

// The buttons of a cover, offered to the home screen. The list owns the bus name
// "org.quorvaneos.coveraction.pid<pid>.id<n>" (n counts the lists of the process from 1)
// and exports trigger(int) at the matching path under the interface
// "org.quorvaneos.pelkan.coveraction". It describes its actions to the compositor in the
// "_APP_COVER_ACTION" property of its window: four lines per action (bus name, "trigger",
// index, icon URL) and a last line for iconBackground.
//
// Decisions:
// - The window is the one the list's item ancestor (the cover) is shown in, until the
//   `window` property is set; resetting it goes back to that.
// - The actions are published again, 5 ms after the last of a burst of changes, when the
//   component completes, and on changes of enabled, window, the actions, an action's
//   icon, iconBackground, and the window getting its native id.
// - The list registers on the bus when its component completes, once.
// - trigger() with an index that has no action is ignored with a warning. Callers over
//   the bus must have connected in the group "privileged" or as root and still run so
//   (see CoverActionCaller); others get an access-denied error. Direct calls from the
//   application itself are not checked.
// - Disabling the list, emptying it, moving it to another window or destroying it takes
//   its entries (those naming its bus name) out of the window's payload and leaves other
//   lists' alone. A window shows one list at a time: of its enabled lists with actions,
//   the one enabled most recently; when that one goes, the next one shows itself.
// - Destroying the list unregisters its object and gives its bus name back.
// - When the window is destroyed, `window` reads null and windowChanged() is emitted.
class DeclarativeCoverActionList : public QObject, public QQmlParserStatus, protected QDBusContext
{
    Q_OBJECT
    Q_INTERFACES(QQmlParserStatus)
    Q_CLASSINFO("D-Bus Interface", "org.quorvaneos.pelkan.coveraction")
    Q_CLASSINFO("DefaultProperty", "actions")
    Q_PROPERTY(QQmlListProperty<DeclarativeCoverAction> actions READ actions)
    Q_PROPERTY(bool enabled READ enabled WRITE setEnabled NOTIFY enabledChanged)
    Q_PROPERTY(bool iconBackground READ iconBackground WRITE setIconBackground NOTIFY iconBackgroundChanged)
    Q_PROPERTY(QWindow *window READ window WRITE setWindow RESET resetWindow NOTIFY windowChanged)

public:
    explicit DeclarativeCoverActionList(QObject *parent = nullptr);
    ~DeclarativeCoverActionList() override;

    QQmlListProperty<DeclarativeCoverAction> actions();
    const QVector<DeclarativeCoverAction *> &actionList() const { return m_actions; }
    void appendAction(DeclarativeCoverAction *action);
    void clearActions();

    bool enabled() const { return m_enabled; }
    void setEnabled(bool enabled);
    bool iconBackground() const { return m_iconBackground; }
    void setIconBackground(bool iconBackground);
    QWindow *window() const;
    void setWindow(QWindow *window);
    void resetWindow();

    QString serviceName() const { return m_serviceName; }
    QString objectPath() const { return m_objectPath; }
    bool isRegistered() const { return m_registered; }

    void classBegin() override {}
    void componentComplete() override;

    // The "_APP_COVER_ACTION" text, or an empty string when nothing is to be published.
    static QString buildPayload(quint64 windowId, bool enabled, const QString &serviceName,
                                const QList<QUrl> &icons, bool iconBackground);
    // payload without the entries of serviceName; entries that cannot be read are dropped.
    static QString removeEntries(const QString &payload, const QString &serviceName);

public Q_SLOTS:
    Q_SCRIPTABLE void trigger(int id);
    void switcherWindowChanged(QWindow *window);
    void coversUpdated();
    void enableActiveCovers();

Q_SIGNALS:
    void enabledChanged();
    void iconBackgroundChanged();
    void windowChanged(QWindow *window);

private:
    // The list a window shows: of its enabled lists with actions, the one enabled last.
    static DeclarativeCoverActionList *shownList(QWindow *window);
    static QString describe(const QDBusError &error);
    void registerOnBus();
    void unregisterFromBus();
    // Sets this list's payload on its window, whole.
    void publish();
    // Hands window over to its next list, or takes this list's entries off it.
    void leaveWindow(QWindow *window);
    void disableActiveCovers();
    void attachToWindow(QWindow *window);
    QWindow *automaticWindow() const;
    quint64 windowId() const;

    QVector<DeclarativeCoverAction *> m_actions;
    bool m_enabled = true;
    bool m_iconBackground = false;
    QPointer<QWindow> m_window;      // the window the actions are published on
    bool m_windowSet = false;        // set explicitly rather than found from the cover
    bool m_wayland;
    QString m_serviceName;
    QString m_objectPath;
    bool m_registered = false;
    quint64 m_enabledOrder = 0; // when it was last enabled, counted over all lists
    QTimer m_enableTimer;
};
