#pragma once

#include <QObject>
#include <qqml.h>

class QQuickItem;

// Attached as DragFilter: an item claims the drags that start on it (or on its children)
// in the given orientations, so that a page swipe or a pulley menu leaves them to it:
//     Slider { DragFilter.orientations: Qt.Horizontal }
// keeps a horizontal drag on the slider while the page stack still takes vertical ones.
// `releasedNavigation` (PageNavigation.Back and/or Forward) gives a claimed drag back to
// the page stack when it goes that way: a sliding view at its first item leaves the back
// swipe to the page.
class DeclarativeDragFilter : public QObject
{
    Q_OBJECT
    Q_PROPERTY(Qt::Orientations orientations READ orientations WRITE setOrientations NOTIFY orientationsChanged)
    Q_PROPERTY(bool enabled READ enabled WRITE setEnabled NOTIFY enabledChanged)
    Q_PROPERTY(int releasedNavigation READ releasedNavigation WRITE setReleasedNavigation NOTIFY releasedNavigationChanged)

public:
    explicit DeclarativeDragFilter(QObject *parent = nullptr);

    static DeclarativeDragFilter *qmlAttachedProperties(QObject *object);

    Qt::Orientations orientations() const { return m_orientations; }
    void setOrientations(Qt::Orientations orientations);
    bool enabled() const { return m_enabled; }
    void setEnabled(bool enabled);
    int releasedNavigation() const { return m_releasedNavigation; }
    void setReleasedNavigation(int navigation);

    // The orientations claimed by item and its ancestors below boundary (exclusive).
    static Qt::Orientations claimed(QQuickItem *item, const QQuickItem *boundary);
    // The navigation directions (PageNavigation.Back | Forward) that every filter claiming
    // orientation between item and boundary releases.
    static int released(QQuickItem *item, const QQuickItem *boundary, Qt::Orientation orientation);

Q_SIGNALS:
    void orientationsChanged();
    void enabledChanged();
    void releasedNavigationChanged();

private:
    Qt::Orientations m_orientations;
    bool m_enabled = true;
    int m_releasedNavigation = 0;
};

QML_DECLARE_TYPEINFO(DeclarativeDragFilter, QML_HAS_ATTACHED_PROPERTIES)
