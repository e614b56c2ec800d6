#pragma once

#include <QColor>
#include <QPointer>
#include <QSGMaterial>
#include <QSGTextureProvider>

// What a background shape is drawn with: its colours, the pattern and the backdrop. The
// outline travels in the vertices, so shapes of any size with equal materials batch: a
// column of chat bubbles or three popups over one shared backdrop are one draw call.
class BackgroundShapeMaterial : public QSGMaterial
{
public:
    BackgroundShapeMaterial();

    // A shape with a tail draws with a program of its own: the others skip its distance.
    void setTailed(bool tailed) { m_tailed = tailed; }
    bool isTailed() const { return m_tailed; }

    QSGMaterialType *type() const override;
    QSGMaterialShader *createShader() const override;
    int compare(const QSGMaterial *other) const override;

    QColor color = Qt::transparent;
    QColor borderColor = Qt::transparent;
    QSGTexture *pattern = nullptr; // not owned
    float patternOpacity = 0;
    // Read at each draw, so a backdrop blurred later in the same frame is the one shown.
    QPointer<QSGTextureProvider> backdrop;

private:
    bool m_tailed = false;
};
