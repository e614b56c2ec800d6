#pragma once

#include <QImage>
#include <QSize>
#include <QString>

// A thumbnail cache on disk: one file per source, size and crop, kept while its source
// keeps the size and modification time it had when the entry was made. Subclasses decide
// how a missing entry is made (generateThumbnail); the default reads the source at the
// asked size. Not thread-safe: use one cache per thread (the files themselves are
// written atomically, so caches may share a folder).
class ToloThumbnailCache
{
public:
    struct ThumbnailData {
        QString path;  // the cache file, empty when nothing was written
        QImage image;
        bool isValid() const { return !image.isNull(); }
    };

    explicit ToloThumbnailCache(const QString &cacheDirectory);
    virtual ~ToloThumbnailCache();

    QString cacheDirectory() const { return m_directory; }

    // The thumbnail of source at size. A side of size that is 0 follows the source's
    // aspect ratio; with crop the image fills size and is cut to it, otherwise it fits
    // inside. Unless unbounded, a thumbnail is never larger than its source.
    ThumbnailData requestThumbnail(const QString &source, const QSize &size, bool crop, bool unbounded = true);

    // The file a thumbnail is kept in.
    QString cachePath(const QString &source, const QSize &size, bool crop) const;

protected:
    virtual ThumbnailData generateThumbnail(const QString &source, const QString &cachePath, const QSize &size,
                                            bool crop, bool unbounded);

    // Reads source scaled for size (see requestThumbnail); a null image when unreadable.
    static QImage readImageThumbnail(const QString &source, const QSize &size, bool crop, bool unbounded);
    // Writes image to path atomically, noting what source looked like then; returns path,
    // or an empty text on failure.
    static QString writeCacheFile(const QString &path, const QImage &image, const QString &source = QString());

private:
    QString m_directory;
};
