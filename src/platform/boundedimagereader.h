#pragma once

#include <QFile>
#include <QImageReader>
#include <QSize>
#include <QString>

// An image reader that only reads what it can afford. Image files come from applications
// and from the user's folders: a small file can declare an image of billions of pixels,
// and a path can name a FIFO or a device that would block the loader thread forever.
//
// open() takes regular files only and reads the declared size before any pixels; an image
// that declares more than MaxSide on a side or MaxPixels in all is refused with a warning
// naming the file. bounded() shrinks a size asked for by the caller to the same limits.
class BoundedImageReader
{
public:
    // 8192 x 8192: 256 MiB of 32-bit pixels, more than any camera of the devices makes.
    static constexpr int MaxSide = 16384;
    static constexpr qint64 MaxPixels = qint64(8192) * 8192;

    enum Status { Ready, Missing, NotRegularFile, TooLarge, Unreadable };

    explicit BoundedImageReader(const QString &path);

    // Opens the file and reads its header. Warns itself for NotRegularFile and TooLarge;
    // Missing and Unreadable are left to the caller, which knows how loud to be.
    Status open();

    QImageReader &reader() { return m_reader; }
    QSize declaredSize() const { return m_size; }
    QString fileName() const { return m_path; }

    static bool fits(const QSize &size);
    // size, scaled down keeping its aspect ratio until it fits; an invalid size stays.
    static QSize bounded(const QSize &size);

private:
    QString m_path;
    QFile m_file;
    QImageReader m_reader;
    QSize m_size;
};
