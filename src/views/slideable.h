#pragma once

#include <QElapsedTimer>
#include <QHash>
#include <QPointer>
#include <QQuickItem>
#include <QVariantAnimation>

class QQmlComponent;
class QQmlContext;
class SlideableModel;

// SlideableBase: shows one item at a time and slides to its neighbours, sideways or up and
// down, following the finger and settling on release: on the next item when the drag went
// past half an item or ended in a quick flick, back otherwise. Items come from `model` and
// `delegate` (the delegate sees index, modelData and the model's roles), or are the
// view's own children. Of the delegates, only the current item and `cacheSize` neighbours
// (split both ways, the odd one forward) are alive; the others are destroyed and made again
// when needed, except those that ask to be kept (Slide.keepAlive). `loops` joins the ends.
//
// At its first item (and last) without looping, the view gives the back (and forward)
// swipe to the page stack around it.
class Slideable : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QVariant model READ model WRITE setModel NOTIFY modelChanged)
    Q_PROPERTY(QQmlComponent *delegate READ delegate WRITE setDelegate NOTIFY delegateChanged)
    Q_PROPERTY(Qt::Orientation orientation READ orientation WRITE setOrientation NOTIFY orientationChanged)
    Q_PROPERTY(int currentIndex READ currentIndex WRITE setCurrentIndex NOTIFY currentIndexChanged)
    Q_PROPERTY(QQuickItem *currentItem READ currentItem NOTIFY currentItemChanged)
    Q_PROPERTY(int count READ count NOTIFY countChanged)
    Q_PROPERTY(int cacheSize READ cacheSize WRITE setCacheSize NOTIFY cacheSizeChanged)
    Q_PROPERTY(bool loops READ loops WRITE setLoops NOTIFY loopsChanged)
    Q_PROPERTY(bool interactive READ interactive WRITE setInteractive NOTIFY interactiveChanged)
    Q_PROPERTY(qreal position READ position NOTIFY positionChanged)
    Q_PROPERTY(bool moving READ moving NOTIFY movingChanged)
    Q_PROPERTY(bool dragging READ dragging NOTIFY draggingChanged)
    Q_PROPERTY(int aliveCount READ aliveCount NOTIFY aliveCountChanged)
    Q_PROPERTY(int duration READ duration WRITE setDuration NOTIFY durationChanged)

public:
    explicit Slideable(QQuickItem *parent = nullptr);
    ~Slideable() override;

    QVariant model() const;
    void setModel(const QVariant &model);
    QQmlComponent *delegate() const { return m_delegate; }
    void setDelegate(QQmlComponent *delegate);
    Qt::Orientation orientation() const { return m_orientation; }
    void setOrientation(Qt::Orientation orientation);
    int currentIndex() const { return m_currentIndex; }
    void setCurrentIndex(int index);
    QQuickItem *currentItem() const;
    int count() const;
    int cacheSize() const { return m_cacheSize; }
    void setCacheSize(int size);
    bool loops() const { return m_loops; }
    void setLoops(bool loops);
    bool interactive() const { return m_interactive; }
    void setInteractive(bool interactive);
    qreal position() const { return m_position; }
    bool moving() const { return m_moving; }
    bool dragging() const { return m_dragging; }
    int aliveCount() const { return m_items.size(); }
    int duration() const { return m_duration; }
    void setDuration(int duration);

    // operationType: TabViewAction.Animated (0) or Immediate (1).
    Q_INVOKABLE void moveTo(int index, int operationType = 0);
    Q_INVOKABLE void next(int operationType = 0);
    Q_INVOKABLE void previous(int operationType = 0);
    Q_INVOKABLE QQuickItem *itemAt(int index) const { return m_items.value(index); }

Q_SIGNALS:
    void modelChanged();
    void delegateChanged();
    void orientationChanged();
    void currentIndexChanged();
    void currentItemChanged();
    void countChanged();
    void cacheSizeChanged();
    void loopsChanged();
    void interactiveChanged();
    void positionChanged();
    void movingChanged();
    void draggingChanged();
    void aliveCountChanged();
    void durationChanged();

protected:
    void componentComplete() override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    bool childMouseEventFilter(QQuickItem *item, QEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseUngrabEvent() override;

private:
    qreal extent() const;
    qreal along(const QPointF &point) const;
    int wrap(int index) const;
    qreal offsetOf(int index) const;
    void keepRequestedIndex(int index);
    void setPosition(qreal position);
    void setMoving(bool moving);
    void setDragging(bool dragging);
    void modelChangedRows();
    void updateRow(int row);
    void refresh();
    QQuickItem *create(int index);
    void releaseItem(int index);
    void layoutItems();
    void updateDragFilter();
    void animateTo(qreal target);
    void settled();
    // The view comes to rest on index.
    void land(int index);

    bool press(const QPointF &scenePosition, ulong timestamp);
    bool move(const QPointF &scenePosition, ulong timestamp);
    bool release(const QPointF &scenePosition, ulong timestamp);

    SlideableModel *m_model;
    QPointer<QQmlComponent> m_delegate;
    QHash<int, QQuickItem *> m_items;      // alive items by index
    QHash<QQuickItem *, QQmlContext *> m_contexts; // the context each delegate item was made in
    QList<QQuickItem *> m_children;        // items declared as children, when no delegate
    QVariantAnimation m_animation;
    QPointF m_pressPosition;
    qreal m_pressViewPosition = 0;
    qreal m_lastAlong = 0;
    qreal m_velocity = 0;                  // pixels per second along the orientation
    ulong m_lastTimestamp = 0;
    qreal m_position = 0;
    int m_currentIndex = 0;
    int m_cacheSize = 2;
    int m_duration = 250;
    Qt::Orientation m_orientation = Qt::Horizontal;
    bool m_loops = false;
    bool m_interactive = true;
    bool m_pressed = false;
    bool m_dragging = false;
    bool m_moving = false;
    bool m_complete = false;
};
