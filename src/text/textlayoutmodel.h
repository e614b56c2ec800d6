#pragma once

#include <QAbstractListModel>
#include <QFont>
#include <QRectF>
#include <QVector>

// TextLayoutModel: lays `text` out in `font` for `width` (word wrap, breaking inside a word
// only when it must) and offers one row per line: its `text`, its position (`x`, `y`) and
// its natural `width` and `height`. `maximumLineCount` stops the layout; `truncated` says
// whether text was left over then, or whether a single line would not fit. A label shows
// the lines itself to fade only the last one out, or animates them one by one.
class TextLayoutModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(QString text READ text WRITE setText NOTIFY textChanged)
    Q_PROPERTY(QFont font READ font WRITE setFont NOTIFY fontChanged)
    Q_PROPERTY(qreal width READ width WRITE setWidth NOTIFY widthChanged)
    Q_PROPERTY(int maximumLineCount READ maximumLineCount WRITE setMaximumLineCount NOTIFY maximumLineCountChanged)
    Q_PROPERTY(bool wrap READ wrap WRITE setWrap NOTIFY wrapChanged)
    Q_PROPERTY(int count READ count NOTIFY linesChanged)
    Q_PROPERTY(bool truncated READ truncated NOTIFY linesChanged)
    Q_PROPERTY(qreal contentHeight READ contentHeight NOTIFY linesChanged)
    Q_PROPERTY(qreal contentWidth READ contentWidth NOTIFY linesChanged)

public:
    enum Roles { TextRole = Qt::UserRole + 1, XRole, YRole, WidthRole, HeightRole };

    explicit TextLayoutModel(QObject *parent = nullptr);

    QString text() const { return m_text; }
    void setText(const QString &text);
    QFont font() const { return m_font; }
    void setFont(const QFont &font);
    qreal width() const { return m_width; }
    void setWidth(qreal width);
    int maximumLineCount() const { return m_maximumLineCount; }
    void setMaximumLineCount(int count);
    bool wrap() const { return m_wrap; }
    void setWrap(bool wrap);

    int count() const { return m_lines.size(); }
    // Where line `row` lies (x, y, natural width, height); empty for a row that is not there.
    Q_INVOKABLE QRectF lineRect(int row) const { return row >= 0 && row < m_lines.size() ? m_lines.at(row).rect : QRectF(); }
    bool truncated() const { return m_truncated; }
    qreal contentHeight() const { return m_contentHeight; }
    qreal contentWidth() const { return m_contentWidth; }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

Q_SIGNALS:
    void textChanged();
    void fontChanged();
    void widthChanged();
    void maximumLineCountChanged();
    void wrapChanged();
    void linesChanged();

private:
    struct Line {
        QString text;
        QRectF rect;
    };

    void relayout();

    QString m_text;
    QFont m_font;
    qreal m_width = 0;
    int m_maximumLineCount = 0; // no limit
    bool m_wrap = true;
    QVector<Line> m_lines;
    bool m_truncated = false;
    qreal m_contentHeight = 0;
    qreal m_contentWidth = 0;
};
