#include "window/declarativewindow.h"
#include "platform/configvalue.h"
#include "platform/mgconfitem.h"
#include "core/pelkanlogging.h"
#include "core/screen.h"

#include <QGuiApplication>
#include <QQuickWindow>
#include <QScreen>

// The window item's orientation: what the device reports, what the application allows,
// and the configured rotation of the display.

namespace {

const Qt::ScreenOrientations AllScreenOrientations = Qt::PortraitOrientation | Qt::LandscapeOrientation
        | Qt::InvertedPortraitOrientation | Qt::InvertedLandscapeOrientation;

// The configured rotation of the display, shared by every window of the process.
int s_screenRotation = 0;

} // namespace

void DeclarativeWindow::followPrimaryScreen()
{
    if (QScreen *screen = QGuiApplication::primaryScreen()) {
        screen->setOrientationUpdateMask(AllScreenOrientations);
        m_deviceOrientation = fromScreenOrientation(shownOrientation(screen), screen);
        setSize(screen->size());
        connect(screen, &QScreen::geometryChanged, this, &DeclarativeWindow::screenGeometryChanged);
    } else {
        setSize(QSizeF(540, 960));
    }

    if (!m_orientationLocked)
        updateOrientation();
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

bool DeclarativeWindow::turnsDisplayItself()
{
    return QGuiApplication::platformName() != QLatin1String("wayland");
}

Qt::ScreenOrientation DeclarativeWindow::shownOrientation(const QScreen *screen)
{
    const Qt::ScreenOrientation reported = screen->orientation();
    if (!turnsDisplayItself())
        return reported; // the device: how it is held
    // A desktop system turns the display itself, so content is upright in the screen's
    // shape. Some platforms report a screen they have not turned as landscape whatever its
    // shape (an X server without rotation): the shape wins where the two disagree.
    const auto portrait = [](Qt::ScreenOrientation o) {
        return o == Qt::PortraitOrientation || o == Qt::InvertedPortraitOrientation;
    };
    const Qt::ScreenOrientation shape = screen->primaryOrientation();
    return portrait(reported) == portrait(shape) ? reported : shape;
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
    if (m_screen)
        orientation = shownOrientation(m_screen);
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

void DeclarativeWindow::trackScreen(QScreen *screen)
{
    if (m_screen) {
        disconnect(m_screen, &QScreen::orientationChanged, this, &DeclarativeWindow::setScreenOrientation);
        disconnect(m_screen, &QScreen::primaryOrientationChanged, this, &DeclarativeWindow::setScreenOrientation);
    }
    m_screen = screen;
    if (!screen)
        return;
    screen->setOrientationUpdateMask(AllScreenOrientations);
    connect(screen, &QScreen::orientationChanged, this, &DeclarativeWindow::setScreenOrientation);
    // A desktop screen that changes shape turns what the user sees.
    if (turnsDisplayItself())
        connect(screen, &QScreen::primaryOrientationChanged, this, &DeclarativeWindow::setScreenOrientation);
    setScreenOrientation(screen->orientation());
    reportContentOrientation();
}
