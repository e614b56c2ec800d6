#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

// The stored auto-fill suggestions of the process: one list per key, most recent first,
// at most 50, kept in memory once read and written back on save(). Each key is a file
// of one suggestion per line in the database folder (the generic data location's
// "system/privileged/autofill"); files are replaced whole through a temporary file and a
// rename, so a reader sees either the old or the new content.
//
// Keys must name a file in the folder: empty, ".", ".." and over-long keys are refused
// with a warning, and nothing outside the folder is ever read or written. If the folder
// cannot be made, suggestions still work in memory for the life of the process.
//
// Temporary files end in '~', which no key can hold; those left by a process killed while
// saving are removed when the folder is first used, once they are a minute old (younger
// ones may belong to another process saving right now).
class AutoFillDatabase
{
public:
    static constexpr int MaximumEntries = 50;

    static AutoFillDatabase *instance();
    explicit AutoFillDatabase(const QString &directory);

    QString directory() const { return m_directory; }
    static bool isUsableKey(const QString &key);
    // key with every code point removed that is not a letter, mark or digit of any script,
    // '_' or '.'; unpaired surrogates and control characters go too.
    static QString sanitisedKey(const QString &key);

    QStringList suggestions(const QString &key);
    // Puts the suggestion first (moving it there if present); false when refused.
    bool insert(const QString &key, const QString &suggestion);
    bool remove(const QString &key, const QString &suggestion);

    // Writes every changed list.
    void save();

    static QStringList readFile(const QString &path);
    static bool writeFile(const QString &path, const QStringList &lines);

private:
    struct Entry {
        QStringList suggestions;
        bool dirty = false;
    };
    Entry *entry(const QString &key);
    bool ensureDirectory();
    void removeStaleTemporaries();

    QString m_directory;
    bool m_directoryReady = false;
    bool m_directoryFailed = false;
    QHash<QString, Entry> m_entries;
};
