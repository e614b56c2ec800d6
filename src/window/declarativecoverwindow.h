#pragma once

#include <QPointer>
#include <QQuickWindow>

class DeclarativeCover;

// The window the cover is rendered in. It publishes the window properties that let the
// compositor pair it with the application window, and it is shown while the application
// window reports its cover as visible.
class DeclarativeCoverWindow : public QQuickWindow
{
    Q_OBJECT
    Q_PROPERTY(DeclarativeCover *cover READ cover WRITE setCover NOTIFY coverChanged)
    Q_PROPERTY(QObject *mainWindow READ mainWindow WRITE setMainWindow NOTIFY mainWindowChanged)
    Q_PROPERTY(QString windowReference READ windowReference NOTIFY windowReferenceChanged)

public:
    explicit DeclarativeCoverWindow(QWindow *parent = nullptr);
    ~DeclarativeCoverWindow() override;

    DeclarativeCover *cover() const;
    void setCover(DeclarativeCover *cover);
    QObject *mainWindow() const { return m_mainWindow; }
    void setMainWindow(QObject *window);

    // "__winref:" and the window's native id in decimal; empty for no window.
    static QString referenceTo(QWindow *window);
    QString windowReference() const { return referenceTo(handle() ? const_cast<DeclarativeCoverWindow *>(this) : nullptr); }

public Q_SLOTS:
    void setContentSize(float w, float h);
    void coverDestroyed();
    void updateCoverVisibility(bool visible);
    void publishWindowProperties();

Q_SIGNALS:
    void coverChanged();
    void mainWindowChanged();
    void windowReferenceChanged();

protected:
    void exposeEvent(QExposeEvent *event) override;

private:
    QPointer<DeclarativeCover> m_cover;
    QPointer<QObject> m_mainWindow;
    // The application asked for the cover to be shown; it has been exposed since.
    bool m_visibilityRequested = false;
    bool m_exposedOnce = false;
};
