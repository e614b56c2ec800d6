#include "formatterseams.h"

namespace {
QDateTime s_fixedNow;
QString s_translationsDirectory;
} // namespace

namespace FormatterSeams {

qint64 currentMSecsSinceEpoch()
{
    return s_fixedNow.isValid() ? s_fixedNow.toMSecsSinceEpoch() : QDateTime::currentMSecsSinceEpoch();
}

QDate currentDate()
{
    return s_fixedNow.isValid() ? s_fixedNow.date() : QDate::currentDate();
}

QString translationsDirectory()
{
    return s_translationsDirectory.isEmpty() ? QStringLiteral("/usr/share/translations/") : s_translationsDirectory;
}

void setCurrentDateTimeForTesting(const QDateTime &now)
{
    s_fixedNow = now;
}

void setTranslationsDirectoryForTesting(const QString &directory)
{
    s_translationsDirectory = directory;
}

} // namespace FormatterSeams
