#pragma once

#include <QQuickItem>

#include "layout/buttonlayoutattached.h"

// ButtonLayout: lays its visible children (buttons) out in centred rows, as many per row
// as fit its width, all buttons of a row as wide as the widest one's implicit width (or
// `preferredWidth` when larger); a button with ButtonLayout.newLine set starts a new row.
// A button wider than the layout gets a row of its own, shrunk to the width. The layout's
// implicit height follows the rows.
class ButtonLayout : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(qreal rowSpacing READ rowSpacing WRITE setRowSpacing NOTIFY rowSpacingChanged)
    Q_PROPERTY(qreal columnSpacing READ columnSpacing WRITE setColumnSpacing NOTIFY columnSpacingChanged)
    Q_PROPERTY(qreal preferredWidth READ preferredWidth WRITE setPreferredWidth NOTIFY preferredWidthChanged)
    Q_PROPERTY(int rowCount READ rowCount NOTIFY rowCountChanged)

public:
    explicit ButtonLayout(QQuickItem *parent = nullptr);

    qreal rowSpacing() const { return m_rowSpacing; }
    void setRowSpacing(qreal spacing);
    qreal columnSpacing() const { return m_columnSpacing; }
    void setColumnSpacing(qreal spacing);
    qreal preferredWidth() const { return m_preferredWidth; }
    void setPreferredWidth(qreal width);
    int rowCount() const { return m_rowCount; }

    static ButtonLayoutAttached *qmlAttachedProperties(QObject *object);

Q_SIGNALS:
    void rowSpacingChanged();
    void columnSpacingChanged();
    void preferredWidthChanged();
    void rowCountChanged();

protected:
    void itemChange(ItemChange change, const ItemChangeData &data) override;
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void updatePolish() override;
    void componentComplete() override;

private:
    void watch(QQuickItem *child);
    void unwatch(QQuickItem *child);

    qreal m_rowSpacing = 0;
    qreal m_columnSpacing = 0;
    qreal m_preferredWidth = 0;
    int m_rowCount = 0;
    bool m_laying = false;
};

QML_DECLARE_TYPEINFO(ButtonLayout, QML_HAS_ATTACHED_PROPERTIES)
