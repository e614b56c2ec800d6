#include "boundedimagereader.h"
#include "pelkanlogging.h"

#include <QtMath>

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

BoundedImageReader::BoundedImageReader(const QString &path)
    : m_path(path)
{
}

bool BoundedImageReader::fits(const QSize &size)
{
    return size.width() <= MaxSide && size.height() <= MaxSide && qint64(size.width()) * size.height() <= MaxPixels;
}

QSize BoundedImageReader::bounded(const QSize &size)
{
    if (size.width() <= 0 || size.height() <= 0 || fits(size))
        return size;
    const qreal area = qreal(size.width()) * size.height();
    const qreal factor = qMin(qMin(qreal(MaxSide) / size.width(), qreal(MaxSide) / size.height()),
                              qSqrt(qreal(MaxPixels) / area));
    return QSize(qMax(1, int(size.width() * factor)), qMax(1, int(size.height() * factor)));
}

BoundedImageReader::Status BoundedImageReader::open()
{
    if (m_path.isEmpty())
        return Missing;
    // Non-blocking, so that opening a FIFO does not wait for a writer; checked on the open
    // descriptor, so that the file cannot be swapped between the check and the read.
    const int fd = ::open(QFile::encodeName(m_path).constData(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    if (fd < 0)
        return errno == ENOENT || errno == ENOTDIR ? Missing : Unreadable;
    struct stat info;
    if (::fstat(fd, &info) != 0 || !S_ISREG(info.st_mode)) {
        ::close(fd);
        qCWarning(lcPelkanCoreLog).noquote() << QStringLiteral("Image %1 is not a regular file; not loaded").arg(m_path);
        return NotRegularFile;
    }
    ::fcntl(fd, F_SETFL, ::fcntl(fd, F_GETFL) & ~O_NONBLOCK);
    // With its name, so that the reader takes the format from the suffix as for a path.
    m_file.setFileName(m_path);
    if (!m_file.open(fd, QIODevice::ReadOnly, QFileDevice::AutoCloseHandle)) {
        ::close(fd);
        return Unreadable;
    }
    m_reader.setDevice(&m_file);
    m_size = m_reader.size();
    if (!m_size.isValid())
        return Unreadable;
    if (!fits(m_size)) {
        qCWarning(lcPelkanCoreLog).noquote()
                << QStringLiteral("Image %1 declares %2x%3 pixels, more than the limit of %4 pixels or %5 on a side; not loaded")
                           .arg(m_path).arg(m_size.width()).arg(m_size.height()).arg(MaxPixels).arg(MaxSide);
        return TooLarge;
    }
    return Ready;
}
