#include "tolothumbnailcache.h"
#include "boundedimagereader.h"
#include "pelkanlogging.h"

#include <QCryptographicHash>
#include <QDir>
#include <QDateTime>
#include <QFileInfo>
#include <QImageReader>
#include <QSaveFile>

ToloThumbnailCache::ToloThumbnailCache(const QString &cacheDirectory)
    : m_directory(cacheDirectory)
{
}

ToloThumbnailCache::~ToloThumbnailCache() = default;

QString ToloThumbnailCache::cachePath(const QString &source, const QSize &size, bool crop) const
{
    const QByteArray key = QCryptographicHash::hash(QFileInfo(source).absoluteFilePath().toUtf8(), QCryptographicHash::Sha1).toHex();
    return QStringLiteral("%1/%2-%3x%4%5.png")
            .arg(m_directory, QString::fromLatin1(key))
            .arg(size.width())
            .arg(size.height())
            .arg(crop ? QStringLiteral("-crop") : QString());
}

namespace {

// What an entry remembers of its source: any change of either, to an older or a newer
// file alike, makes the entry stale.
const QString SourceSizeKey = QStringLiteral("Source-Size");
const QString SourceModifiedKey = QStringLiteral("Source-Modified");

QString sourceSize(const QFileInfo &source)
{
    return QString::number(source.size());
}

QString sourceModified(const QFileInfo &source)
{
    return QString::number(source.lastModified().toMSecsSinceEpoch());
}

} // namespace

ToloThumbnailCache::ThumbnailData ToloThumbnailCache::requestThumbnail(const QString &source, const QSize &size,
                                                                       bool crop, bool unbounded)
{
    const QString path = cachePath(source, size, crop);
    const QFileInfo original(source);
    if (original.exists() && QFileInfo::exists(path)) {
        QImageReader entry(path, "png");
        if (entry.text(SourceSizeKey) == sourceSize(original) && entry.text(SourceModifiedKey) == sourceModified(original)) {
            const QImage image = entry.read();
            if (!image.isNull())
                return { path, image };
        }
        // A stale or damaged entry is made again below.
    }
    return generateThumbnail(source, path, size, crop, unbounded);
}

ToloThumbnailCache::ThumbnailData ToloThumbnailCache::generateThumbnail(const QString &source, const QString &cachePath,
                                                                        const QSize &size, bool crop, bool unbounded)
{
    const QImage image = readImageThumbnail(source, size, crop, unbounded);
    if (image.isNull())
        return {};
    return { writeCacheFile(cachePath, image, source), image };
}

QImage ToloThumbnailCache::readImageThumbnail(const QString &source, const QSize &size, bool crop, bool unbounded)
{
    BoundedImageReader file(source);
    const BoundedImageReader::Status status = file.open();
    QImageReader &reader = file.reader();
    reader.setAutoTransform(true);
    QSize natural = file.declaredSize();
    if (status == BoundedImageReader::Ready && natural.isEmpty())
        reader.read(); // sets the error the warning below gives
    if (status != BoundedImageReader::Ready || natural.isEmpty()) {
        if (status != BoundedImageReader::NotRegularFile && status != BoundedImageReader::TooLarge)
            qCWarning(lcPelkanCoreLog) << "Thumbnail: cannot read" << source << ":"
                                       << (status == BoundedImageReader::Missing ? QStringLiteral("file not found") : reader.errorString());
        return {};
    }
    if (reader.transformation() & QImageIOHandler::TransformationRotate90)
        natural.transpose();

    QSize target = size;
    if (target.width() <= 0 && target.height() <= 0)
        target = natural;
    else if (target.width() <= 0)
        target.setWidth(qMax(1, qRound(qreal(natural.width()) * target.height() / natural.height())));
    else if (target.height() <= 0)
        target.setHeight(qMax(1, qRound(qreal(natural.height()) * target.width() / natural.width())));
    if (!unbounded && (target.width() > natural.width() || target.height() > natural.height()))
        target.scale(natural, Qt::KeepAspectRatio);
    target = BoundedImageReader::bounded(target);

    const QSize scaled = natural.scaled(target, crop ? Qt::KeepAspectRatioByExpanding : Qt::KeepAspectRatio);
    QImage image = reader.read();
    if (image.isNull()) {
        qCWarning(lcPelkanCoreLog) << "Thumbnail: cannot read" << source << ":" << reader.errorString();
        return {};
    }
    image = image.scaled(scaled, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    if (crop && image.size() != target) {
        const QRect middle(QPoint((image.width() - target.width()) / 2, (image.height() - target.height()) / 2), target);
        image = image.copy(middle);
    }
    return image;
}

QString ToloThumbnailCache::writeCacheFile(const QString &path, const QImage &image, const QString &source)
{
    QDir().mkpath(QFileInfo(path).absolutePath());
    QImage entry = image;
    if (!source.isEmpty()) {
        const QFileInfo original(source);
        entry.setText(SourceSizeKey, sourceSize(original));
        entry.setText(SourceModifiedKey, sourceModified(original));
    }
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly) || !entry.save(&file, "PNG") || !file.commit()) {
        qCWarning(lcPelkanCoreLog) << "Thumbnail: cannot write" << path << ":" << file.errorString();
        return QString();
    }
    return path;
}
