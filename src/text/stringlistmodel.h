#pragma once

#include <QAbstractListModel>
#include <QStringList>

// StringListModel: a list of strings as a model, for combo boxes, suggestions and simple
// lists. Each row offers the string as `display` and `modelData`; edits (append, insert,
// remove, move, set, clear, or a whole new `strings` list) reach views as row changes,
// so a view keeps its delegates for the rows that stay.
class StringListModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(QStringList strings READ strings WRITE setStrings NOTIFY stringsChanged)
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    enum Roles { ModelDataRole = Qt::UserRole + 1 };

    explicit StringListModel(QObject *parent = nullptr);

    QStringList strings() const { return m_strings; }
    void setStrings(const QStringList &strings);
    int count() const { return m_strings.size(); }

    Q_INVOKABLE QString get(int row) const;
    Q_INVOKABLE void append(const QString &string);
    Q_INVOKABLE void insert(int row, const QString &string);
    Q_INVOKABLE void set(int row, const QString &string);
    Q_INVOKABLE void remove(int row, int count = 1);
    Q_INVOKABLE void move(int from, int to);
    Q_INVOKABLE void clear();
    Q_INVOKABLE int indexOf(const QString &string) const { return m_strings.indexOf(string); }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

Q_SIGNALS:
    void stringsChanged();
    void countChanged();

private:
    bool validRow(int row, const char *operation) const;
    void changed(bool countChanged);

    QStringList m_strings;
};
