#pragma once

#include "core/control.h"
#include "enums/declarativepagenavigation.h"

#include <QHash>
#include <QPointer>

// The native base of the page stack: it watches every mouse event that reaches the stack
// or its children, decides whether a finger movement is a navigation swipe, claims the
// mouse once it is, and publishes the live swipe distance in four flick differences that
// the QML layer binds its page transitions to. It also turns the Back key into pop() (or
// lowers the window with one page left), and resolves pages named by module.
//
// resolveImportPage("Some.Module.PageName") reads the qmldir of "Some.Module", found in
// the engine's import paths (Qt's own QML folder is the last of them), takes the first
// line whose first word is "PageName", imports the module once at the version on that
// line, and returns a file URL of the line's file under the module folder
// ("file:///.../Some/Module/PageName.qml"). Without a module part the name is returned
// with ".qml" appended; without a qmldir or a matching line the URL of
// "<module folder>/PageName.qml" is returned, with a warning. Each name is resolved once.
class DeclarativePageStackBase : public Pelkan::Control
{
    Q_OBJECT
    Q_PROPERTY(bool pressed READ isPressed NOTIFY pressedChanged)
    Q_PROPERTY(bool busy READ busy NOTIFY busyChanged FINAL)
    Q_PROPERTY(int depth READ depth WRITE setDepth NOTIFY depthChanged FINAL)
    Q_PROPERTY(bool backNavigation READ backNavigation WRITE setBackNavigation NOTIFY backNavigationChanged)
    Q_PROPERTY(bool forwardNavigation READ forwardNavigation WRITE setForwardNavigation NOTIFY forwardNavigationChanged)
    Q_PROPERTY(bool horizontalNavigationStyle READ horizontalNavigationStyle NOTIFY horizontalNavigationStyleChanged)
    Q_PROPERTY(DeclarativePageNavigation::Style navigationStyle READ navigationStyle WRITE setNavigationStyle NOTIFY navigationStyleChanged)
    Q_PROPERTY(float _leftFlickDifference READ leftFlickDifference NOTIFY backFlickDifferenceChanged)
    Q_PROPERTY(float _rightFlickDifference READ rightFlickDifference NOTIFY forwardFlickDifferenceChanged)
    Q_PROPERTY(float _upFlickDifference READ upFlickDifference NOTIFY upFlickDifferenceChanged)
    Q_PROPERTY(float _downFlickDifference READ downFlickDifference NOTIFY downFlickDifferenceChanged)
    Q_PROPERTY(int _ongoingTransitionCount READ ongoingTransitionCount WRITE setOngoingTransitionCount NOTIFY ongoingTransitionCountChanged)
    Q_PROPERTY(QQuickItem *_currentContainer READ currentContainer WRITE setCurrentContainer NOTIFY currentContainerChanged)
    Q_PROPERTY(QQuickItem *currentPage READ currentPage WRITE setCurrentPage NOTIFY currentPageChanged)
    Q_PROPERTY(bool _noGrabbing READ noGrabbing WRITE setNoGrabbing NOTIFY noGrabbingChanged)

public:
    explicit DeclarativePageStackBase(QQuickItem *parent = nullptr);

    bool isPressed() const { return m_pressed; }
    bool busy() const { return m_ongoingTransitionCount > 0; }
    int depth() const { return m_depth; }
    void setDepth(int depth);
    bool backNavigation() const { return m_backNavigation; }
    void setBackNavigation(bool enabled);
    bool forwardNavigation() const { return m_forwardNavigation; }
    void setForwardNavigation(bool enabled);
    bool horizontalNavigationStyle() const { return m_navigationStyle == DeclarativePageNavigation::Horizontal; }
    DeclarativePageNavigation::Style navigationStyle() const { return m_navigationStyle; }
    void setNavigationStyle(DeclarativePageNavigation::Style style);
    float leftFlickDifference() const { return m_left; }
    float rightFlickDifference() const { return m_right; }
    float upFlickDifference() const { return m_up; }
    float downFlickDifference() const { return m_down; }
    int ongoingTransitionCount() const { return m_ongoingTransitionCount; }
    void setOngoingTransitionCount(int count);
    QQuickItem *currentContainer() const { return m_currentContainer; }
    void setCurrentContainer(QQuickItem *container);
    QQuickItem *currentPage() const { return m_currentPage; }
    void setCurrentPage(QQuickItem *page);
    bool noGrabbing() const { return m_noGrabbing; }
    void setNoGrabbing(bool noGrabbing);

    Q_INVOKABLE bool handlePress(QPointF pos);
    Q_INVOKABLE bool handleMove(QPointF pos);
    Q_INVOKABLE void handleRelease();
    Q_INVOKABLE QString resolveImportPage(const QString &page);
    Q_INVOKABLE void _grabMouse();

Q_SIGNALS:
    void busyChanged();
    void depthChanged();
    void backFlickDifferenceChanged();
    void forwardFlickDifferenceChanged();
    void upFlickDifferenceChanged();
    void downFlickDifferenceChanged();
    void ongoingTransitionCountChanged();
    void backNavigationChanged();
    void forwardNavigationChanged();
    void horizontalNavigationStyleChanged();
    void navigationStyleChanged();
    void currentContainerChanged();
    void currentPageChanged();
    void pressedChanged();
    void noGrabbingChanged();
    void pressed();
    void released();
    void canceled();

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseUngrabEvent() override;
    bool childMouseEventFilter(QQuickItem *item, QEvent *event) override;
    bool eventFilter(QObject *object, QEvent *event) override;

private:
    bool handleMouse(QMouseEvent *event);
    bool keptGrabElsewhere() const;
    void setPressedAndAnnounce();
    void reset();
    void publish(float &field, float value, void (DeclarativePageStackBase::*signal)());

    bool m_pressed = false;
    int m_depth = 0;
    bool m_backNavigation = true;
    bool m_forwardNavigation = false;
    DeclarativePageNavigation::Style m_navigationStyle = DeclarativePageNavigation::Horizontal;
    float m_left = 0;
    float m_right = 0;
    float m_up = 0;
    float m_down = 0;
    int m_ongoingTransitionCount = 0;
    bool m_noGrabbing = false;

    bool m_gestureCaptured = false;
    bool m_mouseGrabbed = false;
    bool m_verticalBlocked = false;
    bool m_trackingLeft = false;
    bool m_trackingRight = false;
    bool m_trackingUp = false;
    bool m_trackingDown = false;
    QPointF m_pressPosition;
    QPointF m_pressWindowPosition;
    ulong m_pressTimestamp = 0;
    Qt::Orientations m_claimedByChild; // by a DragFilter under the press
    int m_releasedByChild = 0; // the directions that claim gives back (PageNavigation flags)
    QPointer<QQuickItem> m_currentContainer;
    QPointer<QQuickItem> m_currentPage;
    QHash<QString, QString> m_importCache;
};
