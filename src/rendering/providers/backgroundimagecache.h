#pragma once

#include "platform/quorvanepelkanbackground.h"
#include "platform/tolothumbnailcache.h"

// Processed backgrounds on disk, below the generic cache folder. Sizes: a requested side
// of 1 to 3 pixels is raised to 4 (nothing smaller is a background), and a picture is
// not enlarged beyond its own size times the application's scale factor.
class BackgroundImageCache : public ToloThumbnailCache
{
public:
    BackgroundImageCache();

    static QString defaultDirectory();
    void setAppScaleFactor(qreal factor) { m_background.setAppScaleFactor(factor); }

protected:
    ThumbnailData generateThumbnail(const QString &source, const QString &cachePath, const QSize &size, bool crop,
                                    bool unbounded) override;

private:
    QuorvanePelkanBackground m_background;
};
