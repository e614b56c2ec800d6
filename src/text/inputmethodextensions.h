#pragma once

#include <QString>
#include <QVariant>

class QObject;

// The per-field hints a text editor carries for the on-screen keyboard: a QVariantMap in
// the editor's dynamic property "__inputMethodExtensions", which the keyboard reads
// through the input method's platform data.
namespace InputMethodExtensions {

// The text editor of a field: a descendant named "textEditor"; the object itself when its
// class is a TextInput or TextEdit; else the first such descendant item; else null.
QObject *findEditor(QObject *field);

QVariant value(const QObject *editor, const QString &key);
// Stores the value in the editor's map; when the editor has active focus the keyboard is
// told to read the map again.
void setValue(QObject *editor, const QString &key, const QVariant &value);

} // namespace InputMethodExtensions
