#include "text/declarativepreedittext.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QtTest>

// The pre-edit as a real input context makes it: the test plugin sends input-method events.
class tst_DeclarativePreeditText : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        QQmlComponent component(&m_engine);
        component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n"
                          "TextInput { width: 200; height: 40; text: 'hello'\n"
                          "  property alias preedit: preedit\n"
                          "  PreeditText { id: preedit } }\n", QUrl());
        m_field = qobject_cast<QQuickItem *>(component.create());
        QVERIFY2(m_field, qPrintable(component.errorString()));
        m_preedit = m_field->property("preedit").value<DeclarativePreeditText *>();
        m_window.reset(new QQuickWindow);
        m_field->setParentItem(m_window->contentItem());
        m_field->setParent(m_window.data()); // owned by the window, gone with it
        m_window->show();
        m_window->requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(m_window.data()));
        m_context = DeclarativePreeditText::platformInputContext();
        QVERIFY2(m_context && m_context->metaObject()->indexOfMethod("compose(QString)") >= 0,
                 "the test input context is not loaded");
        m_field->forceActiveFocus();
        QTRY_VERIFY(m_field->hasActiveFocus());
        m_field->setProperty("cursorPosition", 3);
    }

    void cleanup() { m_window.reset(); }

    void composingInsertsAtTheCursor()
    {
        QSignalSpy changed(m_preedit, &DeclarativePreeditText::textChanged);
        QCOMPARE(m_preedit->text(), QStringLiteral("hello"));
        QMetaObject::invokeMethod(m_context, "compose", Q_ARG(QString, QStringLiteral("ab")));
        QVERIFY(m_field->property("inputMethodComposing").toBool());
        QCOMPARE(m_field->property("text").toString(), QStringLiteral("hello"));
        // "ab" inserted before the fourth character of "hello".
        QCOMPARE(m_preedit->text(), QStringLiteral("helablo"));
        QVERIFY(changed.count() > 0);

        // Focus gone: the keyboard's pre-edit no longer reaches this object.
        m_field->setFocus(false);
        changed.clear();
        QMetaObject::invokeMethod(m_context, "compose", Q_ARG(QString, QStringLiteral("x")));
        QCOMPARE(changed.count(), 0);
    }

    void writing_data()
    {
        QTest::addColumn<bool>("same");
        QTest::newRow("other text: the composition is committed first") << false;
        QTest::newRow("the same text: the composition goes on") << true;
    }

    void writing()
    {
        QFETCH(bool, same);
        QMetaObject::invokeMethod(m_context, "compose", Q_ARG(QString, QStringLiteral("ab")));
        const QString text = same ? m_preedit->text() : QStringLiteral("replaced");
        m_preedit->setText(text);
        QCOMPARE(m_context->property("preedit").toString(), same ? QStringLiteral("ab") : QString());
        QCOMPARE(m_field->property("inputMethodComposing").toBool(), same);
        QCOMPARE(m_field->property("text").toString(), same ? QStringLiteral("hello") : text);
        QCOMPARE(m_preedit->text(), text);
    }

    void withoutEditor()
    {
        DeclarativePreeditText loose;
        QTest::ignoreMessage(QtInfoMsg, QRegularExpression(QStringLiteral("setting text property without target editor")));
        loose.setText(QStringLiteral("x"));
        QCOMPARE(loose.text(), QString());
    }

    void parentThatIsNoEditor_data()
    {
        QTest::addColumn<QByteArray>("parent");
        QTest::addColumn<QString>("text");
        QTest::newRow("an item without text") << QByteArray("Item {") << QString();
        QTest::newRow("an object with text but no focus") << QByteArray("QtObject { property string text: 'abc';") << "abc";
    }

    // Placed where there is no editor, it reads what it can and says nothing.
    void parentThatIsNoEditor()
    {
        QFETCH(QByteArray, parent);
        QFETCH(QString, text);
        static int messages;
        messages = 0;
        QtMessageHandler previous = qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &, const QString &) {
            if (type != QtDebugMsg)
                ++messages;
        });
        QQmlComponent component(&m_engine);
        component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan.private 1.0\n" + parent
                                  + " property PreeditText preedit: PreeditText {} }\n", QUrl());
        QScopedPointer<QObject> object(component.create());
        qInstallMessageHandler(previous);
        QVERIFY2(object, qPrintable(component.errorString()));
        QCOMPARE(messages, 0);
        QCOMPARE(object->property("preedit").value<DeclarativePreeditText *>()->text(), text);
    }

private:
    QQmlEngine m_engine;
    QScopedPointer<QQuickWindow> m_window;
    QQuickItem *m_field = nullptr;
    DeclarativePreeditText *m_preedit = nullptr;
    QObject *m_context = nullptr;
};

QTEST_MAIN(tst_DeclarativePreeditText)
#include "tst_declarativepreedittext.moc"
