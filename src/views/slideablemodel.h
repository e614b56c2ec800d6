#pragma once

#include <QHash>
#include <QObject>
#include <QPointer>
#include <QVariant>

class QAbstractItemModel;

// What a sliding view's `model` holds, read the same way whatever it is: a number (that
// many items, each its index), a list (one item per entry), or an item model (one per
// row, with its roles). Says when rows come, go or move (`changed`) and when a row's
// values change (`rowChanged`).
class SlideableModel : public QObject
{
    Q_OBJECT

public:
    explicit SlideableModel(QObject *parent = nullptr);

    void setSource(const QVariant &source);
    QVariant source() const { return m_source; }
    int count() const;
    // The values a delegate sees for row: "index", "modelData" and each role by name.
    QVariantHash values(int row) const;

Q_SIGNALS:
    void changed();
    void rowChanged(int row);

private:
    QVariant m_source;
    QVariantList m_list;
    QPointer<QAbstractItemModel> m_model;
    int m_number = 0;
};
