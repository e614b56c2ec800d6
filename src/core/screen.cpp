#include "screen.h"
#include "mgconfitem.h"
#include "pelkanlogging.h"

#include <QGuiApplication>
#include <QScreen>
#include <QtMath>

namespace Pelkan {

static const qreal MillimetresPerInch = 25.4;

Screen *Screen::instance()
{
    static QPointer<Screen> s_instance;
    if (!s_instance)
        s_instance = new Screen(QCoreApplication::instance());
    return s_instance;
}

Screen::Screen(QObject *parent)
    : QObject(parent)
    , m_diagonalConfig(new MGConfItem(QStringLiteral("/desktop/quorvane/pelkan/screen/diagonal"), this))
{
    connect(m_diagonalConfig, &MGConfItem::valueChanged, this, &Screen::update);
    if (auto app = qobject_cast<QGuiApplication *>(QCoreApplication::instance())) {
        connect(app, &QGuiApplication::primaryScreenChanged, this, &Screen::trackScreen);
        trackScreen(QGuiApplication::primaryScreen());
    } else {
        update();
    }
}

Screen::~Screen() = default;

Screen::SizeCategory Screen::sizeCategory() const
{
    return categoryForDiagonal(m_diagonal);
}

Screen::SizeCategory Screen::categoryForDiagonal(qreal inches)
{
    if (inches < 4.5)
        return Small;
    if (inches < 7.0)
        return Medium;
    if (inches < 11.0)
        return Large;
    return ExtraLarge;
}

void Screen::trackScreen(QScreen *screen)
{
    if (m_screen)
        disconnect(m_screen, nullptr, this, nullptr);
    m_screen = screen;
    if (screen) {
        connect(screen, &QScreen::geometryChanged, this, &Screen::update);
        connect(screen, &QScreen::physicalSizeChanged, this, &Screen::update);
    }
    update();
}

void Screen::update()
{
    int width = m_width;
    int height = m_height;
    qreal diagonal = m_diagonal;

    if (m_screen) {
        const QSize pixels = m_screen->geometry().size() * m_screen->devicePixelRatio();
        width = qMin(pixels.width(), pixels.height());
        height = qMax(pixels.width(), pixels.height());
        const QSizeF mm = m_screen->physicalSize();
        if (mm.width() > 0 && mm.height() > 0)
            diagonal = qSqrt(mm.width() * mm.width() + mm.height() * mm.height()) / MillimetresPerInch;
    }

    const QVariant configured = m_diagonalConfig->value();
    if (configured.isValid()) {
        bool ok = false;
        const qreal inches = configured.toReal(&ok);
        if (ok && inches > 0)
            diagonal = inches;
        else
            qCWarning(lcPelkanCoreLog) << "Screen: ignoring invalid diagonal" << configured;
    }

    const bool geometry = width != m_width || height != m_height;
    const SizeCategory oldCategory = sizeCategory();
    const bool diagonalChanged = !qFuzzyCompare(diagonal, m_diagonal);
    m_width = width;
    m_height = height;
    m_diagonal = diagonal;

    if (geometry)
        Q_EMIT geometryChanged();
    if (diagonalChanged || oldCategory != sizeCategory())
        Q_EMIT sizeCategoryChanged();
}

} // namespace Pelkan
