#pragma once

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickView>
#include <QTest>
#include <QTextStream>

// Shows a QML document (its root an Item) in the view, against the build tree's modules,
// and waits until it is on screen; null, with the errors on stderr, when it cannot.
inline QQuickItem *showDocument(QQuickView &view, const QByteArray &document, const QString &importPath)
{
    view.engine()->addImportPath(importPath);
    QQmlComponent component(view.engine());
    component.setData(document, QUrl());
    auto root = qobject_cast<QQuickItem *>(component.create());
    if (!root) {
        QTextStream(stderr) << component.errorString();
        return nullptr;
    }
    view.setContent(QUrl(), nullptr, root);
    view.show();
    return QTest::qWaitForWindowExposed(&view) ? root : nullptr;
}
