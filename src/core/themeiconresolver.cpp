#include "themeiconresolver.h"
#include "theme.h"

#include <QFileInfo>
#include <QHash>
#include <QReadWriteLock>
#include <QUrl>

namespace Pelkan {

namespace {

struct ResolverCache {
    QReadWriteLock lock;
    QHash<QString, QString> paths;
};

Q_GLOBAL_STATIC(ResolverCache, s_cache)

bool hasImageSuffix(const QString &name)
{
    return name.endsWith(QLatin1String(".png")) || name.endsWith(QLatin1String(".svg"))
            || name.endsWith(QLatin1String(".jpg"));
}

} // namespace

ThemeIconResolver::ThemeIconResolver()
    : ThemeIconResolver(Theme::instance()->themeDirectory(), Theme::instance()->pixelRatio())
{
}

ThemeIconResolver::ThemeIconResolver(const QString &themeDirectory, qreal pixelRatio)
    : m_directory(themeDirectory)
    , m_pixelRatio(pixelRatio)
    , m_ratioFolder(ratioFolder(pixelRatio))
{
}

QString ThemeIconResolver::ratioFolder(qreal pixelRatio)
{
    QString number = QString::number(pixelRatio, 'f', 2);
    while (number.endsWith(QLatin1Char('0')) && !number.endsWith(QLatin1String(".0")))
        number.chop(1);
    return QLatin1Char('z') + number;
}

QString ThemeIconResolver::resolvePath(const QString &name) const
{
    if (name.isEmpty())
        return QString();
    if (name.startsWith(QLatin1Char('/')))
        return name;
    if (name.startsWith(QLatin1String("file:")))
        return QUrl(name).toLocalFile();
    if (name.contains(QLatin1Char('/')) || name == QLatin1String(".."))
        return QString();

    const QString key = m_directory + QLatin1Char('\n') + m_ratioFolder + QLatin1Char('\n') + name;
    {
        QReadLocker locker(&s_cache->lock);
        auto it = s_cache->paths.constFind(key);
        if (it != s_cache->paths.constEnd())
            return *it;
    }
    const QString path = search(name);
    QWriteLocker locker(&s_cache->lock);
    s_cache->paths.insert(key, path);
    return path;
}

QString ThemeIconResolver::search(const QString &name) const
{
    static const char *const folders[] = { "/icons/", "/graphics/" };
    const QStringList files = hasImageSuffix(name)
            ? QStringList { name }
            : QStringList { name + QLatin1String(".png"), name + QLatin1String(".svg") };

    for (const char *folder : folders) {
        const QString base = m_directory + QLatin1String(folder);
        for (const QString &dir : { base + m_ratioFolder + QLatin1Char('/'), base }) {
            for (const QString &file : files) {
                const QFileInfo info(dir + file);
                if (info.isFile())
                    return info.filePath();
            }
        }
    }
    return QString();
}

void ThemeIconResolver::clearCache()
{
    QWriteLocker locker(&s_cache->lock);
    s_cache->paths.clear();
}

} // namespace Pelkan
