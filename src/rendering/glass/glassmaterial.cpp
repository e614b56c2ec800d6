#include "glassmaterial.h"
#include "rendering/glass/glassmaterialshader.h"

namespace {

int compareColor(const QColor &a, const QColor &b)
{
    return a.rgba() == b.rgba() ? 0 : (a.rgba() < b.rgba() ? -1 : 1);
}

template <typename T>
int compareValue(const T &a, const T &b)
{
    return a == b ? 0 : (a < b ? -1 : 1);
}

int compareVector(const float *a, const float *b, int n)
{
    for (int i = 0; i < n; ++i) {
        if (int c = compareValue(a[i], b[i]))
            return c;
    }
    return 0;
}

} // namespace

int GlassState::compare(const GlassState &o) const
{
    if (int c = compareValue(quintptr(pattern), quintptr(o.pattern)))
        return c;
    if (int c = compareColor(color, o.color))
        return c;
    if (int c = compareColor(backgroundColor, o.backgroundColor))
        return c;
    const float d1[3] = { dash.x(), dash.y(), dash.z() }, d2[3] = { o.dash.x(), o.dash.y(), o.dash.z() };
    if (int c = compareVector(d1, d2, 3))
        return c;
    const float c1[2] = { centersize.x(), centersize.y() }, c2[2] = { o.centersize.x(), o.centersize.y() };
    if (int c = compareVector(c1, c2, 2))
        return c;
    const float s1[4] = { border, sigma, brightness, size }, s2[4] = { o.border, o.sigma, o.brightness, o.size };
    return compareVector(s1, s2, 4);
}

GlassMaterial::GlassMaterial(int angle)
    : m_angle(angle)
{
    setFlag(Blending);
}

QSGMaterialType *GlassMaterial::type() const
{
    // One type per rotation: Glass0, Glass90, Glass180, Glass270.
    static QSGMaterialType types[4];
    return &types[m_angle / 90];
}

QSGMaterialShader *GlassMaterial::createShader() const
{
    return new GlassMaterialShader(m_angle);
}

int GlassMaterial::compare(const QSGMaterial *other) const
{
    return m_state.compare(static_cast<const GlassMaterial *>(other)->m_state);
}
