#pragma once

#include <QObject>
#include <qqml.h>

class QQuickItem;

// Attached as DragFilter: an item claims the drags that start on it (or on its children)
// in the given orientations, so that a page swipe or a pulley menu leaves them to it:
//     Slider { DragFilter.orientations: Qt.Horizontal }
// keeps a horizontal drag on the slider while the page stack still takes vertical ones.
class DeclarativeDragFilter : public QObject
{
    Q_OBJECT
    Q_PROPERTY(Qt::Orientations orientations READ orientations WRITE setOrientations NOTIFY orientationsChanged)
    Q_PROPERTY(bool enabled READ enabled WRITE setEnabled NOTIFY enabledChanged)

public:
    explicit DeclarativeDragFilter(QObject *parent = nullptr);

    static DeclarativeDragFilter *qmlAttachedProperties(QObject *object);

    Qt::Orientations orientations() const { return m_orientations; }
    void setOrientations(Qt::Orientations orientations);
    bool enabled() const { return m_enabled; }
    void setEnabled(bool enabled);

    // The orientations claimed by item and its ancestors below boundary (exclusive).
    static Qt::Orientations claimed(QQuickItem *item, const QQuickItem *boundary);

Q_SIGNALS:
    void orientationsChanged();
    void enabledChanged();

private:
    Qt::Orientations m_orientations;
    bool m_enabled = true;
};

QML_DECLARE_TYPEINFO(DeclarativeDragFilter, QML_HAS_ATTACHED_PROPERTIES)
