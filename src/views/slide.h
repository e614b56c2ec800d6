#pragma once

#include <QPointer>
#include <QQuickItem>
#include <qqml.h>

class Slideable;

// Slide, attached to the items of a sliding view: the `view`, whether the item is the
// current one, whether any of it shows (`exposed`, also while a slide passes it), its
// neighbours `forward` and `backward` (null where there is none alive), and its `offset`
// from where the view stands, in items (0 current, 1 the next, fractions during a slide),
// for animating a page with the slide. `keepAlive` keeps the item (hidden) when it falls
// out of the view's cache, so a tab keeps its state.
class Slide : public QObject
{
    Q_OBJECT
    Q_PROPERTY(Slideable *view READ view NOTIFY viewChanged)
    Q_PROPERTY(bool isCurrent READ isCurrent NOTIFY isCurrentChanged)
    Q_PROPERTY(bool exposed READ exposed NOTIFY exposedChanged)
    Q_PROPERTY(QQuickItem *forward READ forward NOTIFY neighboursChanged)
    Q_PROPERTY(QQuickItem *backward READ backward NOTIFY neighboursChanged)
    Q_PROPERTY(qreal offset READ offset NOTIFY offsetChanged)
    Q_PROPERTY(int index READ index NOTIFY indexChanged)
    Q_PROPERTY(bool keepAlive READ keepAlive WRITE setKeepAlive NOTIFY keepAliveChanged)

public:
    explicit Slide(QObject *parent = nullptr);

    static Slide *qmlAttachedProperties(QObject *object);

    Slideable *view() const;
    bool isCurrent() const { return m_current; }
    bool exposed() const { return m_exposed; }
    QQuickItem *forward() const { return m_forward; }
    QQuickItem *backward() const { return m_backward; }
    qreal offset() const { return m_offset; }
    int index() const { return m_index; }
    bool keepAlive() const { return m_keepAlive; }
    void setKeepAlive(bool keep);

    // Set by the view.
    void update(Slideable *view, int index, qreal offset, bool current, bool exposed,
                QQuickItem *forward, QQuickItem *backward);

Q_SIGNALS:
    void viewChanged();
    void isCurrentChanged();
    void exposedChanged();
    void neighboursChanged();
    void offsetChanged();
    void indexChanged();
    void keepAliveChanged();

private:
    QPointer<Slideable> m_view;
    QPointer<QQuickItem> m_forward;
    QPointer<QQuickItem> m_backward;
    qreal m_offset = 0;
    int m_index = -1;
    bool m_current = false;
    bool m_exposed = false;
    bool m_keepAlive = false;
};

QML_DECLARE_TYPEINFO(Slide, QML_HAS_ATTACHED_PROPERTIES)
