#pragma once

#include <QObject>
#include <QVariant>

// VariantInterpolator: `value` lies between `from` and `to` as `progress` goes from 0 to 1,
// for numbers, colours, points, sizes and rectangles. It lets a gesture drive a value
// (the distance a finger has pulled, the position of a slider) where an animation would
// drive it by time. Progress outside 0..1 extrapolates; `from` and `to` of different kinds
// give `from` until progress reaches 1, then `to`, with a warning.
class DeclarativeVariantInterpolator : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QVariant from READ from WRITE setFrom NOTIFY fromChanged)
    Q_PROPERTY(QVariant to READ to WRITE setTo NOTIFY toChanged)
    Q_PROPERTY(qreal progress READ progress WRITE setProgress NOTIFY progressChanged)
    Q_PROPERTY(QVariant value READ value NOTIFY valueChanged)

public:
    explicit DeclarativeVariantInterpolator(QObject *parent = nullptr);

    QVariant from() const { return m_from; }
    void setFrom(const QVariant &from);
    QVariant to() const { return m_to; }
    void setTo(const QVariant &to);
    qreal progress() const { return m_progress; }
    void setProgress(qreal progress);
    QVariant value() const { return m_value; }

    // The value at progress between two values; invalid when they cannot be mixed.
    static QVariant interpolate(const QVariant &from, const QVariant &to, qreal progress);

Q_SIGNALS:
    void fromChanged();
    void toChanged();
    void progressChanged();
    void valueChanged();

private:
    void update(bool progressed = false);

    QVariant m_from;
    QVariant m_to;
    QVariant m_value;
    qreal m_progress = 0;
    bool m_warned = false;
};
