#pragma once

#include "core/control.h"

class DeclarativeCoverActionArea;
class QDBusInterface;

// The root item of an application's cover, the live tile the home screen shows while the
// application is in the background. Its status follows the home screen's "coverstatus"
// signal on the session bus.
//
// Sizes: a cover is Large (the default) or Small, the two cover sizes of the theme.
// requestResize(w, h) asks for the size that fits w x h: Small when w x h fits within the
// small cover size, Large otherwise; it is honoured only while allowResize is true (the
// default is false). tryResize(w, h, allow) is the same with an explicit permission. The
// cover item takes the chosen size. transparent (false by default) tells the compositor
// whether the cover window is drawn over the wallpaper.
class DeclarativeCover : public Pelkan::Control
{
    Q_OBJECT
    Q_PROPERTY(Status status READ status NOTIFY statusChanged)
    Q_PROPERTY(bool allowResize READ allowResize WRITE setAllowResize NOTIFY allowResizeChanged)
    Q_PROPERTY(Size size READ size NOTIFY sizeChanged)
    Q_PROPERTY(bool transparent READ transparent WRITE setTransparent NOTIFY transparentChanged)
    Q_PROPERTY(QQuickItem *coverActionArea READ coverActionArea CONSTANT)

public:
    enum Status { Inactive, Activating, Active, Deactivating };
    Q_ENUM(Status)
    enum Size { Small, Large };
    Q_ENUM(Size)

    explicit DeclarativeCover(QQuickItem *parent = nullptr);

    Status status() const { return m_status; }
    bool allowResize() const { return m_allowResize; }
    void setAllowResize(bool allow);
    Size size() const { return m_size; }
    bool transparent() const { return m_transparent; }
    void setTransparent(bool transparent);
    QQuickItem *coverActionArea() const;

public Q_SLOTS:
    void requestResize(float w, float h);
    void applicationWindowChanged();
    void setStatus(int status);
    void tryResize(float w, float h, bool allowResize);

Q_SIGNALS:
    void statusChanged();
    void allowResizeChanged();
    void sizeChanged();
    void transparentChanged();

protected:
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private:
    Status m_status = Inactive;
    bool m_allowResize = false;
    Size m_size = Large;
    bool m_transparent = false;
    DeclarativeCoverActionArea *m_actionArea;
    QDBusInterface *m_homeScreen;
};
