#include <QClipboard>
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QtTest>

// The clipboard singleton as QML sees it, through the installed module.
class tst_Clipboard : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void clipboard()
    {
        QGuiApplication::clipboard()->clear();
        QObject *clipboard = singleton("Clipboard");
        QVERIFY(clipboard);
        QTRY_VERIFY(!clipboard->property("hasText").toBool());
        QSignalSpy text(clipboard, SIGNAL(textChanged()));
        QSignalSpy hasText(clipboard, SIGNAL(hasTextChanged()));

        // Another writer is seen.
        QGuiApplication::clipboard()->setText(QStringLiteral("copied"));
        QTRY_COMPARE(clipboard->property("text").toString(), QStringLiteral("copied"));
        QVERIFY(clipboard->property("hasText").toBool());
        QCOMPARE(text.count(), 1);
        QCOMPARE(hasText.count(), 1);

        // Writing from QML reaches the system clipboard.
        QVERIFY(clipboard->setProperty("text", QStringLiteral("pasted")));
        QTRY_COMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("pasted"));
        QTRY_COMPARE(text.count(), 2);
        QCOMPARE(hasText.count(), 1);

        QVERIFY(clipboard->setProperty("text", QString()));
        QTRY_VERIFY(!clipboard->property("hasText").toBool());
        QCOMPARE(hasText.count(), 2);
    }
private:
    QObject *singleton(const char *name);
    QQmlEngine m_engine;
};

QObject *tst_Clipboard::singleton(const char *name)
{
    QQmlComponent component(&m_engine);
    component.setData(QByteArray("import QtQml 2.2\nimport Quorvane.Pelkan 1.0\nQtObject { property QtObject it: ") + name
                              + " }\n", QUrl());
    QObject *root = component.create();
    if (!root) {
        qWarning() << component.errorString();
        return nullptr;
    }
    root->setParent(&m_engine);
    return root->property("it").value<QObject *>();
}

QTEST_MAIN(tst_Clipboard)
#include "tst_clipboard.moc"
