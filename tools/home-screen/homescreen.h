#pragma once

#include "clientlauncher.h"
#include "recorder.h"

#include <QHash>
#include <QObject>
#include <QPointer>
#include <QSet>
#include <QTimer>
#include <QWaylandCompositor>

class ExtendedSurface;
class QWaylandOutput;
class QWaylandSurface;
class QWaylandWlShell;
class QWaylandWlShellSurface;
class SurfaceExtension;

// A minimal home screen: a headless compositor that maps application windows, keeps the
// window properties they publish, pairs application windows with their covers, presses
// cover actions over D-Bus, tells covers whether they are shown, and sends the Back key.
// Everything it sees goes to the recorder; commands arrive as text lines.
class HomeScreen : public QObject
{
    Q_OBJECT
public:
    explicit HomeScreen(const QByteArray &socketName, QObject *parent = nullptr);
    ~HomeScreen() override;

    // Opens the socket; false (with the reason recorded) when that fails.
    bool start();

    // Runs an application as a client; the home screen ends with it.
    void launch(const QStringList &command);

    // "focus", "key back", "trigger <index>", "coverstatus <status>", "names" (the cover
    // action names on the bus), "quit".
    void handleCommand(const QString &line);

Q_SIGNALS:
    void quitRequested();

private:
    void surfaceCreated(QWaylandSurface *surface);
    void shellSurfaceCreated(QWaylandWlShellSurface *shellSurface);
    void extendedSurfaceCreated(ExtendedSurface *extended);
    void propertyChanged(ExtendedSurface *extended, const QString &name, const QVariant &value);
    void readCoverActions(ExtendedSurface *extended, const QVariant &value);
    void updatePairs();
    void sendFrameCallbacks();

    bool focusApplication();
    void sendBackKey();
    void triggerCoverAction(int index);
    void sendCoverStatus(int status);
    void recordCoverActionNames();

    int numberOf(QWaylandSurface *surface) const;
    ExtendedSurface *applicationSurface() const;

    QByteArray m_socketName;
    QWaylandCompositor m_compositor;
    QWaylandWlShell *m_shell = nullptr;
    QWaylandOutput *m_output = nullptr;
    SurfaceExtension *m_extension = nullptr;
    Recorder m_recorder;

    QHash<QWaylandSurface *, int> m_numbers;
    int m_lastNumber = 0;
    QList<QPointer<ExtendedSurface>> m_extendedSurfaces;
    QSet<QWaylandSurface *> m_waitingForFrame;
    QTimer m_frameTimer;
    QSet<QPair<int, int>> m_pairs;
    QString m_coverActions;
    ClientLauncher m_client;
};
