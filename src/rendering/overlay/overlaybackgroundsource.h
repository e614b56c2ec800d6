#pragma once

#include "rendering/blur/blureffecttextureprovider.h"
#include "rendering/common/sharedbackdrop.h"

#include <QPointer>
#include <QQuickItem>
#include <QSet>

class QQuickShaderEffectSource;
class QQuickWindow;

// OverlayBackgroundSource: a blurred capture of `sourceItem`, made once per frame in which
// it changed and shared by every overlay that shows it as a frosted backdrop (through
// OverlayBackground or a GlassBackgroundBase's backdrop). It captures only while an overlay
// that uses it is visible, and only the part behind those overlays (`captureRect`, in the
// source item's coordinates), at a quarter of its resolution, since the blur scales it
// down further anyway; otherwise it costs nothing. It draws nothing itself, but must be in
// the scene (visible) to capture. The first source of a window is the one overlays use
// unless they name another. Overlays must not lie inside what it captures: they would
// show themselves.
class OverlayBackgroundSource : public QQuickItem, public SharedBackdrop
{
    Q_OBJECT
    Q_INTERFACES(SharedBackdrop)
    Q_PROPERTY(QQuickItem *sourceItem READ sourceItem WRITE setSourceItem NOTIFY sourceItemChanged)
    Q_PROPERTY(int levels READ levels WRITE setLevels NOTIFY levelsChanged)
    Q_PROPERTY(bool active READ isActive NOTIFY activeChanged)
    Q_PROPERTY(QRectF captureRect READ captureRect NOTIFY captureRectChanged)

public:
    explicit OverlayBackgroundSource(QQuickItem *parent = nullptr);
    ~OverlayBackgroundSource() override;

    QQuickItem *sourceItem() const { return m_sourceItem; }
    void setSourceItem(QQuickItem *item);
    // How far the capture is scaled down and blurred, each level halving it: 3 to 5 (the
    // quarter-size capture counts as two; less is taken as 3); 4 until set.
    int levels() const { return m_levels; }
    void setLevels(int levels);
    bool isActive() const { return m_active; }
    QRectF captureRect() const { return m_captureRect; }

    // An overlay that shows the source while it is visible.
    void addUser(QQuickItem *user) override;
    void removeUser(QQuickItem *user) override;

    static OverlayBackgroundSource *forWindow(QQuickWindow *window);

    bool isTextureProvider() const override { return true; }
    QSGTextureProvider *textureProvider() const override;

Q_SIGNALS:
    void sourceItemChanged();
    void levelsChanged();
    void activeChanged();
    void captureRectChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *) override;
    void releaseResources() override;
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private:
    void updateActive();
    void updateCaptureRect();
    void registerIn(QQuickWindow *window);

    QPointer<QQuickItem> m_sourceItem;
    QQuickShaderEffectSource *m_capture = nullptr; // while active
    QMetaObject::Connection m_frames;
    QRectF m_captureRect;
    QSet<QQuickItem *> m_users;
    QPointer<QQuickWindow> m_registeredIn;
    int m_levels = 4;
    bool m_active = false;
    mutable BlurEffectTextureProvider *m_provider = nullptr; // render thread
};
