#pragma once

#include <QDateTime>
#include <QString>

// What the formatter takes from its surroundings: the current time and the folder of
// translation catalogues. Production code reads the clock and "/usr/share/translations/";
// tests fix both.
namespace FormatterSeams {

// The current moment and today's date; cheaper than a local QDateTime, which costs a
// time-zone conversion to build.
qint64 currentMSecsSinceEpoch();
QDate currentDate();
QString translationsDirectory();

// An invalid date-time, or an empty folder, restores the real one.
void setCurrentDateTimeForTesting(const QDateTime &now);
void setTranslationsDirectoryForTesting(const QString &directory);

} // namespace FormatterSeams
