#include "photos.h"

#include <QDir>
#include <QFileInfo>
#include <QImage>
#include <QPainter>
#include <QRadialGradient>
#include <QStandardPaths>

QStringList samplePhotos()
{
    const QString folder = QStandardPaths::writableLocation(QStandardPaths::CacheLocation) + QStringLiteral("/photos");
    QDir().mkpath(folder);
    QStringList paths;
    // A sky, a sea, a forest, a dusk, a field and a night: a gradient with a few suns.
    const int hues[] = { 205, 190, 120, 20, 55, 250 };
    for (int i = 0; i < 6; ++i) {
        const QString path = folder + QStringLiteral("/photo-%1.jpg").arg(i + 1);
        paths.append(path);
        if (QFileInfo::exists(path))
            continue;
        QImage image(1080, 1440, QImage::Format_RGB32);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        QLinearGradient sky(0, 0, 0, image.height());
        sky.setColorAt(0, QColor::fromHsv(hues[i], 160, 240));
        sky.setColorAt(1, QColor::fromHsv((hues[i] + 40) % 360, 220, 70));
        painter.fillRect(image.rect(), sky);
        for (int k = 0; k < 3; ++k) {
            const QPointF centre(200 + 340 * k, 300 + 380 * ((i + k) % 3));
            QRadialGradient sun(centre, 160 - 30 * k);
            sun.setColorAt(0, QColor(255, 250, 230, 230));
            sun.setColorAt(1, QColor(255, 250, 230, 0));
            painter.setBrush(sun);
            painter.setPen(Qt::NoPen);
            painter.drawEllipse(centre, 160 - 30 * k, 160 - 30 * k);
        }
        painter.end();
        image.save(path, "JPG", 85);
    }
    return paths;
}
