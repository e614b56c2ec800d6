#include "inputmethodextensions.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QQuickItem>
#include <QVariantMap>

#include <cstring>

namespace {

const char PropertyName[] = "__inputMethodExtensions";

bool isTextEditorClass(const QObject *object)
{
    const char *name = object->metaObject()->className();
    return std::strstr(name, "TextInput") || std::strstr(name, "TextEdit");
}

} // namespace

namespace InputMethodExtensions {

QObject *findEditor(QObject *field)
{
    if (!field)
        return nullptr;
    if (QObject *named = field->findChild<QObject *>(QStringLiteral("textEditor")))
        return named;
    if (isTextEditorClass(field))
        return field;
    const QList<QQuickItem *> items = field->findChildren<QQuickItem *>();
    for (QQuickItem *item : items) {
        if (isTextEditorClass(item))
            return item;
    }
    return nullptr;
}

QVariant value(const QObject *editor, const QString &key)
{
    return editor ? editor->property(PropertyName).toMap().value(key) : QVariant();
}

void setValue(QObject *editor, const QString &key, const QVariant &value)
{
    if (!editor)
        return;
    QVariantMap map = editor->property(PropertyName).toMap();
    map.insert(key, value);
    editor->setProperty(PropertyName, map);
    if (editor->property("activeFocus").toBool())
        QGuiApplication::inputMethod()->update(Qt::ImPlatformData);
}

} // namespace InputMethodExtensions
