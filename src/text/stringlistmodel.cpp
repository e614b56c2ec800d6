#include "stringlistmodel.h"

#include <QQmlInfo>

StringListModel::StringListModel(QObject *parent)
    : QAbstractListModel(parent)
{
}

void StringListModel::setStrings(const QStringList &strings)
{
    if (strings == m_strings)
        return;
    const bool sizeChanges = strings.size() != m_strings.size();
    beginResetModel();
    m_strings = strings;
    endResetModel();
    changed(sizeChanges);
}

QString StringListModel::get(int row) const
{
    return row >= 0 && row < m_strings.size() ? m_strings.at(row) : QString();
}

void StringListModel::append(const QString &string)
{
    insert(m_strings.size(), string);
}

void StringListModel::insert(int row, const QString &string)
{
    if (row < 0 || row > m_strings.size()) {
        qmlWarning(this) << "insert: row " << row << " is out of range";
        return;
    }
    beginInsertRows(QModelIndex(), row, row);
    m_strings.insert(row, string);
    endInsertRows();
    changed(true);
}

void StringListModel::set(int row, const QString &string)
{
    if (!validRow(row, "set") || m_strings.at(row) == string)
        return;
    m_strings[row] = string;
    const QModelIndex changedIndex = index(row);
    Q_EMIT dataChanged(changedIndex, changedIndex);
    changed(false);
}

void StringListModel::remove(int row, int count)
{
    if (count <= 0 || !validRow(row, "remove") || !validRow(row + count - 1, "remove"))
        return;
    beginRemoveRows(QModelIndex(), row, row + count - 1);
    m_strings.erase(m_strings.begin() + row, m_strings.begin() + row + count);
    endRemoveRows();
    changed(true);
}

void StringListModel::move(int from, int to)
{
    if (!validRow(from, "move") || !validRow(to, "move") || from == to)
        return;
    // Qt's destination is the row before which the moved row lands, counted before the move.
    beginMoveRows(QModelIndex(), from, from, QModelIndex(), to > from ? to + 1 : to);
    m_strings.move(from, to);
    endMoveRows();
    changed(false);
}

void StringListModel::clear()
{
    setStrings(QStringList());
}

int StringListModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_strings.size();
}

QVariant StringListModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.row() >= m_strings.size())
        return QVariant();
    if (role == Qt::DisplayRole || role == Qt::EditRole || role == ModelDataRole)
        return m_strings.at(index.row());
    return QVariant();
}

QHash<int, QByteArray> StringListModel::roleNames() const
{
    return { { Qt::DisplayRole, "display" }, { ModelDataRole, "modelData" } };
}

bool StringListModel::validRow(int row, const char *operation) const
{
    if (row >= 0 && row < m_strings.size())
        return true;
    qmlWarning(this) << operation << ": row " << row << " is out of range";
    return false;
}

void StringListModel::changed(bool countChanged)
{
    Q_EMIT stringsChanged();
    if (countChanged)
        Q_EMIT this->countChanged();
}
