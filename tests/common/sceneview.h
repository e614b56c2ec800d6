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

// A pixel and the colour expected there.
struct Probe {
    QPoint at;
    QRgb expected;
};

// Waits until the view shows every probe's colour, within tolerance in each channel; what
// differed last, or nothing.
inline QString pixelsDiffer(QQuickView &view, const QVector<Probe> &probes, int tolerance)
{
    QString failure;
    (void)QTest::qWaitFor([&] {
        const QImage image = view.grabWindow();
        failure.clear();
        for (const Probe &p : probes) {
            const QRgb seen = image.pixel(p.at);
            if (qAbs(qRed(seen) - qRed(p.expected)) > tolerance || qAbs(qGreen(seen) - qGreen(p.expected)) > tolerance
                    || qAbs(qBlue(seen) - qBlue(p.expected)) > tolerance) {
                failure = QStringLiteral("at (%1, %2): %3, expected %4").arg(p.at.x()).arg(p.at.y())
                                  .arg(QColor(seen).name(), QColor(p.expected).name());
                return false;
            }
        }
        return true;
    }, 5000);
    return failure;
}
