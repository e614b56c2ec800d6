#include "declarativetextbaseitem.h"

#include "text/declarativepreedittext.h"
#include "rendering/backgrounds/declarativeunderline.h"
#include "core/palette.h"
#include "core/theme.h"
#include "layout/verticalautoscroll.h"

#include <QQmlEngine>

#include <cmath>

DeclarativeTextBaseItem::DeclarativeTextBaseItem(QQuickItem *parent)
    : QQuickItem(parent)
    , m_underline(new DeclarativeUnderline(this))
    , m_palette(new Pelkan::Palette(this))
{
    setAcceptedMouseButtons(Qt::LeftButton);
    // The line's look follows the palette and the pixel ratio from here, without a binding
    // per field; a field that sets its own underline colours sets them after this.
    const auto lineColors = [this] {
        QColor resting = m_palette->primaryColor();
        resting.setAlphaF(0.4);
        m_underline->setColor(resting);
        m_underline->setHighlightColor(m_palette->highlightColor());
        m_underline->setErrorColor(m_palette->errorColor());
    };
    const auto lineWidths = [this] {
        const qreal ratio = Pelkan::Theme::instance()->pixelRatio();
        m_underline->setLineWidth(qMax<qreal>(1, qRound(ratio)));
        m_underline->setFocusLineWidth(qMax<qreal>(2, qRound(2 * ratio)));
    };
    lineColors();
    lineWidths();
    connect(m_palette, &Pelkan::Palette::primaryColorChanged, this, lineColors);
    connect(m_palette, &Pelkan::Palette::highlightColorChanged, this, lineColors);
    connect(m_palette, &Pelkan::Palette::errorColorChanged, this, lineColors);
    connect(Pelkan::Theme::instance(), &Pelkan::Theme::pixelRatioChanged, this, lineWidths);
    themePaddings();
    connect(Pelkan::Theme::instance(), &Pelkan::Theme::pixelRatioChanged, this, &DeclarativeTextBaseItem::themePaddings);
    setActiveFocusOnTab(false);
    // Focus given to the field (forceActiveFocus() on it, or a page that gets the focus back)
    // reaches its editor.
    setFlag(ItemIsFocusScope);
    connect(m_underline, &DeclarativeUnderline::lineWidthChanged, this, &QQuickItem::polish);
    connect(m_underline, &DeclarativeUnderline::focusLineWidthChanged, this, &QQuickItem::polish);
}

DeclarativeTextBaseItem::~DeclarativeTextBaseItem() = default;

void DeclarativeTextBaseItem::watchForLayout(QQuickItem *item)
{
    if (!item)
        return;
    connect(item, &QQuickItem::implicitHeightChanged, this, &QQuickItem::polish);
    connect(item, &QQuickItem::visibleChanged, this, &QQuickItem::polish);
    polish();
}

void DeclarativeTextBaseItem::setEditor(QQuickItem *editor)
{
    if (editor == m_editor)
        return;
    if (m_editor)
        disconnect(m_editor, nullptr, this, nullptr);
    delete m_preedit;
    m_preedit = nullptr;
    m_editor = editor;
    if (editor) {
        connect(editor, &QQuickItem::activeFocusChanged, this, &DeclarativeTextBaseItem::updateFocused);
        watchForLayout(editor);
        // What the field shows includes the composition the keyboard has not committed yet:
        // a field that is being typed into is not empty, even before the first commit.
        m_preedit = new DeclarativePreeditText(editor);
        m_preedit->componentComplete();
        connect(m_preedit, &DeclarativePreeditText::textChanged, this, &DeclarativeTextBaseItem::updateEmpty);
    }
    updateFocused();
    updateEmpty();
    Q_EMIT editorChanged();
}

void DeclarativeTextBaseItem::setContentItem(QQuickItem *item)
{
    if (item == m_contentItem)
        return;
    if (m_contentItem && m_contentItem != m_editor)
        disconnect(m_contentItem, nullptr, this, nullptr);
    m_contentItem = item;
    if (item != m_editor)
        watchForLayout(item);
    polish();
    Q_EMIT contentItemChanged();
}

void DeclarativeTextBaseItem::setPlaceholderItem(QQuickItem *item)
{
    if (item == m_placeholderItem)
        return;
    m_placeholderItem = item;
    polish();
    Q_EMIT placeholderItemChanged();
}

void DeclarativeTextBaseItem::setLabelItem(QQuickItem *item)
{
    if (item == m_labelItem)
        return;
    if (m_labelItem)
        disconnect(m_labelItem, nullptr, this, nullptr);
    m_labelItem = item;
    watchForLayout(item);
    Q_EMIT labelItemChanged();
}

void DeclarativeTextBaseItem::setHighlighted(bool highlighted)
{
    if (highlighted == m_highlighted)
        return;
    m_highlighted = highlighted;
    Q_EMIT highlightedChanged();
}

void DeclarativeTextBaseItem::setErrorHighlight(bool error)
{
    if (error == m_errorHighlight)
        return;
    m_errorHighlight = error;
    m_underline->setErrorHighlight(error);
    Q_EMIT errorHighlightChanged();
}

void DeclarativeTextBaseItem::themePaddings()
{
    const Pelkan::Theme *theme = Pelkan::Theme::instance();
    const qreal themed[5] = { theme->horizontalPageMargin(), theme->horizontalPageMargin(),
                              theme->paddingSmall(), theme->paddingMedium(), theme->paddingSmall() };
    bool changed = false;
    for (int which = 0; which < 5; ++which) {
        if (!(m_paddingSet & (1u << which)) && m_padding[which] != themed[which]) {
            m_padding[which] = themed[which];
            changed = true;
        }
    }
    if (changed) {
        polish();
        Q_EMIT paddingChanged();
    }
}

void DeclarativeTextBaseItem::setPadding(int which, qreal value)
{
    m_paddingSet |= 1u << which;
    if (m_padding[which] == value)
        return;
    m_padding[which] = value;
    polish();
    Q_EMIT paddingChanged();
}

void DeclarativeTextBaseItem::forceEditorFocus()
{
    if (m_editor)
        m_editor->forceActiveFocus(Qt::MouseFocusReason);
}

void DeclarativeTextBaseItem::updateFocused()
{
    const bool focused = m_editor && m_editor->hasActiveFocus();
    m_underline->setHighlighted(focused);
    if (focused == m_focused)
        return;
    // The page around the field keeps it in view above the keyboard from now on.
    if (focused) {
        if (QQuickItem *flickable = AutoScrollController::enclosingFlickable(this))
            qmlAttachedPropertiesObject<VerticalAutoScroll>(flickable, true);
    }
    m_focused = focused;
    Q_EMIT focusedChanged();
}

void DeclarativeTextBaseItem::updateEmpty()
{
    const bool empty = !m_preedit || m_preedit->text().isEmpty();
    if (empty == m_empty)
        return;
    m_empty = empty;
    Q_EMIT emptyChanged();
}

void DeclarativeTextBaseItem::componentComplete()
{
    QQuickItem::componentComplete();
    updatePolish(); // the first implicit height before anyone lays the field out
}

void DeclarativeTextBaseItem::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    if (newGeometry.width() != oldGeometry.width())
        polish();
}

void DeclarativeTextBaseItem::updatePolish()
{
    const qreal left = m_padding[0], right = m_padding[1], top = m_padding[2], bottom = m_padding[3];
    const qreal innerWidth = qMax<qreal>(0, width() - left - right);
    QQuickItem *content = m_contentItem ? m_contentItem.data() : m_editor.data();
    const qreal editorHeight = m_editor ? m_editor->implicitHeight() : 0;
    if (content) {
        content->setPosition(QPointF(left, top));
        content->setSize(QSizeF(innerWidth, editorHeight));
    }
    if (m_placeholderItem) {
        m_placeholderItem->setPosition(QPointF(left, top));
        m_placeholderItem->setWidth(innerWidth);
    }
    // Room for the thicker line of a focused field, so focus never moves what is below.
    const qreal lineRoom = std::ceil(qMax(m_underline->lineWidth(), m_underline->focusLineWidth()));
    const qreal underlineTop = top + editorHeight + m_padding[4] / 2;
    m_underline->setPosition(QPointF(left, underlineTop));
    m_underline->setSize(QSizeF(innerWidth, lineRoom));
    qreal end = underlineTop + lineRoom;
    if (m_labelItem && m_labelItem->isVisible()) {
        m_labelItem->setPosition(QPointF(left, end + m_padding[4] / 2));
        m_labelItem->setWidth(innerWidth);
        end = m_labelItem->y() + m_labelItem->implicitHeight();
    }
    setImplicitHeight(end + bottom);
}

void DeclarativeTextBaseItem::mousePressEvent(QMouseEvent *event)
{
    event->setAccepted(m_editor && m_editor->isEnabled());
}

void DeclarativeTextBaseItem::mouseReleaseEvent(QMouseEvent *event)
{
    if (contains(event->localPos()))
        forceEditorFocus();
}
