#include "../common/sceneview.h"

#include <QQmlExpression>

// What the page stack prints, every message counted (also those no ignoreMessage() could
// name in advance): nothing when a page goes, whatever it holds and however it goes; one
// warning naming what was given when a call is refused, the stack left as it was.

namespace {

QStringList *collected = nullptr;

void collect(QtMsgType type, const QMessageLogContext &, const QString &text)
{
    if (collected && type != QtDebugMsg && type != QtInfoMsg)
        collected->append(text);
}

// A page as applications write them: a form, tabs, a slideshow and a 40-row list of the
// toolkit's own components, and content that reads its parent.
const QByteArray Document = R"(
import QtQuick 2.6
import Quorvane.Pelkan 1.0
ApplicationWindow {
    width: 540; height: 960
    initialPage: Component { Page {} }
    property Component page: Component {
        Page {
            Column {
                id: form
                anchors { left: parent.left; right: parent.right }
                TextField { width: parent.width; label: "Name"; text: "a text longer than the field is wide, so that it scrolls" }
                SearchField {} TextArea { label: "Notes" } PasswordField {}
                TextSwitch { text: "Switch" }
                Slider { width: parent.width; label: "Volume"; maximumValue: 10 }
                ComboBox { width: parent.width; label: "Colour"; model: ["Red", "Green"] }
                Button { text: "Go" }
            }
            TabView {
                id: tabs
                anchors { top: form.bottom; left: parent.left; right: parent.right }
                height: 200
                model: ["One", "Two"]
                delegate: Item { Label { anchors.centerIn: parent; text: modelData } }
            }
            SlideshowView { anchors.fill: tabs; model: 3; delegate: Item {} }
            ListView {
                anchors { top: tabs.bottom; left: parent.left; right: parent.right }
                height: 40 * Theme.itemSizeSmall
                model: 40
                delegate: ListItem { Label { anchors.left: parent.left; text: "Row " + index } }
            }
        }
    }
}
)";

} // namespace

class tst_PageStackMessages : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void messages_data()
    {
        QTest::addColumn<QString>("show"); // run, then the frame is drawn
        QTest::addColumn<QString>("hide"); // run, then the stack settles and deletes what went
        QTest::addColumn<int>("cycles");
        QTest::addColumn<QString>("expected"); // the one message a cycle prints, or none

        const QString push = QStringLiteral("pageStack.push(page, {}, PageStackAction.Immediate)");
        QTest::newRow("pop, immediate") << push << "pageStack.pop(PageStackAction.Immediate)" << 360 << "";
        QTest::newRow("pop, animated") << "pageStack.push(page)" << "pageStack.pop()" << 3 << "";
        QTest::newRow("popped with the one below, while sliding")
                << push + ";" + push << "pageStack.pop(); pageStack.pop()" << 3 << "";
        QTest::newRow("popped past it")
                << push + ";" + push << "var bottom; pageStack.find(function(p) { bottom = p; return false }); pageStack.pop(bottom)"
                << 3 << "";
        QTest::newRow("replaced") << push << "pageStack.replace(page); pageStack.pop(PageStackAction.Immediate)" << 3 << "";
        QTest::newRow("attached, then replaced") << "pageStack.pushAttached(page)" << "pageStack.pushAttached(page)" << 3 << "";

        QTest::newRow("push(42)") << "pageStack.push(42)" << "" << 1 << "PageStack.push: cannot take 42:";
        QTest::newRow("push({a: 1})") << "pageStack.push({a: 1})" << "" << 1 << "PageStack.push: cannot take {\"a\":1}:";
        QTest::newRow("push(null)") << "pageStack.push(null)" << "" << 1 << "PageStack.push: cannot take null:";
        QTest::newRow("push(undefined)") << "pageStack.push(undefined)" << "" << 1 << "PageStack.push: cannot take undefined:";
        QTest::newRow("replace(\"\")") << "pageStack.replace(\"\")" << "" << 1 << "PageStack.replace: cannot take \"\":";
        QTest::newRow("pushAttached(true)") << "pageStack.pushAttached(true)" << "" << 1 << "PageStack.pushAttached: cannot take true:";
        QTest::newRow("push(the current page)") << "pageStack.push(pageStack.currentPage)" << "" << 1 << "is on the stack already";
    }

    void messages()
    {
        QFETCH(QString, show);
        QFETCH(QString, hide);
        QFETCH(int, cycles);
        QFETCH(QString, expected);

        QQuickView view;
        QQuickItem *root = showScene(view, Document);
        QVERIFY(root);
        QObject *stack = root->property("pageStack").value<QObject *>();
        QTRY_COMPARE(stack->property("depth").toInt(), 1);
        auto run = [&](const QString &code) {
            if (code.isEmpty())
                return;
            QQmlExpression expression(qmlContext(root), root, code);
            expression.evaluate();
            QVERIFY2(!expression.hasError(), qPrintable(expression.error().toString()));
        };
        const QVariant top = stack->property("currentPage");

        QStringList messages;
        collected = &messages;
        const QtMessageHandler previous = qInstallMessageHandler(collect);
        for (int i = 0; i < cycles; ++i) {
            run(show);
            QTRY_VERIFY(!stack->property("busy").toBool());
            view.grabWindow(); // the page is laid out and drawn, its rows made
            run(hide);
            QTRY_VERIFY(!stack->property("busy").toBool());
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
            QCOMPARE(stack->property("depth").toInt(), 1);
        }
        qInstallMessageHandler(previous);
        collected = nullptr;

        if (expected.isEmpty()) {
            // Counted by where they come from, to name the culprits.
            QMap<QString, int> counts;
            for (const QString &message : qAsConst(messages))
                ++counts[message.left(160)];
            QStringList lines;
            for (auto it = counts.cbegin(); it != counts.cend(); ++it)
                lines << QStringLiteral("%1 x %2").arg(it.value()).arg(it.key());
            if (!messages.isEmpty())
                qWarning().noquote() << lines.join(QLatin1Char('\n'));
            QVERIFY2(messages.isEmpty(), "a page that went printed the messages above");
        } else {
            QCOMPARE(messages.size(), 1);
            QVERIFY2(messages.first().contains(expected), qPrintable(messages.first()));
            QCOMPARE(stack->property("currentPage"), top);
        }
    }
};

QTEST_MAIN(tst_PageStackMessages)
#include "tst_pagestackmessages.moc"
