#include "textlayoutmodel.h"

#include <QFontMetricsF>
#include <QTextLayout>

#include <cmath>

TextLayoutModel::TextLayoutModel(QObject *parent)
    : QAbstractListModel(parent)
{
}

void TextLayoutModel::setText(const QString &text)
{
    if (text == m_text)
        return;
    m_text = text;
    Q_EMIT textChanged();
    relayout();
}

void TextLayoutModel::setFont(const QFont &font)
{
    if (font == m_font)
        return;
    m_font = font;
    Q_EMIT fontChanged();
    relayout();
}

void TextLayoutModel::setWidth(qreal width)
{
    if (width == m_width)
        return;
    m_width = width;
    Q_EMIT widthChanged();
    relayout();
}

void TextLayoutModel::setMaximumLineCount(int count)
{
    count = qMax(0, count);
    if (count == m_maximumLineCount)
        return;
    m_maximumLineCount = count;
    Q_EMIT maximumLineCountChanged();
    relayout();
}

void TextLayoutModel::setWrap(bool wrap)
{
    if (wrap == m_wrap)
        return;
    m_wrap = wrap;
    Q_EMIT wrapChanged();
    relayout();
}

void TextLayoutModel::relayout()
{
    QVector<Line> lines;
    bool truncated = false;
    qreal contentWidth = 0;
    qreal y = 0;

    // Line breaks in the text are paragraphs; each wraps on its own.
    QString text = m_text;
    text.replace(QLatin1Char('\n'), QChar::LineSeparator);
    QTextLayout layout(text, m_font);
    QTextOption option;
    option.setWrapMode(m_wrap ? QTextOption::WrapAtWordBoundaryOrAnywhere : QTextOption::NoWrap);
    layout.setTextOption(option);
    layout.setCacheEnabled(true);
    const qreal leading = QFontMetricsF(m_font).leading();
    layout.beginLayout();
    while (true) {
        QTextLine line = layout.createLine();
        if (!line.isValid())
            break;
        if (m_maximumLineCount > 0 && lines.size() == m_maximumLineCount) {
            truncated = true;
            break;
        }
        if (m_wrap && m_width > 0)
            line.setLineWidth(m_width);
        else
            line.setNumColumns(text.size());
        line.setPosition(QPointF(0, y));
        y += line.height() + leading;
        const qreal natural = line.naturalTextWidth();
        if (m_width > 0 && natural > m_width)
            truncated = true;
        contentWidth = qMax(contentWidth, natural);
        QString lineText = text.mid(line.textStart(), line.textLength());
        while (!lineText.isEmpty() && (lineText.endsWith(QChar::LineSeparator) || lineText.endsWith(QLatin1Char(' '))))
            lineText.chop(1);
        lines.append({ lineText, QRectF(line.x(), line.y(), natural, line.height()) });
    }
    layout.endLayout();

    const bool sameRows = lines.size() == m_lines.size();
    if (sameRows) {
        m_lines = lines;
        if (!m_lines.isEmpty())
            Q_EMIT dataChanged(index(0), index(m_lines.size() - 1));
    } else {
        beginResetModel();
        m_lines = lines;
        endResetModel();
    }
    m_truncated = truncated;
    m_contentWidth = contentWidth;
    m_contentHeight = lines.isEmpty() ? 0 : std::ceil(lines.last().rect.bottom());
    Q_EMIT linesChanged();
}

int TextLayoutModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_lines.size();
}

QVariant TextLayoutModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.row() >= m_lines.size())
        return QVariant();
    const Line &line = m_lines.at(index.row());
    switch (role) {
    case Qt::DisplayRole:
    case TextRole:
        return line.text;
    case XRole:
        return line.rect.x();
    case YRole:
        return line.rect.y();
    case WidthRole:
        return line.rect.width();
    case HeightRole:
        return line.rect.height();
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> TextLayoutModel::roleNames() const
{
    return { { TextRole, "text" }, { XRole, "x" }, { YRole, "y" }, { WidthRole, "width" }, { HeightRole, "height" } };
}
