#pragma once

#include <QString>
#include <QVector>

// The cover-action text an application publishes on its window: four lines per action
// (bus name, method, index, icon) and a closing line that says whether the icons want a
// background ("1" or "0").
struct CoverActionPayload
{
    struct Action {
        QString service;
        QString method;
        int index = -1;
        QString icon;
    };

    QVector<Action> actions;
    bool iconBackground = false;
    // Empty when the text was understood; otherwise what was wrong with it.
    QString error;

    static CoverActionPayload parse(const QString &text);
    // The object path a bus name exports its actions at.
    static QString objectPath(const QString &service);
};
