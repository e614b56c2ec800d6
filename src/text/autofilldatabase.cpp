#include "autofilldatabase.h"
#include "core/pelkanlogging.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QStandardPaths>
#include <QTemporaryFile>

#include <cstdio>

namespace {
// File names are limited to 255 bytes; keep clear of it.
const int MaximumKeyLength = 200;
const QLatin1String TemporarySuffix("~");
const int StaleTemporarySeconds = 60;

bool isKeyCharacter(uint code)
{
    if (code == '_' || code == '.')
        return true;
    switch (QChar::category(code)) {
    case QChar::Letter_Uppercase:
    case QChar::Letter_Lowercase:
    case QChar::Letter_Titlecase:
    case QChar::Letter_Modifier:
    case QChar::Letter_Other:
    case QChar::Mark_NonSpacing:
    case QChar::Mark_SpacingCombining:
    case QChar::Number_DecimalDigit:
    case QChar::Number_Letter:
    case QChar::Number_Other:
        return true;
    default:
        return false;
    }
}
} // namespace

AutoFillDatabase *AutoFillDatabase::instance()
{
    static AutoFillDatabase database(QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation)
                                     + QLatin1String("/system/privileged/autofill"));
    return &database;
}

AutoFillDatabase::AutoFillDatabase(const QString &directory)
    : m_directory(directory)
{
}

bool AutoFillDatabase::isUsableKey(const QString &key)
{
    return !key.isEmpty() && key != QLatin1String(".") && key != QLatin1String("..")
            && !key.contains(QLatin1Char('/')) && key.toUtf8().size() <= MaximumKeyLength;
}

QString AutoFillDatabase::sanitisedKey(const QString &key)
{
    QString result;
    result.reserve(key.size());
    for (int i = 0; i < key.size(); ++i) {
        const QChar c = key.at(i);
        if (c.isHighSurrogate() && i + 1 < key.size() && key.at(i + 1).isLowSurrogate()) {
            const uint code = QChar::surrogateToUcs4(c, key.at(i + 1));
            if (isKeyCharacter(code))
                result.append(c).append(key.at(i + 1));
            ++i;
        } else if (!c.isSurrogate() && isKeyCharacter(c.unicode())) {
            result.append(c);
        }
    }
    return result;
}

void AutoFillDatabase::removeStaleTemporaries()
{
    const QDateTime stale = QDateTime::currentDateTimeUtc().addSecs(-StaleTemporarySeconds);
    const QFileInfoList leftovers = QDir(m_directory).entryInfoList({ QLatin1String("*") + TemporarySuffix },
                                                                    QDir::Files | QDir::Hidden | QDir::System);
    for (const QFileInfo &leftover : leftovers) {
        if (leftover.lastModified().toUTC() < stale)
            QFile::remove(leftover.filePath());
    }
}

bool AutoFillDatabase::ensureDirectory()
{
    if (m_directoryReady)
        return true;
    if (m_directoryFailed)
        return false;
    if (!QDir().mkpath(m_directory)) {
        m_directoryFailed = true;
        qCWarning(lcPelkanCoreLog, "Unable to create a directory for the auto fill database.");
        return false;
    }
    m_directoryReady = true;
    removeStaleTemporaries();
    return true;
}

AutoFillDatabase::Entry *AutoFillDatabase::entry(const QString &key)
{
    if (!isUsableKey(key)) {
        qCWarning(lcPelkanCoreLog) << "AutoFill: the key" << key.left(40) << "does not name a file; refused";
        return nullptr;
    }
    auto it = m_entries.find(key);
    if (it == m_entries.end()) {
        Entry loaded;
        if (ensureDirectory())
            loaded.suggestions = readFile(m_directory + QLatin1Char('/') + key);
        it = m_entries.insert(key, loaded);
    }
    return &*it;
}

QStringList AutoFillDatabase::suggestions(const QString &key)
{
    Entry *e = entry(key);
    return e ? e->suggestions : QStringList();
}

bool AutoFillDatabase::insert(const QString &key, const QString &suggestion)
{
    Entry *e = entry(key);
    if (!e)
        return false;
    e->suggestions.removeOne(suggestion);
    e->suggestions.prepend(suggestion);
    while (e->suggestions.size() > MaximumEntries)
        e->suggestions.removeLast();
    e->dirty = true;
    return true;
}

bool AutoFillDatabase::remove(const QString &key, const QString &suggestion)
{
    Entry *e = entry(key);
    if (!e || !e->suggestions.removeOne(suggestion))
        return false;
    e->dirty = true;
    return true;
}

void AutoFillDatabase::save()
{
    if (!ensureDirectory())
        return;
    for (auto it = m_entries.begin(); it != m_entries.end(); ++it) {
        if (it->dirty && writeFile(m_directory + QLatin1Char('/') + it.key(), it->suggestions))
            it->dirty = false;
    }
}

QStringList AutoFillDatabase::readFile(const QString &path)
{
    QStringList lines;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return lines;
    while (!file.atEnd()) {
        const QString line = QString::fromUtf8(file.readLine()).trimmed();
        if (!line.isEmpty())
            lines.append(line);
    }
    return lines;
}

bool AutoFillDatabase::writeFile(const QString &path, const QStringList &lines)
{
    QTemporaryFile temporary(QFileInfo(path).absoluteFilePath() + QLatin1String(".XXXXXX") + TemporarySuffix);
    temporary.setAutoRemove(false);
    if (!temporary.open())
        return false;
    for (const QString &line : lines) {
        temporary.write(line.toUtf8());
        temporary.write("\n", 1);
    }
    const bool flushed = temporary.flush();
    temporary.close();
    if (!flushed || std::rename(QFile::encodeName(temporary.fileName()).constData(), QFile::encodeName(path).constData()) != 0) {
        QFile::remove(temporary.fileName());
        return false;
    }
    return true;
}
