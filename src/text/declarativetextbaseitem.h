#pragma once

#include <QPointer>
#include <QQuickItem>

namespace Pelkan { class Palette; }
class DeclarativePreeditText;
class DeclarativeUnderline;

// TextBaseItem: what the label-less, single-line and multi-line text fields share, with
// the look left to QML. It lays out the `contentItem` (the editor, or what holds it) at
// the top inside the paddings, the `placeholderItem` over it, the underline (its own, see
// `underline`) below it and the `labelItem` under that; its implicit height follows.
// The paddings follow the theme (page margins at the sides) until set. It tracks the
// editor's focus (`focused`), whether there is anything in it counting the
// keyboard's pending composition (`empty`), and the `errorHighlight` that the underline
// shows. Its `palette` (the theme's colours unless set) is what the look draws with, so
// one field can be recoloured. A tap outside the editor but inside the field gives the
// editor focus.
class DeclarativeTextBaseItem : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(QQuickItem *editor READ editor WRITE setEditor NOTIFY editorChanged)
    Q_PROPERTY(QQuickItem *contentItem READ contentItem WRITE setContentItem NOTIFY contentItemChanged)
    Q_PROPERTY(QQuickItem *placeholderItem READ placeholderItem WRITE setPlaceholderItem NOTIFY placeholderItemChanged)
    Q_PROPERTY(QQuickItem *labelItem READ labelItem WRITE setLabelItem NOTIFY labelItemChanged)
    Q_PROPERTY(DeclarativeUnderline *underline READ underline CONSTANT)
    Q_PROPERTY(Pelkan::Palette *palette READ palette CONSTANT)
    Q_PROPERTY(bool focused READ focused NOTIFY focusedChanged)
    Q_PROPERTY(bool empty READ empty NOTIFY emptyChanged)
    Q_PROPERTY(bool highlighted READ highlighted WRITE setHighlighted NOTIFY highlightedChanged)
    Q_PROPERTY(bool errorHighlight READ errorHighlight WRITE setErrorHighlight NOTIFY errorHighlightChanged)
    Q_PROPERTY(qreal leftPadding READ leftPadding WRITE setLeftPadding NOTIFY paddingChanged)
    Q_PROPERTY(qreal rightPadding READ rightPadding WRITE setRightPadding NOTIFY paddingChanged)
    Q_PROPERTY(qreal topPadding READ topPadding WRITE setTopPadding NOTIFY paddingChanged)
    Q_PROPERTY(qreal bottomPadding READ bottomPadding WRITE setBottomPadding NOTIFY paddingChanged)
    Q_PROPERTY(qreal labelSpacing READ labelSpacing WRITE setLabelSpacing NOTIFY paddingChanged)

public:
    explicit DeclarativeTextBaseItem(QQuickItem *parent = nullptr);
    ~DeclarativeTextBaseItem() override;

    QQuickItem *editor() const { return m_editor; }
    void setEditor(QQuickItem *editor);
    QQuickItem *contentItem() const { return m_contentItem; }
    void setContentItem(QQuickItem *item);
    QQuickItem *placeholderItem() const { return m_placeholderItem; }
    void setPlaceholderItem(QQuickItem *item);
    QQuickItem *labelItem() const { return m_labelItem; }
    void setLabelItem(QQuickItem *item);
    DeclarativeUnderline *underline() const { return m_underline; }
    Pelkan::Palette *palette() const { return m_palette; }

    bool focused() const { return m_focused; }
    bool empty() const { return m_empty; }
    bool highlighted() const { return m_highlighted; }
    void setHighlighted(bool highlighted);
    bool errorHighlight() const { return m_errorHighlight; }
    void setErrorHighlight(bool error);

    qreal leftPadding() const { return m_padding[0]; }
    void setLeftPadding(qreal padding) { setPadding(0, padding); }
    qreal rightPadding() const { return m_padding[1]; }
    void setRightPadding(qreal padding) { setPadding(1, padding); }
    qreal topPadding() const { return m_padding[2]; }
    void setTopPadding(qreal padding) { setPadding(2, padding); }
    qreal bottomPadding() const { return m_padding[3]; }
    void setBottomPadding(qreal padding) { setPadding(3, padding); }
    qreal labelSpacing() const { return m_padding[4]; }
    void setLabelSpacing(qreal spacing) { setPadding(4, spacing); }

    Q_INVOKABLE void forceEditorFocus();

Q_SIGNALS:
    void editorChanged();
    void contentItemChanged();
    void placeholderItemChanged();
    void labelItemChanged();
    void focusedChanged();
    void emptyChanged();
    void highlightedChanged();
    void errorHighlightChanged();
    void paddingChanged();

protected:
    void componentComplete() override;
    void updatePolish() override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;

private:
    void setPadding(int which, qreal value);
    void themePaddings();
    void watchForLayout(QQuickItem *item);
    void updateFocused();
    void updateEmpty();

    QPointer<QQuickItem> m_editor;
    QPointer<QQuickItem> m_contentItem;
    QPointer<QQuickItem> m_placeholderItem;
    QPointer<QQuickItem> m_labelItem;
    DeclarativeUnderline *m_underline;
    Pelkan::Palette *m_palette;
    DeclarativePreeditText *m_preedit = nullptr;
    qreal m_padding[5] = { 0, 0, 0, 0, 0 };
    unsigned m_paddingSet = 0; // the paddings set from QML; the others follow the theme
    bool m_focused = false;
    bool m_empty = true;
    bool m_highlighted = false;
    bool m_errorHighlight = false;
};
