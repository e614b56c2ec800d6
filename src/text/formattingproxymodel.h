#pragma once

#include "text/declarativeformatter.h"

#include <QIdentityProxyModel>
#include <QMetaMethod>
#include <QVector>

// A model that passes its source model through and adds text roles formatted from source
// roles, so that a delegate can show "5 minutes ago" or "1.2 MB" without formatting code:
//
//     FormattingProxyModel {
//         sourceModel: files
//         formats: [
//             { role: "modifiedText", source: "modified", operation: "formatDate",
//               argument: Formatter.DurationElapsed },
//             { role: "sizeText", source: "size", operation: "formatFileSize", argument: 1 }
//         ]
//     }
//
// Each entry of `formats` names the new role, the source role it reads, the formatter
// operation ("formatDate", "formatDuration", "formatFileSize" or "formatText") and the
// operation's second argument (the format type, or the precision for file sizes; 0, or
// 1 for file sizes, when left out). The source value is converted to the operation's
// first parameter type. New roles are numbered after the source's roles. A formatted role
// changes whenever its source role does; refresh() announces all of them again, for texts
// that change with time. Entries with an unknown operation, a missing name or a source
// role the model does not have are ignored with a warning.
//
// Role names are the source's as they are when asked (a QML ListModel names its roles only
// once its first row arrives), and the formatted roles are numbered once the source names
// any: until then the proxy names none, so that a view reading them then sees no formatted
// role without its source.
class FormattingProxyModel : public QIdentityProxyModel
{
    Q_OBJECT
    Q_PROPERTY(QVariantList formats READ formats WRITE setFormats NOTIFY formatsChanged)

public:
    explicit FormattingProxyModel(QObject *parent = nullptr);

    QVariantList formats() const { return m_formatEntries; }
    void setFormats(const QVariantList &formats);

    void setSourceModel(QAbstractItemModel *model) override;
    QHash<int, QByteArray> roleNames() const override;
    QVariant data(const QModelIndex &index, int role) const override;

    Q_INVOKABLE void refresh();

Q_SIGNALS:
    void formatsChanged();

private:
    struct Format {
        QByteArray name;
        QByteArray sourceName;
        QMetaMethod operation;
        int argument = 0;
        int role = -1;
        // Resolved when first needed: some models name their roles only once they have rows.
        mutable int sourceRole = -1;
        mutable bool warned = false;
    };

    void parseFormats();
    void resolveRoles() const;
    void sourceDataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight, const QVector<int> &roles);
    const Format *formatForRole(int role) const;
    int sourceRoleOf(const Format &format) const;

    DeclarativeFormatter m_formatter;
    QVariantList m_formatEntries;
    // Role numbers are given once the source names its roles; mutable, since that may
    // first be seen in roleNames().
    mutable QVector<Format> m_formats;
    mutable bool m_resolved = false;
    QMetaObject::Connection m_sourceConnection;
};
