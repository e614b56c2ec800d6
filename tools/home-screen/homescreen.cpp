#include "homescreen.h"
#include "coveractionpayload.h"
#include "extendedsurface.h"
#include "surfaceextension.h"

#include <QCoreApplication>
#include <QDBusConnection>
#include <QDBusConnectionInterface>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QJsonArray>
#include <QRectF>
#include <QRegularExpression>
#include <QWaylandOutput>
#include <QWaylandSeat>
#include <QWaylandSurface>
#include <QWaylandWlShell>

namespace {

const QString CoverStatusPath = QStringLiteral("/com/kavoa/trevanel");
const QString CoverStatusInterface = QStringLiteral("com.kavoa.trevanel");
const QString CoverActionInterface = QStringLiteral("org.quorvaneos.pelkan.coveraction");
const QString CoverActionProperty = QStringLiteral("_APP_COVER_ACTION");

QJsonObject describe(const QVariant &value)
{
    QString text;
    switch (value.userType()) {
    case QMetaType::UnknownType:
        break;
    case QMetaType::QRectF:
    case QMetaType::QRect: {
        const QRectF r = value.toRectF();
        text = QStringLiteral("%1,%2,%3,%4").arg(r.x()).arg(r.y()).arg(r.width()).arg(r.height());
        break;
    }
    case QMetaType::Bool:
        text = value.toBool() ? QStringLiteral("true") : QStringLiteral("false");
        break;
    default:
        text = value.toString();
    }
    return { { QStringLiteral("type"), value.isValid() ? QString::fromLatin1(value.typeName()) : QStringLiteral("invalid") },
             { QStringLiteral("value"), text } };
}

bool isCoverCategory(const QVariant &category)
{
    const QString text = category.toString();
    return text == QLatin1String("cover") || text == QLatin1String("pelkan-cover");
}

} // namespace

HomeScreen::HomeScreen(const QByteArray &socketName, QObject *parent)
    : QObject(parent)
    , m_socketName(socketName)
{
    // Clients draw their next frame once told the last one was used: about 60 times a
    // second, and only for surfaces that committed something.
    m_frameTimer.setInterval(16);
    m_frameTimer.setSingleShot(true);
    connect(&m_frameTimer, &QTimer::timeout, this, &HomeScreen::sendFrameCallbacks);
}

HomeScreen::~HomeScreen()
{
    // Extensions are not owned by their compositor; they go while it is still whole.
    delete m_shell;
}

bool HomeScreen::start()
{
    m_compositor.setSocketName(m_socketName);
    // Clients hand over shared-memory buffers; nothing here draws with them.
    m_compositor.setUseHardwareIntegrationExtension(false);
    m_output = new QWaylandOutput(&m_compositor, nullptr);
    const QWaylandOutputMode mode(QSize(540, 960), 60000);
    m_output->addMode(mode, true);
    m_output->setCurrentMode(mode);
    m_shell = new QWaylandWlShell(&m_compositor);

    connect(&m_compositor, &QWaylandCompositor::surfaceCreated, this, &HomeScreen::surfaceCreated);
    connect(m_shell, &QWaylandWlShell::wlShellSurfaceCreated, this, &HomeScreen::shellSurfaceCreated);

    m_compositor.create();
    if (!m_compositor.isCreated()) {
        m_recorder.record(QStringLiteral("error"), { { QStringLiteral("message"), QStringLiteral("cannot open the socket") } });
        return false;
    }
    m_extension = new SurfaceExtension(&m_compositor);
    connect(m_extension, &SurfaceExtension::extendedSurfaceCreated, this, &HomeScreen::extendedSurfaceCreated);

    if (!QDBusConnection::sessionBus().isConnected())
        m_recorder.record(QStringLiteral("error"), { { QStringLiteral("message"), QStringLiteral("no session bus") } });

    m_recorder.record(QStringLiteral("ready"), { { QStringLiteral("socket"), QString::fromUtf8(m_compositor.socketName()) },
                                                 { QStringLiteral("pid"), QCoreApplication::applicationPid() } });
    return true;
}

void HomeScreen::launch(const QStringList &command)
{
    connect(&m_client, &ClientLauncher::started, this, [this](qint64 pid) {
        m_recorder.record(QStringLiteral("clientStarted"), { { QStringLiteral("pid"), pid } });
    });
    connect(&m_client, &ClientLauncher::logged, this, [this](const QString &line) {
        m_recorder.record(QStringLiteral("log"), { { QStringLiteral("text"), line } });
    });
    connect(&m_client, &ClientLauncher::finished, this, [this](int exitCode) {
        m_recorder.record(QStringLiteral("clientExited"), { { QStringLiteral("code"), exitCode } });
        Q_EMIT quitRequested();
    });
    m_client.start(QString::fromUtf8(m_compositor.socketName()), command);
}

// Surfaces ------------------------------------------------------------------------------

void HomeScreen::surfaceCreated(QWaylandSurface *surface)
{
    m_numbers.insert(surface, ++m_lastNumber);
    connect(surface, &QWaylandSurface::redraw, this, [this, surface] {
        m_waitingForFrame.insert(surface);
        if (!m_frameTimer.isActive())
            m_frameTimer.start();
    });
    connect(surface, &QWaylandSurface::surfaceDestroyed, this, [this, surface] {
        m_recorder.record(QStringLiteral("surfaceDestroyed"), { { QStringLiteral("surface"), numberOf(surface) } });
        m_waitingForFrame.remove(surface);
        m_numbers.remove(surface);
    });
}

void HomeScreen::shellSurfaceCreated(QWaylandWlShellSurface *shellSurface)
{
    m_recorder.record(QStringLiteral("window"), { { QStringLiteral("surface"), numberOf(shellSurface->surface()) } });
}

void HomeScreen::sendFrameCallbacks()
{
    const auto surfaces = m_waitingForFrame;
    m_waitingForFrame.clear();
    for (QWaylandSurface *surface : surfaces) {
        surface->frameStarted();
        surface->sendFrameCallbacks();
    }
}

int HomeScreen::numberOf(QWaylandSurface *surface) const
{
    return m_numbers.value(surface, 0);
}

// Window properties ---------------------------------------------------------------------

void HomeScreen::extendedSurfaceCreated(ExtendedSurface *extended)
{
    m_extendedSurfaces.append(extended);
    connect(extended, &ExtendedSurface::propertyChanged, this, [this, extended](const QString &name, const QVariant &value) {
        propertyChanged(extended, name, value);
    });
    connect(extended, &ExtendedSurface::malformedProperty, this, [this, extended](const QString &name) {
        m_recorder.record(QStringLiteral("malformedProperty"), { { QStringLiteral("surface"), numberOf(extended->surface()) },
                                                                 { QStringLiteral("name"), name } });
    });
    connect(extended, &ExtendedSurface::lowerRequested, this, [this, extended] {
        m_recorder.record(QStringLiteral("lower"), { { QStringLiteral("surface"), numberOf(extended->surface()) } });
    });
    connect(extended, &ExtendedSurface::raiseRequested, this, [this, extended] {
        m_recorder.record(QStringLiteral("raise"), { { QStringLiteral("surface"), numberOf(extended->surface()) } });
    });
}

void HomeScreen::propertyChanged(ExtendedSurface *extended, const QString &name, const QVariant &value)
{
    QJsonObject fields = describe(value);
    fields.insert(QStringLiteral("surface"), numberOf(extended->surface()));
    fields.insert(QStringLiteral("name"), name);
    m_recorder.record(QStringLiteral("property"), fields);

    if (name == CoverActionProperty)
        readCoverActions(extended, value);
    updatePairs();
}

void HomeScreen::readCoverActions(ExtendedSurface *extended, const QVariant &value)
{
    m_coverActions = value.toString();
    const CoverActionPayload payload = CoverActionPayload::parse(m_coverActions);
    QJsonArray actions;
    for (const CoverActionPayload::Action &action : payload.actions) {
        actions.append(QJsonObject { { QStringLiteral("service"), action.service },
                                     { QStringLiteral("method"), action.method },
                                     { QStringLiteral("index"), action.index },
                                     { QStringLiteral("icon"), action.icon } });
    }
    QJsonObject fields { { QStringLiteral("surface"), numberOf(extended->surface()) },
                         { QStringLiteral("actions"), actions },
                         { QStringLiteral("iconBackground"), payload.iconBackground } };
    if (!payload.error.isEmpty())
        fields.insert(QStringLiteral("error"), payload.error);
    m_recorder.record(QStringLiteral("coverActions"), fields);
}

void HomeScreen::updatePairs()
{
    // An application window names its cover window, and the cover names it back.
    for (const QPointer<ExtendedSurface> &cover : qAsConst(m_extendedSurfaces)) {
        if (!cover || cover->property(QStringLiteral("CATEGORY")).toString() != QLatin1String("pelkan-cover"))
            continue;
        const QVariant applicationId = cover->property(QStringLiteral("QUORVANE_APPLICATION_WINDOW"));
        const QVariant coverId = cover->property(QStringLiteral("WINID"));
        if (!applicationId.isValid() || !coverId.isValid()
                || cover->property(QStringLiteral("QUORVANE_COVER_WINDOW")) != coverId)
            continue;
        for (const QPointer<ExtendedSurface> &application : qAsConst(m_extendedSurfaces)) {
            if (!application || application == cover
                    || application->property(QStringLiteral("WINID")) != applicationId
                    || application->property(QStringLiteral("QUORVANE_COVER_WINDOW")) != coverId)
                continue;
            const QPair<int, int> pair(numberOf(application->surface()), numberOf(cover->surface()));
            if (m_pairs.contains(pair))
                continue;
            m_pairs.insert(pair);
            m_recorder.record(QStringLiteral("paired"), { { QStringLiteral("application"), pair.first },
                                                          { QStringLiteral("cover"), pair.second },
                                                          { QStringLiteral("applicationWinId"), applicationId.toString() },
                                                          { QStringLiteral("coverWinId"), coverId.toString() } });
        }
    }
}

ExtendedSurface *HomeScreen::applicationSurface() const
{
    // The newest window that is not a cover.
    for (int i = m_extendedSurfaces.size() - 1; i >= 0; --i) {
        ExtendedSurface *extended = m_extendedSurfaces.at(i);
        if (extended && extended->surface() && !isCoverCategory(extended->property(QStringLiteral("CATEGORY"))))
            return extended;
    }
    return nullptr;
}

// Commands ------------------------------------------------------------------------------

void HomeScreen::handleCommand(const QString &line)
{
    const QStringList words = line.simplified().split(QLatin1Char(' '), Qt::SkipEmptyParts);
    if (words.isEmpty())
        return;
    const QString &command = words.first();
    bool ok = words.size() == 2;
    const int argument = ok ? words.at(1).toInt(&ok) : 0;

    if (command == QLatin1String("focus")) {
        focusApplication();
    } else if (command == QLatin1String("key") && words.value(1) == QLatin1String("back")) {
        sendBackKey();
    } else if (command == QLatin1String("trigger") && ok) {
        triggerCoverAction(argument);
    } else if (command == QLatin1String("coverstatus") && ok) {
        sendCoverStatus(argument);
    } else if (command == QLatin1String("names")) {
        recordCoverActionNames();
    } else if (command == QLatin1String("quit")) {
        m_client.stop();
        Q_EMIT quitRequested();
    } else {
        m_recorder.record(QStringLiteral("error"), { { QStringLiteral("message"), QStringLiteral("unknown command: ") + line } });
    }
}

bool HomeScreen::focusApplication()
{
    ExtendedSurface *target = applicationSurface();
    QWaylandSeat *seat = m_compositor.defaultSeat();
    if (!target || !seat) {
        m_recorder.record(QStringLiteral("error"), { { QStringLiteral("message"), QStringLiteral("no window to focus") } });
        return false;
    }
    if (seat->keyboardFocus() != target->surface()) {
        seat->setKeyboardFocus(target->surface());
        m_recorder.record(QStringLiteral("focused"), { { QStringLiteral("surface"), numberOf(target->surface()) } });
    }
    return true;
}

void HomeScreen::sendBackKey()
{
    // A window takes keys once it knows it is active: focus it first ("focus") and
    // wait for that, or the first key may arrive before.
    if (!focusApplication())
        return;
    QWaylandSeat *seat = m_compositor.defaultSeat();
    seat->sendKeyEvent(Qt::Key_Back, true);
    seat->sendKeyEvent(Qt::Key_Back, false);
    m_recorder.record(QStringLiteral("keySent"), { { QStringLiteral("surface"), numberOf(seat->keyboardFocus()) },
                                                   { QStringLiteral("key"), QStringLiteral("back") } });
}

void HomeScreen::triggerCoverAction(int index)
{
    const CoverActionPayload payload = CoverActionPayload::parse(m_coverActions);
    auto action = std::find_if(payload.actions.cbegin(), payload.actions.cend(),
                               [index](const CoverActionPayload::Action &a) { return a.index == index; });
    if (action == payload.actions.cend()) {
        m_recorder.record(QStringLiteral("error"), { { QStringLiteral("message"), QStringLiteral("no cover action %1").arg(index) } });
        return;
    }
    QDBusMessage call = QDBusMessage::createMethodCall(action->service, CoverActionPayload::objectPath(action->service),
                                                       CoverActionInterface, action->method);
    call << action->index;
    auto watcher = new QDBusPendingCallWatcher(QDBusConnection::sessionBus().asyncCall(call), this);
    const QString service = action->service;
    connect(watcher, &QDBusPendingCallWatcher::finished, this, [this, service, index](QDBusPendingCallWatcher *call) {
        call->deleteLater();
        const QDBusPendingReply<> reply = *call;
        m_recorder.record(QStringLiteral("triggered"), { { QStringLiteral("service"), service },
                                                         { QStringLiteral("index"), index },
                                                         { QStringLiteral("error"), reply.isError() ? reply.error().name() : QString() },
                                                         { QStringLiteral("message"), reply.isError() ? reply.error().message() : QString() } });
    });
}

void HomeScreen::recordCoverActionNames()
{
    QStringList names = QDBusConnection::sessionBus().interface()->registeredServiceNames().value();
    names = names.filter(QRegularExpression(QStringLiteral("^org\\.quorvaneos\\.coveraction\\.")));
    names.sort();
    m_recorder.record(QStringLiteral("names"), { { QStringLiteral("names"), QJsonArray::fromStringList(names) } });
}

void HomeScreen::sendCoverStatus(int status)
{
    QDBusMessage signal = QDBusMessage::createSignal(CoverStatusPath, CoverStatusInterface, QStringLiteral("coverstatus"));
    signal << status;
    const bool sent = QDBusConnection::sessionBus().send(signal);
    m_recorder.record(QStringLiteral("coverStatusSent"), { { QStringLiteral("status"), status }, { QStringLiteral("sent"), sent } });
}
