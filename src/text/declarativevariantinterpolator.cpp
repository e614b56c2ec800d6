#include "declarativevariantinterpolator.h"

#include <QColor>
#include <QPointF>
#include <QQmlInfo>
#include <QRectF>
#include <QSizeF>

namespace {

qreal mix(qreal from, qreal to, qreal progress)
{
    return from + (to - from) * progress;
}

bool isNumber(const QVariant &value)
{
    switch (int(value.type())) {
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Float:
    case QMetaType::Double:
        return true;
    default:
        return false;
    }
}

// Colours from QML arrive as colours, or as strings ("#80ff0000", "red") when the
// property is a plain var.
bool toColor(const QVariant &value, QColor *color)
{
    if (value.type() == QVariant::Color) {
        *color = value.value<QColor>();
        return color->isValid();
    }
    if (value.type() == QVariant::String) {
        *color = QColor(value.toString());
        return color->isValid();
    }
    return false;
}

} // namespace

DeclarativeVariantInterpolator::DeclarativeVariantInterpolator(QObject *parent)
    : QObject(parent)
{
}

void DeclarativeVariantInterpolator::setFrom(const QVariant &from)
{
    if (from == m_from)
        return;
    m_from = from;
    m_warned = false;
    Q_EMIT fromChanged();
    update();
}

void DeclarativeVariantInterpolator::setTo(const QVariant &to)
{
    if (to == m_to)
        return;
    m_to = to;
    m_warned = false;
    Q_EMIT toChanged();
    update();
}

void DeclarativeVariantInterpolator::setProgress(qreal progress)
{
    if (progress == m_progress)
        return;
    m_progress = progress;
    Q_EMIT progressChanged();
    update(true);
}

QVariant DeclarativeVariantInterpolator::interpolate(const QVariant &from, const QVariant &to, qreal progress)
{
    if (isNumber(from) && isNumber(to))
        return mix(from.toReal(), to.toReal(), progress);

    QColor fromColor, toColor_;
    if (toColor(from, &fromColor) && toColor(to, &toColor_)) {
        const auto channel = [progress](qreal a, qreal b) { return qBound<qreal>(0, mix(a, b, progress), 1); };
        return QColor::fromRgbF(channel(fromColor.redF(), toColor_.redF()),
                                channel(fromColor.greenF(), toColor_.greenF()),
                                channel(fromColor.blueF(), toColor_.blueF()),
                                channel(fromColor.alphaF(), toColor_.alphaF()));
    }

    const int type = int(from.type());
    if (type != int(to.type()))
        return QVariant();
    switch (type) {
    case QMetaType::QPointF:
    case QMetaType::QPoint: {
        const QPointF a = from.toPointF(), b = to.toPointF();
        return QPointF(mix(a.x(), b.x(), progress), mix(a.y(), b.y(), progress));
    }
    case QMetaType::QSizeF:
    case QMetaType::QSize: {
        const QSizeF a = from.toSizeF(), b = to.toSizeF();
        return QSizeF(mix(a.width(), b.width(), progress), mix(a.height(), b.height(), progress));
    }
    case QMetaType::QRectF:
    case QMetaType::QRect: {
        const QRectF a = from.toRectF(), b = to.toRectF();
        return QRectF(mix(a.x(), b.x(), progress), mix(a.y(), b.y(), progress),
                      mix(a.width(), b.width(), progress), mix(a.height(), b.height(), progress));
    }
    default:
        return QVariant();
    }
}

void DeclarativeVariantInterpolator::update(bool progressed)
{
    QVariant value;
    if (!m_from.isValid() || !m_to.isValid()) {
        value = m_from.isValid() ? m_from : m_to;
    } else {
        value = interpolate(m_from, m_to, m_progress);
        if (!value.isValid()) {
            // Only when progress moves: from and to are often set one after the other.
            if (progressed && !m_warned) {
                qmlWarning(this) << "cannot interpolate between " << m_from.typeName() << " and " << m_to.typeName();
                m_warned = true;
            }
            value = m_progress < 1 ? m_from : m_to;
        }
    }
    if (value == m_value && value.type() == m_value.type())
        return;
    m_value = value;
    Q_EMIT valueChanged();
}
