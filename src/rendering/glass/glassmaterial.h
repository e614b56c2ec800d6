#pragma once

#include <QColor>
#include <QSGMaterial>
#include <QVector2D>
#include <QVector3D>

// What a glass glow draws with. Equal states compare equal across items so that glass
// items batch together.
struct GlassState {
    QSGTexture *pattern = nullptr; // not owned
    QColor color;
    QColor backgroundColor;
    QVector3D dash;        // dash length (0: no dashes), period, offset
    QVector2D centersize;  // the stretched part of the glow, in texture coordinates
    float border = 0;
    float sigma = 0;
    float brightness = 0;
    float size = 0;        // dash edge softness in pixels

    int compare(const GlassState &other) const;
};

// The glass material for one screen rotation (0, 90, 180 or 270 degrees): the dashes run
// along the item as the user sees it.
class GlassMaterial : public QSGMaterial
{
public:
    explicit GlassMaterial(int angle);

    static bool isValidAngle(int angle) { return angle == 0 || angle == 90 || angle == 180 || angle == 270; }

    int angle() const { return m_angle; }
    GlassState &state() { return m_state; }
    const GlassState &state() const { return m_state; }

    QSGMaterialType *type() const override;
    QSGMaterialShader *createShader() const override;
    int compare(const QSGMaterial *other) const override;

private:
    int m_angle;
    GlassState m_state;
};
