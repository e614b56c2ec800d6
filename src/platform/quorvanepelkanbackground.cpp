#include "quorvanepelkanbackground.h"

#include <QPainter>

void QuorvanePelkanBackground::setWhiteLevel(qreal level)
{
    m_whiteLevel = qBound<qreal>(0, level, 1);
}

QImage QuorvanePelkanBackground::apply(const QImage &image) const
{
    if (image.isNull())
        return image;
    QImage result(image.size(), QImage::Format_RGB32);
    result.fill(Qt::black);
    {
        QPainter painter(&result);
        painter.drawImage(0, 0, image);
    }
    if (m_whiteLevel >= 1.0)
        return result;

    // Scale each pixel down to the limit, keeping its hue.
    const int limit = qRound(m_whiteLevel * 255);
    for (int y = 0; y < result.height(); ++y) {
        auto line = reinterpret_cast<QRgb *>(result.scanLine(y));
        for (int x = 0; x < result.width(); ++x) {
            const QRgb pixel = line[x];
            const int brightest = qMax(qRed(pixel), qMax(qGreen(pixel), qBlue(pixel)));
            if (brightest > limit) {
                line[x] = qRgb(qRed(pixel) * limit / brightest, qGreen(pixel) * limit / brightest,
                               qBlue(pixel) * limit / brightest);
            }
        }
    }
    return result;
}
