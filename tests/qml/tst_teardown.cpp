#include "../common/sceneview.h"

#include <QQuickView>
#include <QtTest>

// A page holding a component leaves the stack (animated, as Back does) and is destroyed
// without a word from the component's own files.
namespace {
QStringList s_warnings;
void collect(QtMsgType type, const QMessageLogContext &, const QString &text)
{
    if (type != QtDebugMsg && type != QtInfoMsg && text.contains(QLatin1String("Quorvane/Pelkan/")))
        s_warnings << text;
}
} // namespace

class tst_Teardown : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void poppedPageIsQuiet_data();
    void poppedPageIsQuiet();
};

void tst_Teardown::poppedPageIsQuiet_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::newRow("TabView") << QByteArray("TabView { anchors.fill: parent; model: ['a', 'b']; delegate: Item {} }");
    QTest::newRow("SlideshowView") << QByteArray("SlideshowView { model: 3; delegate: Item {} }");
    QTest::newRow("fields") << QByteArray("Column { width: parent.width\n"
                                          "  TextField { label: 'x'; text: 'a text longer than the field is wide, so that it scrolls' }\n"
                                          "  SearchField {} TextArea { label: 'y' } PasswordField {} }");
}

void tst_Teardown::poppedPageIsQuiet()
{
    QFETCH(QByteArray, content);
    QQuickView view;
    QQuickItem *root = showScene(view, "import QtQuick 2.6\nimport Quorvane.Pelkan 1.0\n"
                                       "ApplicationWindow { width: 400; height: 600; initialPage: Component { Page {} }\n"
                                       "  property Item pushed\n"
                                       "  Component { id: page; Page {\n" + content + "\n} }\n"
                                       "  function push() { pushed = pageStack.push(page) }\n"
                                       "  function pop() { pageStack.pop() }\n"
                                       "}\n");
    QVERIFY(root);
    auto stack = root->property("pageStack").value<QObject *>();
    s_warnings.clear();
    const QtMessageHandler previous = qInstallMessageHandler(collect);
    for (int i = 0; i < 3; ++i) {
        QMetaObject::invokeMethod(root, "push");
        QPointer<QObject> page = root->property("pushed").value<QObject *>();
        QTRY_VERIFY(!stack->property("busy").toBool());
        QMetaObject::invokeMethod(root, "pop");
        QTRY_VERIFY(!page);
    }
    qInstallMessageHandler(previous);
    QVERIFY2(s_warnings.isEmpty(), qPrintable(s_warnings.join(QLatin1Char('\n'))));
}

QTEST_MAIN(tst_Teardown)
#include "tst_teardown.moc"
