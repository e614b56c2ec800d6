#include "text/declarativeenterkey.h"
#include "text/declarativepreedittext.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QtTest>

// The Enter key and the pre-edit against a real input context: the test plugin composes
// what a test asks for and counts the updates the application asks of it.
class tst_InputMethod : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { m_window.reset(); }

    void valuesLiveOnTheEditor_data()
    {
        QTest::addColumn<QByteArray>("document");
        QTest::newRow("on the text input") << QByteArray("Item { TextInput { id: field; objectName: 'field' } }");
        QTest::newRow("field with a textEditor") << QByteArray("Item { objectName: 'field'; Item { TextEdit { objectName: 'textEditor' } } }");
        QTest::newRow("no editor: nothing is stored, every write is a change") << QByteArray("Item { objectName: 'field' }");
    }

    void valuesLiveOnTheEditor()
    {
        QFETCH(QByteArray, document);
        QQuickItem *root = load(document);
        QVERIFY(root);
        QObject *field = root->objectName() == QLatin1String("field") ? root : root->findChild<QObject *>(QStringLiteral("field"));
        QVERIFY(field);
        const bool stored = !QByteArray(QTest::currentDataTag()).startsWith("no editor");
        for (int i = 0; !stored && i < 2; ++i)
            QTest::ignoreMessage(QtWarningMsg, "EnterKey used on non-text-component, might not function properly");
        auto first = new DeclarativeEnterKey(field);
        auto second = new DeclarativeEnterKey(field);
        QCOMPARE(bool(first->editor()), stored);
        QSignalSpy text(first, &DeclarativeEnterKey::textChanged);
        QSignalSpy icon(first, &DeclarativeEnterKey::iconSourceChanged);
        QSignalSpy enabled(first, &DeclarativeEnterKey::enabledChanged);

        first->setText(QStringLiteral("Search"));
        first->setText(QStringLiteral("Search"));
        first->setIconSource(QUrl(QStringLiteral("image://theme/icon-m-search")));
        first->setHighlighted(true);
        first->setEnabled(false);
        QCOMPARE(text.count(), stored ? 1 : 2);
        QCOMPARE(icon.count(), 1);
        QCOMPARE(enabled.count(), 0); // enabled does not announce its change
        if (!stored) {
            QCOMPARE(second->text(), QString());
            QVERIFY(second->enabled());
            return;
        }
        QCOMPARE(second->text(), QStringLiteral("Search"));
        QCOMPARE(second->iconSource(), QUrl(QStringLiteral("image://theme/icon-m-search")));
        QVERIFY(second->highlighted());
        QVERIFY(!second->enabled());

        const QVariantMap map = first->editor()->property("__inputMethodExtensions").toMap();
        QCOMPARE(map.value(QStringLiteral("enterKeyText")), QVariant(QStringLiteral("Search")));
        QCOMPARE(map.value(QStringLiteral("enterKeyEnabled")), QVariant(false));
        QCOMPARE(map.value(QStringLiteral("enterKeyHighlighted")), QVariant(true));
    }

    void returnReleaseClicks_data()
    {
        QTest::addColumn<bool>("enabled");
        QTest::addColumn<int>("key");
        QTest::addColumn<int>("clicks");
        QTest::newRow("return") << true << int(Qt::Key_Return) << 1;
        QTest::newRow("enter") << true << int(Qt::Key_Enter) << 1;
        QTest::newRow("other key") << true << int(Qt::Key_A) << 0;
        QTest::newRow("disabled") << false << int(Qt::Key_Return) << 0;
    }

    void returnReleaseClicks()
    {
        QFETCH(bool, enabled);
        QFETCH(int, key);
        QFETCH(int, clicks);
        QQuickItem *root = load("Item { property alias field: field\n"
                                "  TextInput { id: field; width: 200; height: 40; focus: true; property int accepts: 0\n"
                                "    onAccepted: accepts++ } }");
        QVERIFY(root);
        auto field = root->property("field").value<QQuickItem *>();
        field->forceActiveFocus();
        QTRY_VERIFY(field->hasActiveFocus());
        auto enterKey = new DeclarativeEnterKey(field);
        enterKey->setEnabled(enabled);
        QSignalSpy clicked(enterKey, &DeclarativeEnterKey::clicked);
        QTest::keyClick(m_window.data(), Qt::Key(key));
        QCOMPARE(clicked.count(), clicks);
        // The editor got the key all the same.
        if (key != Qt::Key_A)
            QCOMPARE(field->property("accepts").toInt(), 1);

        // Gone with its object: the filter no longer runs.
        delete enterKey;
        QTest::keyClick(m_window.data(), Qt::Key_Return);
    }

    void focusedFieldUpdatesTheKeyboard()
    {
        QQuickItem *root = load("Item { property alias field: field; property alias other: other\n"
                                "  TextInput { id: field; width: 100; height: 40 }\n"
                                "  TextInput { id: other; y: 50; width: 100; height: 40 } }");
        QVERIFY(root);
        QObject *context = DeclarativePreeditText::platformInputContext();
        QVERIFY2(context && context->metaObject()->indexOfProperty("platformDataUpdates") >= 0,
                 "the test input context is not loaded");
        auto field = root->property("field").value<QQuickItem *>();
        auto other = root->property("other").value<QQuickItem *>();
        DeclarativeEnterKey key(field);

        other->forceActiveFocus();
        QTRY_VERIFY(other->hasActiveFocus());
        int updates = context->property("platformDataUpdates").toInt();
        key.setText(QStringLiteral("Next"));
        QCOMPARE(context->property("platformDataUpdates").toInt(), updates);

        field->forceActiveFocus();
        QTRY_VERIFY(field->hasActiveFocus());
        updates = context->property("platformDataUpdates").toInt();
        key.setText(QStringLiteral("Done"));
        QVERIFY(context->property("platformDataUpdates").toInt() > updates);
    }

    // Imported after QtQuick 2.6, which has an EnterKey of its own: text and type bind in one
    // group, and the type reaches the keyboard through QtQuick's attached object.
    void oneGroupServesQtQuicksToo()
    {
        QQuickItem *root = load("TextInput { EnterKey.text: 'Go'; EnterKey.type: Qt.EnterKeySend }");
        QVERIFY(root);
        QCOMPARE(root->inputMethodQuery(Qt::ImEnterKeyType).toInt(), int(Qt::EnterKeySend));
        QCOMPARE(root->property("__inputMethodExtensions").toMap().value(QStringLiteral("enterKeyText")), QVariant(QStringLiteral("Go")));
        auto key = qobject_cast<DeclarativeEnterKey *>(qmlAttachedPropertiesObject<DeclarativeEnterKey>(root, false));
        QVERIFY(key);
        QSignalSpy changed(key, &DeclarativeEnterKey::typeChanged);
        key->setType(Qt::EnterKeyDone);
        key->setType(Qt::EnterKeyDone);
        QCOMPARE(root->inputMethodQuery(Qt::ImEnterKeyType).toInt(), int(Qt::EnterKeyDone));
        QCOMPARE(changed.count(), 1);
    }

    void composingInsertsAtTheCursor()
    {
        QVERIFY(startEditing());
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
        QVERIFY(startEditing());
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
    QQuickItem *load(const QByteArray &body);
    // A focused field holding "hello", the cursor after its third character, with a pre-edit.
    bool startEditing()
    {
        m_field = load("TextInput { width: 200; height: 40; text: 'hello'\n"
                       "  property alias preedit: preedit\n"
                       "  Private.PreeditText { id: preedit } }");
        m_context = DeclarativePreeditText::platformInputContext();
        if (!m_field || !m_context || m_context->metaObject()->indexOfMethod("compose(QString)") < 0)
            return false;
        m_preedit = m_field->property("preedit").value<DeclarativePreeditText *>();
        m_field->forceActiveFocus();
        m_field->setProperty("cursorPosition", 3);
        return QTest::qWaitFor([this] { return m_field->hasActiveFocus(); });
    }

    QQmlEngine m_engine;
    QScopedPointer<QQuickWindow> m_window;
    QQuickItem *m_field = nullptr;
    DeclarativePreeditText *m_preedit = nullptr;
    QObject *m_context = nullptr;
};

QQuickItem *tst_InputMethod::load(const QByteArray &body)
{
    QQmlComponent component(&m_engine);
    component.setData("import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\nimport Quorvane.Pelkan.private 1.0 as Private\n" + body, QUrl());
    auto root = qobject_cast<QQuickItem *>(component.create());
    if (!root) {
        qWarning() << component.errorString();
        return nullptr;
    }
    m_window.reset(new QQuickWindow);
    root->setParentItem(m_window->contentItem());
    root->setParent(m_window.data()); // owned by the window, gone with it
    m_window->resize(300, 200);
    m_window->show();
    m_window->requestActivate();
    if (!QTest::qWaitForWindowActive(m_window.data()))
        return nullptr;
    return root;
}

QTEST_MAIN(tst_InputMethod)
#include "tst_inputmethod.moc"
