#pragma once

#include <QPointer>
#include <QQuickItem>
#include <QRectF>
#include <QTimer>

class QPropertyAnimation;
class QQuickWindow;

// AutoScrollController: keeps the cursor of the focused text editor inside `flickable`
// visible along one `orientation`, scrolling the flickable (animated, unless `animated` is
// off) when focus arrives, the cursor moves, the flickable resizes or the keyboard rises.
// Vertically, the part of the flickable under the keyboard (`keyboardRectangle`, in window
// coordinates; the input method's own unless set) does not count as visible, and the
// content may scroll that much past its end while the keyboard is up. `margin` is kept
// free around the cursor.
//
// Created in QML with a `flickable`, or attached to a Flickable, which it then serves.
class AutoScrollController : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QQuickItem *flickable READ flickable WRITE setFlickable NOTIFY flickableChanged)
    Q_PROPERTY(Qt::Orientation orientation READ orientation WRITE setOrientation NOTIFY orientationChanged)
    Q_PROPERTY(bool enabled READ enabled WRITE setEnabled NOTIFY enabledChanged)
    Q_PROPERTY(bool animated READ animated WRITE setAnimated NOTIFY animatedChanged)
    Q_PROPERTY(qreal margin READ margin WRITE setMargin NOTIFY marginChanged)
    Q_PROPERTY(QRectF keyboardRectangle READ keyboardRectangle WRITE setKeyboardRectangle RESET resetKeyboardRectangle NOTIFY keyboardRectangleChanged)

public:
    explicit AutoScrollController(QObject *parent = nullptr);
    ~AutoScrollController() override;

    QQuickItem *flickable() const { return m_flickable; }
    void setFlickable(QQuickItem *flickable);
    Qt::Orientation orientation() const { return m_orientation; }
    void setOrientation(Qt::Orientation orientation);
    bool enabled() const { return m_enabled; }
    void setEnabled(bool enabled);
    bool animated() const { return m_animated; }
    void setAnimated(bool animated);
    qreal margin() const { return m_margin; }
    void setMargin(qreal margin);
    QRectF keyboardRectangle() const;
    void setKeyboardRectangle(const QRectF &rectangle);
    void resetKeyboardRectangle();

    // Scrolls now (rather than on the next turn of the event loop) if the cursor is out of view.
    Q_INVOKABLE void ensureVisible();

    static AutoScrollController *qmlAttachedProperties(QObject *object);

    // The nearest Flickable above item, or null.
    static QQuickItem *enclosingFlickable(QQuickItem *item);

Q_SIGNALS:
    void flickableChanged();
    void orientationChanged();
    void enabledChanged();
    void animatedChanged();
    void marginChanged();
    void keyboardRectangleChanged();

private:
    void schedule();
    void watchWindow(QQuickWindow *window);
    qreal keyboardOverlap() const;

    QPointer<QQuickItem> m_flickable;
    QPointer<QQuickWindow> m_window;
    QPropertyAnimation *m_animation;
    QTimer m_pending;
    QRectF m_keyboardRectangle;
    qreal m_margin = 0;
    Qt::Orientation m_orientation = Qt::Vertical;
    bool m_enabled = true;
    bool m_animated = true;
    bool m_keyboardRectangleSet = false;
};

QML_DECLARE_TYPEINFO(AutoScrollController, QML_HAS_ATTACHED_PROPERTIES)
