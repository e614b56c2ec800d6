#include "declarativeenterkey.h"
#include "text/inputmethodextensions.h"

#include <QKeyEvent>
#include <QMetaType>
#include <qqml.h>

namespace {
const QString IconKey = QStringLiteral("enterKeyIconSource");
const QString TextKey = QStringLiteral("enterKeyText");
const QString EnabledKey = QStringLiteral("enterKeyEnabled");
const QString HighlightedKey = QStringLiteral("enterKeyHighlighted");
} // namespace

DeclarativeEnterKey::DeclarativeEnterKey(QObject *parent)
    : QObject(parent)
    , m_editor(InputMethodExtensions::findEditor(parent))
{
    if (!m_editor) {
        qWarning("EnterKey used on non-text-component, might not function properly");
        return;
    }
    // The editor is not owned; forget it when it goes.
    m_editorGone = connect(m_editor, &QObject::destroyed, this, [this] { m_editor = nullptr; });
    updateKeyFilter();
}

DeclarativeEnterKey::~DeclarativeEnterKey()
{
    if (m_editor) {
        m_editor->removeEventFilter(this);
        disconnect(m_editorGone);
    }
}

DeclarativeEnterKey *DeclarativeEnterKey::qmlAttachedProperties(QObject *object)
{
    return new DeclarativeEnterKey(object);
}

QUrl DeclarativeEnterKey::iconSource() const
{
    return InputMethodExtensions::value(m_editor, IconKey).toUrl();
}

void DeclarativeEnterKey::setIconSource(const QUrl &source)
{
    if (source == iconSource())
        return;
    InputMethodExtensions::setValue(m_editor, IconKey, source);
    Q_EMIT iconSourceChanged();
}

QString DeclarativeEnterKey::text() const
{
    return InputMethodExtensions::value(m_editor, TextKey).toString();
}

void DeclarativeEnterKey::setText(const QString &text)
{
    if (text == this->text())
        return;
    InputMethodExtensions::setValue(m_editor, TextKey, text);
    Q_EMIT textChanged();
}

bool DeclarativeEnterKey::enabled() const
{
    const QVariant value = InputMethodExtensions::value(m_editor, EnabledKey);
    return value.isValid() ? value.toBool() : true;
}

void DeclarativeEnterKey::setEnabled(bool enabled)
{
    if (enabled == this->enabled())
        return;
    InputMethodExtensions::setValue(m_editor, EnabledKey, enabled);
    updateKeyFilter();
}

bool DeclarativeEnterKey::highlighted() const
{
    return InputMethodExtensions::value(m_editor, HighlightedKey).toBool();
}

void DeclarativeEnterKey::setHighlighted(bool highlighted)
{
    if (highlighted == this->highlighted())
        return;
    InputMethodExtensions::setValue(m_editor, HighlightedKey, highlighted);
}

QObject *DeclarativeEnterKey::quickEnterKey() const
{
    if (!m_editor)
        return nullptr;
    // QtQuick's attached type, known by name once QtQuick has registered its types.
    const int id = QMetaType::type("QQuickEnterKeyAttached*");
    const QMetaObject *meta = id != QMetaType::UnknownType ? QMetaType::metaObjectForType(id) : nullptr;
    QQmlAttachedPropertiesFunc attach = meta ? qmlAttachedPropertiesFunction(m_editor, meta) : nullptr;
    return attach ? qmlAttachedPropertiesObject(m_editor, attach, true) : nullptr;
}

int DeclarativeEnterKey::type() const
{
    const QObject *quick = quickEnterKey();
    return quick ? quick->property("type").toInt() : int(Qt::EnterKeyDefault);
}

void DeclarativeEnterKey::setType(int type)
{
    QObject *quick = quickEnterKey();
    if (!quick || type == this->type())
        return;
    quick->setProperty("type", type);
    Q_EMIT typeChanged();
}

void DeclarativeEnterKey::updateKeyFilter()
{
    if (!m_editor)
        return;
    if (enabled())
        m_editor->installEventFilter(this);
    else
        m_editor->removeEventFilter(this);
}

bool DeclarativeEnterKey::eventFilter(QObject *object, QEvent *event)
{
    if (event->type() == QEvent::KeyRelease) {
        const int key = static_cast<QKeyEvent *>(event)->key();
        if (key == Qt::Key_Return || key == Qt::Key_Enter)
            Q_EMIT clicked();
    }
    return QObject::eventFilter(object, event);
}
