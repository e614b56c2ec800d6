#pragma once

#include "blureffecttextureprovider.h"
#include "sourcelayer.h"

#include <QPointer>
#include <QQuickItem>
#include <QSet>

class QQuickWindow;

// OverlayBackgroundSource: a blurred capture of `sourceItem`, made once per frame in which
// it changed and shared by every overlay that shows it as a frosted backdrop (through
// OverlayBackground or a GlassBackgroundBase's backdrop). It captures only while an overlay
// that uses it is visible; otherwise it costs nothing. It draws nothing itself, but must be
// in the scene (visible) to capture. The first source of a window is the one overlays use
// unless they name another. Overlays must not lie inside what it captures: they would
// show themselves.
class OverlayBackgroundSource : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QQuickItem *sourceItem READ sourceItem WRITE setSourceItem NOTIFY sourceItemChanged)
    Q_PROPERTY(int levels READ levels WRITE setLevels NOTIFY levelsChanged)
    Q_PROPERTY(bool active READ isActive NOTIFY activeChanged)

public:
    explicit OverlayBackgroundSource(QQuickItem *parent = nullptr);
    ~OverlayBackgroundSource() override;

    QQuickItem *sourceItem() const { return m_sourceItem; }
    void setSourceItem(QQuickItem *item);
    // How far the capture is scaled down and blurred: 1 (half size) to 5.
    int levels() const { return m_levels; }
    void setLevels(int levels);
    bool isActive() const { return m_active; }

    // An overlay that shows the source while it is visible.
    void addUser(QQuickItem *user);
    void removeUser(QQuickItem *user);

    static OverlayBackgroundSource *forWindow(QQuickWindow *window);

    bool isTextureProvider() const override { return true; }
    QSGTextureProvider *textureProvider() const override;

Q_SIGNALS:
    void sourceItemChanged();
    void levelsChanged();
    void activeChanged();

protected:
    QSGNode *updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *) override;
    void releaseResources() override;
    void itemChange(ItemChange change, const ItemChangeData &data) override;

private:
    void updateActive();
    void registerIn(QQuickWindow *window);

    QPointer<QQuickItem> m_sourceItem;
    SourceLayer m_layer;
    QSet<QQuickItem *> m_users;
    QPointer<QQuickWindow> m_registeredIn;
    int m_levels = 3;
    bool m_active = false;
    mutable BlurEffectTextureProvider *m_provider = nullptr; // render thread
};
