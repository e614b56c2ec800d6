#pragma once

#include <QObject>
#include <QString>

// Where things go on the device, for QML: StandardPaths.pictures + "/shot.png". Folders
// that have no place on the device are empty texts.
class DeclarativeStandardPaths : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString home READ home CONSTANT)
    Q_PROPERTY(QString documents READ documents CONSTANT)
    Q_PROPERTY(QString download READ download CONSTANT)
    Q_PROPERTY(QString music READ music CONSTANT)
    Q_PROPERTY(QString pictures READ pictures CONSTANT)
    Q_PROPERTY(QString videos READ videos CONSTANT)
    Q_PROPERTY(QString data READ data CONSTANT)
    Q_PROPERTY(QString cache READ cache CONSTANT)
    Q_PROPERTY(QString genericData READ genericData CONSTANT)
    Q_PROPERTY(QString temporary READ temporary CONSTANT)

public:
    explicit DeclarativeStandardPaths(QObject *parent = nullptr);

    QString home() const;
    QString documents() const;
    QString download() const;
    QString music() const;
    QString pictures() const;
    QString videos() const;
    // The application's own folders (named after the organisation and application).
    QString data() const;
    QString cache() const;
    QString genericData() const;
    QString temporary() const;
};
