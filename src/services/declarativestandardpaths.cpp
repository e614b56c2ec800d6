#include "declarativestandardpaths.h"

#include <QStandardPaths>

namespace {

QString location(QStandardPaths::StandardLocation type)
{
    return QStandardPaths::writableLocation(type);
}

} // namespace

DeclarativeStandardPaths::DeclarativeStandardPaths(QObject *parent)
    : QObject(parent)
{
}

QString DeclarativeStandardPaths::home() const { return location(QStandardPaths::HomeLocation); }
QString DeclarativeStandardPaths::documents() const { return location(QStandardPaths::DocumentsLocation); }
QString DeclarativeStandardPaths::download() const { return location(QStandardPaths::DownloadLocation); }
QString DeclarativeStandardPaths::music() const { return location(QStandardPaths::MusicLocation); }
QString DeclarativeStandardPaths::pictures() const { return location(QStandardPaths::PicturesLocation); }
QString DeclarativeStandardPaths::videos() const { return location(QStandardPaths::MoviesLocation); }
QString DeclarativeStandardPaths::data() const { return location(QStandardPaths::AppDataLocation); }
QString DeclarativeStandardPaths::cache() const { return location(QStandardPaths::CacheLocation); }
QString DeclarativeStandardPaths::genericData() const { return location(QStandardPaths::GenericDataLocation); }
QString DeclarativeStandardPaths::temporary() const { return location(QStandardPaths::TempLocation); }
