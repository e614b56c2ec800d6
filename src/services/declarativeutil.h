#pragma once

#include <QObject>
#include <QRectF>

class QQuickItem;

// Util: what the toolkit's QML would otherwise work out in script, item by item: the
// nearest enclosing flickable or page, the nearest ancestor with a property, rectangles
// between items, whether an item shows in its window; and touch feedback at the active
// sound profile's level (none while the profile is silent).
class DeclarativeUtil : public QObject
{
    Q_OBJECT
    Q_PROPERTY(qreal touchToneLevel READ touchToneLevel NOTIFY touchToneLevelChanged)

public:
    explicit DeclarativeUtil(QObject *parent = nullptr);

    // The lookups take and return QObject: the engine hands such arguments and results over
    // as they are, while any other pointer type goes through a QVariant conversion on each
    // call, which costs several times the walk itself. Anything but an item finds nothing.
    Q_INVOKABLE QObject *findFlickable(QObject *item) const;
    Q_INVOKABLE QObject *findPage(QObject *item) const;
    // The nearest ancestor (not item itself) that has property; null when none.
    Q_INVOKABLE QObject *findAncestor(QObject *item, const QString &property) const;
    Q_INVOKABLE QRectF mapRect(QQuickItem *from, QQuickItem *to, const QRectF &rect) const;
    // Visible, not fully transparent along its ancestors, and at least partly inside its window.
    Q_INVOKABLE bool isVisibleInWindow(QQuickItem *item) const;

    // The frame-rate overlay (frames per second and a frame-time graph) over item's window.
    Q_INVOKABLE void showFrameRate(QQuickItem *item, bool shown);

    qreal touchToneLevel() const;
    // A press worth a touch tone: says touchFeedback(level) when the profile wants one.
    Q_INVOKABLE void playTouchFeedback();

Q_SIGNALS:
    void touchToneLevelChanged();
    // What a feedback backend plays: a touch tone at level (0..1].
    void touchFeedback(qreal level);
};
