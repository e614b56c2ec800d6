#include <QCoreApplication>
#include <QQmlEngine>
#include <QTranslator>
#include <QQuickWindow>
#include <QtQuickTest>
#include <qpa/qwindowsysteminterface.h>

// What QML tests cannot do by themselves: the system taking a touch away.
class TouchSystem : public QObject
{
    Q_OBJECT

public:
    Q_INVOKABLE void cancel(QQuickWindow *window)
    {
        static QTouchDevice *device = QTest::createTouchDevice();
        QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(window, device);
    }
};

class Setup : public QObject
{
    Q_OBJECT

public Q_SLOTS:
    void qmlEngineAvailable(QQmlEngine *engine)
    {
        // The components' words, from the catalogue of the build tree (an installed
        // application reads the installed one).
        auto catalogue = new QTranslator(engine);
        if (catalogue->load(QStringLiteral("quorvanepelkan-qt5_eng_en"), QStringLiteral(CATALOGUE_DIR)))
            QCoreApplication::installTranslator(catalogue);
        qmlRegisterSingletonType<TouchSystem>("PelkanTest", 1, 0, "TouchSystem",
                                              [](QQmlEngine *, QJSEngine *) -> QObject * { return new TouchSystem; });
    }
};

// Runs every tst_*.qml file in this folder against the modules of the build tree.
QUICK_TEST_MAIN_WITH_SETUP(pelkan, Setup)

#include "tst_qml.moc"
