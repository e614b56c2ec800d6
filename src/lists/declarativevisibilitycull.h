#pragma once

#include <QPointer>
#include <QQuickItem>

// VisibilityCull: leaves out of rendering the children of a long column or repeater that
// lie outside the flickable's visible area plus a margin, and draws them again as they
// scroll in. Culled children keep their `visible` and their place in the layout; only the
// scene graph skips them. Declared inside the column (or other container) it culls:
//     Column { VisibilityCull {} Repeater { model: 1000; ... } }
// target defaults to the parent, flickable to the nearest Flickable above it.
class DeclarativeVisibilityCull : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QQuickItem *target READ target WRITE setTarget NOTIFY targetChanged)
    Q_PROPERTY(QQuickItem *flickable READ flickable WRITE setFlickable NOTIFY flickableChanged)
    Q_PROPERTY(qreal margin READ margin WRITE setMargin NOTIFY marginChanged)
    Q_PROPERTY(int drawnCount READ drawnCount NOTIFY drawnCountChanged)

public:
    explicit DeclarativeVisibilityCull(QQuickItem *parent = nullptr);
    ~DeclarativeVisibilityCull() override;

    QQuickItem *target() const { return m_target; }
    void setTarget(QQuickItem *target);
    QQuickItem *flickable() const { return m_flickable; }
    void setFlickable(QQuickItem *flickable);
    qreal margin() const { return m_margin; }
    void setMargin(qreal margin);
    // Children of the target, with a size, drawn after the last update.
    int drawnCount() const { return m_drawnCount; }

    // Culls and restores the target's children for the flickable's current view.
    Q_INVOKABLE void update();

Q_SIGNALS:
    void targetChanged();
    void flickableChanged();
    void marginChanged();
    void drawnCountChanged();

protected:
    void itemChange(ItemChange change, const ItemChangeData &data) override;
    void componentComplete() override;

private:
    void follow();
    void scheduleUpdate();
    void restoreAll();

    QPointer<QQuickItem> m_target;
    QPointer<QQuickItem> m_flickable;
    bool m_targetSet = false;
    bool m_flickableSet = false;
    qreal m_margin = 0;
    int m_drawnCount = 0;
    bool m_updatePending = false;
    QList<QPointer<QQuickItem>> m_culled;
    QList<QMetaObject::Connection> m_connections;
};
