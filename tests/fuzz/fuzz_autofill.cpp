// Auto-fill keys and database operations: no key may reach a file outside the folder,
// and what is inserted is read back.
#include "text/autofilldatabase.h"
#include "fuzzinput.h"

#include <QDir>
#include <QTemporaryDir>

namespace {
QTemporaryDir *s_parent = nullptr;
}

extern "C" int LLVMFuzzerInitialize(int *, char ***)
{
    s_parent = new QTemporaryDir;
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    FuzzInput in(data, size);
    const QString directory = s_parent->filePath(QStringLiteral("db/autofill"));
    {
        AutoFillDatabase database(directory);
        while (!in.atEnd()) {
            const uint8_t operation = in.take<uint8_t>();
            const QString key = AutoFillDatabase::sanitisedKey(in.takeText(in.take<uint8_t>() % 40));
            const QString suggestion = in.takeText(in.take<uint8_t>() % 40).simplified();
            if (suggestion.contains(QChar(0)) || suggestion.isEmpty())
                continue;
            switch (operation % 4) {
            case 0:
                if (database.insert(key, suggestion) && database.suggestions(key).value(0) != suggestion)
                    __builtin_trap();
                break;
            case 1:
                database.remove(key, suggestion);
                break;
            case 2:
                database.suggestions(key);
                break;
            default:
                database.save();
            }
        }
        database.save();
    }
    // Everything written stays in the folder.
    if (QDir(s_parent->filePath(QStringLiteral("db"))).entryList(QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden)
            != QStringList({ QStringLiteral("autofill") }) && QDir(directory).exists())
        __builtin_trap();
    QDir(s_parent->filePath(QStringLiteral("db"))).removeRecursively();
    return 0;
}
