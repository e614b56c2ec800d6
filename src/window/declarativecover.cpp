#include "declarativecover.h"
#include "window/declarativecoveractionarea.h"
#include "window/declarativecoverwindow.h"
#include "core/pelkanlogging.h"
#include "core/theme.h"

#include <QDBusConnection>
#include <QDBusInterface>

namespace {
const QString HomeScreenPath = QStringLiteral("/com/kavoa/trevanel");
const QString HomeScreenInterface = QStringLiteral("com.kavoa.trevanel");
} // namespace

DeclarativeCover::DeclarativeCover(QQuickItem *parent)
    : Pelkan::Control(parent)
    , m_actionArea(new DeclarativeCoverActionArea(this))
    , m_homeScreen(new QDBusInterface(QString(), HomeScreenPath, HomeScreenInterface, QDBusConnection::sessionBus(), this))
{
    // Any sender: the home screen's bus name is not fixed.
    QDBusConnection::sessionBus().connect(QString(), HomeScreenPath, HomeScreenInterface, QStringLiteral("coverstatus"),
                                          this, SLOT(setStatus(int)));
    const QSize large = Pelkan::Theme::instance()->coverSizeLarge();
    setImplicitSize(large.width(), large.height());
    // A parent given at construction put the item in its window before itemChange() ran.
    applicationWindowChanged();
}

QQuickItem *DeclarativeCover::coverActionArea() const
{
    return m_actionArea;
}

void DeclarativeCover::setStatus(int status)
{
    if (status < Inactive || status > Deactivating) {
        qCWarning(lcPelkanCoverLog) << Q_FUNC_INFO << "invalid status:" << status;
        return;
    }
    if (Status(status) == m_status)
        return;
    m_status = Status(status);
    Q_EMIT statusChanged();
}

void DeclarativeCover::setAllowResize(bool allow)
{
    if (allow == m_allowResize)
        return;
    m_allowResize = allow;
    Q_EMIT allowResizeChanged();
}

void DeclarativeCover::setTransparent(bool transparent)
{
    if (transparent == m_transparent)
        return;
    m_transparent = transparent;
    Q_EMIT transparentChanged(); // the cover window publishes it
}

void DeclarativeCover::requestResize(float w, float h)
{
    tryResize(w, h, m_allowResize);
}

void DeclarativeCover::tryResize(float w, float h, bool allowResize)
{
    if (!allowResize)
        return;
    Pelkan::Theme *theme = Pelkan::Theme::instance();
    const QSize small = theme->coverSizeSmall();
    const Size size = w <= small.width() && h <= small.height() ? Small : Large;
    const QSize target = size == Small ? small : theme->coverSizeLarge();
    setSize(target);
    if (auto coverWindow = qobject_cast<DeclarativeCoverWindow *>(window()))
        coverWindow->setContentSize(target.width(), target.height());
    if (size != m_size) {
        m_size = size;
        Q_EMIT sizeChanged();
    }
}

void DeclarativeCover::itemChange(ItemChange change, const ItemChangeData &data)
{
    Pelkan::Control::itemChange(change, data);
    if (change == ItemSceneChange)
        applicationWindowChanged();
}

void DeclarativeCover::applicationWindowChanged()
{
    // A cover placed in a cover window becomes that window's cover.
    if (auto coverWindow = qobject_cast<DeclarativeCoverWindow *>(window()))
        coverWindow->setCover(this);
}
