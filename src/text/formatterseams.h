#pragma once

#include <QDateTime>
#include <QString>

// What the formatter takes from its surroundings: the current time and the folder of
// translation catalogues. Production code reads the clock and "/usr/share/translations/";
// tests fix both.
namespace FormatterSeams {

QDateTime currentDateTime();
QString translationsDirectory();

// An invalid date-time, or an empty folder, restores the real one.
void setCurrentDateTimeForTesting(const QDateTime &now);
void setTranslationsDirectoryForTesting(const QString &directory);

} // namespace FormatterSeams
