#pragma once

#include <QQmlComponent>
#include <QQuickItem>
#include <QQuickView>
#include <QtTest>

// Shows a QML document (its root an Item) in a view, sized to the root, and waits until
// it is on screen; null, with the errors on the log, when it cannot.
inline QQuickItem *showScene(QQuickView &view, const QByteArray &document)
{
    QQmlComponent component(view.engine());
    component.setData(document, QUrl());
    auto root = qobject_cast<QQuickItem *>(component.create());
    if (!root) {
        qWarning().noquote() << component.errorString();
        return nullptr;
    }
    view.setContent(QUrl(), nullptr, root);
    view.resize(int(root->width()), int(root->height()));
    view.show();
    return QTest::qWaitForWindowExposed(&view) ? root : nullptr;
}
