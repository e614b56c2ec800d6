#pragma once

#include "control.h"

#include <QAccessible>
#include <QString>

class QQuickAccessibleAttached;

namespace Pelkan {

// ControlBase: what every control of the toolkit does the same way, written once so that a
// control's QML file only draws it. A control
// - is a focus scope: focus given to it goes to the part of it the control (or the
//   application) focused last, so a page keeps the field an application focused in it;
// - takes focus by Tab and Shift+Tab and, where its `focusPolicy` says so, by a press, and
//   says when the focus came from the keyboard (`visualFocus`), for its look to show it;
// - says whether it is laid out right to left (`mirrored`, from the LayoutMirroring it
//   inherits), for its look to follow;
// - tells assistive technology its role, its name (`text` unless Accessible.name is set),
//   its `description` and its states. None of that costs anything until assistive
//   technology is active: it is handed over when it starts, and kept current from then on;
// - inherits its palette from the nearest control above it (a page, a list item).
// Look in QML, behaviour here: keys, presses and values are handled by the bases derived
// from this one (ButtonBase, RangeBase).
class ControlBase : public Control
{
    Q_OBJECT
    // The control's words: a button's label, a row's title. Also its accessible name.
    Q_PROPERTY(QString text READ text WRITE setText NOTIFY textChanged)
    // Words under or after the text, smaller; also the accessible description.
    Q_PROPERTY(QString description READ description WRITE setDescription NOTIFY descriptionChanged)
    // How the control takes focus: Qt.TabFocus (Tab and Shift+Tab), Qt.ClickFocus (a press),
    // Qt.StrongFocus (both) or Qt.NoFocus.
    Q_PROPERTY(Qt::FocusPolicy focusPolicy READ focusPolicy WRITE setFocusPolicy NOTIFY focusPolicyChanged)
    // Whether the control has the active focus by Tab, Shift+Tab or a shortcut: the look shows
    // a keyboard user where they are (a press that focuses shows nothing).
    Q_PROPERTY(bool visualFocus READ hasVisualFocus NOTIFY visualFocusChanged)
    // Whether the control is laid out right to left: the look mirrors itself while true.
    Q_PROPERTY(bool mirrored READ isMirrored NOTIFY mirroredChanged)
    // What the control is to assistive technology (an Accessible role, e.g. Accessible.Button).
    Q_PROPERTY(int accessibleRole READ accessibleRole WRITE setAccessibleRole NOTIFY accessibleRoleChanged)

public:
    explicit ControlBase(QQuickItem *parent = nullptr);
    ~ControlBase() override;

    QString text() const { return m_text; }
    void setText(const QString &text);
    QString description() const { return m_description; }
    void setDescription(const QString &description);

    Qt::FocusPolicy focusPolicy() const { return m_focusPolicy; }
    void setFocusPolicy(Qt::FocusPolicy policy);

    bool hasVisualFocus() const { return m_visualFocus; }
    bool isMirrored() const;

    int accessibleRole() const;
    void setAccessibleRole(int role);

    // Assistive technology started (or stopped): hands the control's role, name and states
    // over. Every control alive hears of it through one observer of the toolkit's.
    void accessibilityActiveChanged(bool active);

Q_SIGNALS:
    void textChanged();
    void descriptionChanged();
    void focusPolicyChanged();
    void visualFocusChanged();
    void mirroredChanged();
    void accessibleRoleChanged();

protected:
    void componentComplete() override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;

    // A press gives focus where the focus policy says so (on release where the platform
    // focuses on touch release).
    void focusOnPress();
    void focusOnRelease();

    // The role a control of this kind has unless accessibleRole is set.
    virtual QAccessible::Role defaultAccessibleRole() const { return QAccessible::Pane; }
    // For a control whose default role depends on its state (a checkable button).
    void defaultAccessibleRoleChanged();
    // Sets the accessible states this control keeps; called when assistive technology starts.
    virtual void updateAccessibleStates() {}
    // The accessible object while assistive technology is active, null otherwise.
    QQuickAccessibleAttached *accessible() const { return m_accessible; }
    void setAccessibleState(const char *state, bool on);
    void sendAccessibleValueChange(const QVariant &value);

private:
    void ensureMirrorNotifier() const;
    void updateAccessibleRole();
    void updateAccessibleName();

    QString m_text;
    QString m_description;
    Qt::FocusPolicy m_focusPolicy = Qt::NoFocus;
    int m_accessibleRole = -1;
    QQuickAccessibleAttached *m_accessible = nullptr;
    mutable bool m_mirrorNotifier = false;
    bool m_visualFocus = false;
};

} // namespace Pelkan
