#pragma once

#include <QImage>

// Prepares a picture for use as the background behind the user interface: it becomes
// opaque (transparency shows black), and no pixel is brighter than the white level, so
// that text in the theme's colours stays readable on it.
class QuorvanePelkanBackground
{
public:
    // 0 (black) to 1 (no limit); values outside are clamped.
    void setWhiteLevel(qreal level);
    qreal whiteLevel() const { return m_whiteLevel; }

    // The scale at which the application draws (the theme's pixel ratio); 1 unless set.
    void setAppScaleFactor(qreal factor) { m_appScaleFactor = factor > 0 ? factor : 1.0; }
    qreal appScaleFactor() const { return m_appScaleFactor; }

    QImage apply(const QImage &image) const;

private:
    qreal m_whiteLevel = 1.0;
    qreal m_appScaleFactor = 1.0;
};
