#include "controlbase.h"

#include <QFocusEvent>
#include <QGuiApplication>
#include <QSet>
#include <QStyleHints>
#include <QtQml/qqml.h>
// Qt's accessible attached type is written with the emit keyword, which this build leaves out.
#define emit Q_EMIT
#include <private/qquickaccessibleattached_p.h>
#undef emit
#include <private/qqmlmetatype_p.h>
#include <private/qquickitem_p.h>

namespace Pelkan {

namespace {

// One observer for every control: Qt keeps its observers in a list it searches on each
// install and removal, which a page of hundreds of controls would pay for quadratically.
class ActivationObservers : public QAccessible::ActivationObserver
{
public:
    void add(ControlBase *control)
    {
        if (!m_installed) {
            QAccessible::installActivationObserver(this);
            m_installed = true;
        }
        m_controls.insert(control);
    }
    void remove(ControlBase *control) { m_controls.remove(control); }

    void accessibilityActiveChanged(bool active) override
    {
        const QSet<ControlBase *> controls = m_controls; // a control may go meanwhile
        for (ControlBase *control : controls) {
            if (m_controls.contains(control))
                control->accessibilityActiveChanged(active);
        }
    }

private:
    QSet<ControlBase *> m_controls;
    bool m_installed = false;
};

ActivationObservers &activationObservers()
{
    // Left to the end of the process: Qt may still hold it while its own globals go.
    static ActivationObservers *observers = new ActivationObservers;
    return *observers;
}

} // namespace

ControlBase::ControlBase(QQuickItem *parent)
    : Control(parent)
{
    setFlag(ItemIsFocusScope);
    activationObservers().add(this);
    // Highlighted reads as selected: the current tab, the row whose menu is open.
    connect(this, &Control::highlightedChanged, this, [this] { setAccessibleState("selected", highlighted()); });
}

ControlBase::~ControlBase()
{
    activationObservers().remove(this);
}

void ControlBase::setText(const QString &text)
{
    if (m_text == text)
        return;
    m_text = text;
    updateAccessibleName();
    Q_EMIT textChanged();
}

void ControlBase::setDescription(const QString &description)
{
    if (m_description == description)
        return;
    const QString previous = m_description;
    m_description = description;
    // An Accessible.description the application set stays.
    if (m_accessible && (m_accessible->description().isEmpty() || m_accessible->description() == previous))
        m_accessible->setDescription(description);
    Q_EMIT descriptionChanged();
}

void ControlBase::setFocusPolicy(Qt::FocusPolicy policy)
{
    if (m_focusPolicy == policy)
        return;
    m_focusPolicy = policy;
    setActiveFocusOnTab((policy & Qt::TabFocus) == Qt::TabFocus);
    Q_EMIT focusPolicyChanged();
}

// The effective mirroring is the item's own; it says when it changes through the item's
// LayoutMirroring object, made on the first read (a look that never asks costs nothing).
bool ControlBase::isMirrored() const
{
    ensureMirrorNotifier();
    return QQuickItemPrivate::get(this)->isMirrored();
}

void ControlBase::ensureMirrorNotifier() const
{
    if (m_mirrorNotifier)
        return;
    m_mirrorNotifier = true;
    // Qt Quick keeps its LayoutMirroring type to itself; it is reached as QML reaches it.
    static const QQmlAttachedPropertiesFunc mirroringOf =
            QQmlMetaType::qmlType(QStringLiteral("QtQuick/LayoutMirroring"), 2, 0).attachedPropertiesFunction(nullptr);
    auto *self = const_cast<ControlBase *>(this);
    if (QObject *mirroring = mirroringOf ? qmlAttachedPropertiesObject(self, mirroringOf, true) : nullptr)
        connect(mirroring, SIGNAL(enabledChanged()), self, SIGNAL(mirroredChanged()));
}

int ControlBase::accessibleRole() const
{
    return m_accessibleRole >= 0 ? m_accessibleRole : int(defaultAccessibleRole());
}

void ControlBase::setAccessibleRole(int role)
{
    if (m_accessibleRole == role)
        return;
    m_accessibleRole = role;
    updateAccessibleRole();
    Q_EMIT accessibleRoleChanged();
}

void ControlBase::defaultAccessibleRoleChanged()
{
    if (m_accessibleRole >= 0)
        return;
    updateAccessibleRole();
    Q_EMIT accessibleRoleChanged();
}

void ControlBase::updateAccessibleRole()
{
    if (m_accessible)
        m_accessible->setRole(QAccessible::Role(accessibleRole()));
}

void ControlBase::accessibilityActiveChanged(bool active)
{
    if (!active || m_accessible || !isComponentComplete())
        return;
    m_accessible = qobject_cast<QQuickAccessibleAttached *>(
            qmlAttachedPropertiesObject<QQuickAccessibleAttached>(this, true));
    if (!m_accessible)
        return;
    updateAccessibleRole();
    updateAccessibleName();
    if (m_accessible->description().isEmpty())
        m_accessible->setDescription(m_description);
    setAccessibleState("selected", highlighted());
    updateAccessibleStates();
}

// The text names the control unless the application named it (Accessible.name).
void ControlBase::updateAccessibleName()
{
    if (m_accessible && !m_accessible->wasNameExplicitlySet())
        m_accessible->setNameImplicitly(m_text);
}

void ControlBase::setAccessibleState(const char *state, bool on)
{
    if (m_accessible)
        static_cast<QObject *>(m_accessible)->setProperty(state, on);
}

void ControlBase::sendAccessibleValueChange(const QVariant &value)
{
    if (!m_accessible)
        return;
    QAccessibleValueChangeEvent event(this, value);
    QAccessible::updateAccessibility(&event);
}

void ControlBase::componentComplete()
{
    Control::componentComplete();
    if (QAccessible::isActive())
        accessibilityActiveChanged(true);
}

void ControlBase::focusOnPress()
{
    if ((m_focusPolicy & Qt::ClickFocus) == Qt::ClickFocus && !QGuiApplication::styleHints()->setFocusOnTouchRelease())
        forceActiveFocus(Qt::MouseFocusReason);
}

void ControlBase::focusOnRelease()
{
    if ((m_focusPolicy & Qt::ClickFocus) == Qt::ClickFocus && QGuiApplication::styleHints()->setFocusOnTouchRelease())
        forceActiveFocus(Qt::MouseFocusReason);
}

void ControlBase::mousePressEvent(QMouseEvent *event)
{
    focusOnPress();
    Control::mousePressEvent(event);
}

void ControlBase::mouseReleaseEvent(QMouseEvent *event)
{
    focusOnRelease();
    Control::mouseReleaseEvent(event);
}

void ControlBase::focusInEvent(QFocusEvent *event)
{
    Control::focusInEvent(event);
    const Qt::FocusReason reason = event->reason();
    const bool visual = reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason || reason == Qt::ShortcutFocusReason;
    if (m_visualFocus != visual) {
        m_visualFocus = visual;
        Q_EMIT visualFocusChanged();
    }
}

void ControlBase::focusOutEvent(QFocusEvent *event)
{
    Control::focusOutEvent(event);
    if (m_visualFocus) {
        m_visualFocus = false;
        Q_EMIT visualFocusChanged();
    }
}

} // namespace Pelkan
