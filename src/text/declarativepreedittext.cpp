#include "declarativepreedittext.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QQmlInfo>
#include <private/qguiapplication_p.h>
#include <qpa/qplatforminputcontext.h>
#include <qpa/qplatformintegration.h>

DeclarativePreeditText::DeclarativePreeditText(QObject *parent)
    : QObject(parent)
{
}

QObject *DeclarativePreeditText::platformInputContext()
{
    QPlatformIntegration *integration = QGuiApplicationPrivate::platformIntegration();
    return integration ? integration->inputContext() : nullptr;
}

void DeclarativePreeditText::componentComplete()
{
    if (parent())
        setEditor(parent());
}

void DeclarativePreeditText::setEditor(QObject *editor)
{
    if (m_editor)
        disconnect(m_editor, nullptr, this, nullptr);
    m_editor = editor;
    if (!editor)
        return;
    // Any object may be the parent; only what it has is followed, silently.
    const QMetaObject *meta = editor->metaObject();
    if (meta->indexOfSignal("activeFocusChanged(bool)") >= 0)
        connect(editor, SIGNAL(activeFocusChanged(bool)), this, SLOT(handleFocusChanged(bool)));
    if (meta->indexOfSignal("textChanged()") >= 0)
        connect(editor, SIGNAL(textChanged()), this, SIGNAL(textChanged()));
}

void DeclarativePreeditText::handleFocusChanged(bool focus)
{
    QObject *context = platformInputContext();
    if (!context)
        return;
    if (m_editor && focus) {
        if (context->metaObject()->indexOfSignal("preeditChanged()") >= 0)
            connect(context, SIGNAL(preeditChanged()), this, SIGNAL(textChanged()), Qt::UniqueConnection);
    } else {
        disconnect(context, nullptr, this, nullptr);
    }
}

QString DeclarativePreeditText::text() const
{
    if (!m_editor)
        return QString();
    QString text = m_editor->property("text").toString();
    if (m_editor->property("inputMethodComposing").toBool()) {
        const int position = m_editor->property("cursorPosition").toInt();
        const QObject *context = platformInputContext();
        const QString preedit = context ? context->property("preedit").toString() : QString();
        text.insert(qBound(0, position, text.size()), preedit);
    }
    return text;
}

void DeclarativePreeditText::setText(const QString &text)
{
    if (!m_editor) {
        qmlInfo(this) << "setting text property without target editor";
        return;
    }
    if (text == this->text())
        return;
    QGuiApplication::inputMethod()->commit();
    m_editor->setProperty("text", text);
}
