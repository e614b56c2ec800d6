#include "slideablemodel.h"

#include <QAbstractItemModel>
#include <QJSValue>

SlideableModel::SlideableModel(QObject *parent)
    : QObject(parent)
{
}

void SlideableModel::setSource(const QVariant &value)
{
    QVariant source = value;
    if (source.userType() == qMetaTypeId<QJSValue>())
        source = source.value<QJSValue>().toVariant();
    if (m_model)
        disconnect(m_model, nullptr, this, nullptr);
    m_source = source;
    m_list.clear();
    m_model = nullptr;
    m_number = 0;

    if (auto *model = qobject_cast<QAbstractItemModel *>(source.value<QObject *>())) {
        m_model = model;
        for (auto signal : { &QAbstractItemModel::rowsInserted, &QAbstractItemModel::rowsRemoved })
            connect(model, signal, this, &SlideableModel::changed);
        connect(model, &QAbstractItemModel::rowsMoved, this, &SlideableModel::changed);
        connect(model, &QAbstractItemModel::modelReset, this, &SlideableModel::changed);
        connect(model, &QAbstractItemModel::layoutChanged, this, &SlideableModel::changed);
        connect(model, &QAbstractItemModel::dataChanged, this, [this](const QModelIndex &from, const QModelIndex &to) {
            for (int row = from.row(); row <= to.row(); ++row)
                Q_EMIT rowChanged(row);
        });
    } else if (source.canConvert<QVariantList>() && source.type() != QVariant::String) {
        m_list = source.toList();
    } else if (source.canConvert<int>()) {
        m_number = qMax(0, source.toInt());
    }
    Q_EMIT changed();
}

int SlideableModel::count() const
{
    if (m_model)
        return m_model->rowCount();
    if (!m_list.isEmpty())
        return m_list.size();
    return m_number;
}

QVariantHash SlideableModel::values(int row) const
{
    QVariantHash values { { QStringLiteral("index"), row } };
    if (m_model) {
        const QModelIndex index = m_model->index(row, 0);
        const QHash<int, QByteArray> roles = m_model->roleNames();
        for (auto role = roles.cbegin(); role != roles.cend(); ++role)
            values.insert(QString::fromUtf8(role.value()), index.data(role.key()));
        if (!values.contains(QStringLiteral("modelData")))
            values.insert(QStringLiteral("modelData"), roles.size() == 1 ? index.data(roles.cbegin().key())
                                                                          : index.data(Qt::DisplayRole));
    } else if (!m_list.isEmpty()) {
        values.insert(QStringLiteral("modelData"), m_list.value(row));
    } else {
        values.insert(QStringLiteral("modelData"), row);
    }
    return values;
}
