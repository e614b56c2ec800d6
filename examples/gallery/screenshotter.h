#pragma once

#include <QObject>
#include <QString>

class QQuickWindow;

// Saves a window's content to a PNG once it has rendered a few frames, then quits the
// application: how the gallery shows itself where there is no screen to look at.
class Screenshotter : public QObject
{
    Q_OBJECT

public:
    Screenshotter(QQuickWindow *window, const QString &path, QObject *parent = nullptr);

private:
    void frameSwapped();
    void fail(const QString &why);

    QQuickWindow *m_window;
    QString m_path;
    int m_frames = 0;
};
