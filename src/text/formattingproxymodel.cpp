#include "formattingproxymodel.h"
#include "core/pelkanlogging.h"

namespace {

const char *const Operations[] = { "formatDate", "formatDuration", "formatFileSize", "formatText" };

QMetaMethod operationNamed(const QByteArray &name)
{
    for (const char *operation : Operations) {
        if (name == operation) {
            const QMetaObject &meta = DeclarativeFormatter::staticMetaObject;
            for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
                const QMetaMethod method = meta.method(i);
                // The two-argument form; formatFileSize also has a one-argument overload.
                if (method.name() == name && method.parameterCount() == 2)
                    return method;
            }
        }
    }
    return QMetaMethod();
}

} // namespace

FormattingProxyModel::FormattingProxyModel(QObject *parent)
    : QIdentityProxyModel(parent)
{
}

void FormattingProxyModel::setFormats(const QVariantList &formats)
{
    if (formats == m_formatEntries)
        return;
    beginResetModel();
    m_formatEntries = formats;
    parseFormats();
    resolveRoles();
    endResetModel();
    Q_EMIT formatsChanged();
}

void FormattingProxyModel::parseFormats()
{
    m_formats.clear();
    for (const QVariant &entry : qAsConst(m_formatEntries)) {
        const QVariantMap map = entry.toMap();
        Format format;
        format.name = map.value(QStringLiteral("role")).toString().toUtf8();
        format.sourceName = map.value(QStringLiteral("source")).toString().toUtf8();
        const QByteArray operation = map.value(QStringLiteral("operation")).toString().toUtf8();
        format.operation = operationNamed(operation);
        if (format.name.isEmpty() || format.sourceName.isEmpty() || !format.operation.isValid()) {
            qCWarning(lcPelkanCoreLog) << "FormattingProxyModel: ignoring format" << map
                                       << "(it needs role, source and one of the operations formatDate,"
                                          " formatDuration, formatFileSize, formatText)";
            continue;
        }
        const int defaultArgument = operation == "formatFileSize" ? 1 : 0;
        format.argument = map.value(QStringLiteral("argument"), defaultArgument).toInt();
        m_formats.append(format);
    }
}

void FormattingProxyModel::setSourceModel(QAbstractItemModel *model)
{
    if (model == sourceModel())
        return;
    beginResetModel();
    disconnect(m_sourceConnection);
    QIdentityProxyModel::setSourceModel(model);
    if (model)
        m_sourceConnection = connect(model, &QAbstractItemModel::dataChanged, this, &FormattingProxyModel::sourceDataChanged);
    resolveRoles();
    endResetModel();
}

void FormattingProxyModel::resolveRoles() const
{
    QAbstractItemModel *source = sourceModel();
    const QHash<int, QByteArray> sourceRoles = source ? source->roleNames() : QHash<int, QByteArray>();
    m_resolved = !sourceRoles.isEmpty();
    if (!m_resolved) {
        for (Format &format : m_formats)
            format.role = -1;
        return;
    }
    int next = Qt::UserRole;
    for (auto it = sourceRoles.cbegin(); it != sourceRoles.cend(); ++it)
        next = qMax(next, it.key() + 1);

    for (Format &format : m_formats) {
        format.sourceRole = sourceRoles.key(format.sourceName, -1);
        format.warned = false;
        format.role = next++;
    }
}

int FormattingProxyModel::sourceRoleOf(const Format &format) const
{
    // Some models (a QML ListModel) name their roles only once they have rows.
    if (format.sourceRole < 0 && sourceModel()) {
        format.sourceRole = sourceModel()->roleNames().key(format.sourceName, -1);
        if (format.sourceRole < 0 && !format.warned) {
            format.warned = true;
            qCWarning(lcPelkanCoreLog) << "FormattingProxyModel: the source model has no role" << format.sourceName;
        }
    }
    return format.sourceRole;
}

QHash<int, QByteArray> FormattingProxyModel::roleNames() const
{
    // The source's names as they are now: the base class keeps those it saw when the source
    // was set, none for a ListModel that had no rows then.
    QHash<int, QByteArray> names = sourceModel() ? sourceModel()->roleNames() : QHash<int, QByteArray>();
    if (names.isEmpty())
        return names;
    if (!m_resolved)
        resolveRoles();
    for (const Format &format : m_formats) {
        if (format.role >= 0)
            names.insert(format.role, format.name);
    }
    return names;
}

const FormattingProxyModel::Format *FormattingProxyModel::formatForRole(int role) const
{
    for (const Format &format : m_formats) {
        if (role >= 0 && format.role == role)
            return &format;
    }
    return nullptr;
}

QVariant FormattingProxyModel::data(const QModelIndex &index, int role) const
{
    const Format *format = formatForRole(role);
    if (!format)
        return QIdentityProxyModel::data(index, role);
    if (!index.isValid() || sourceRoleOf(*format) < 0)
        return QVariant();

    QVariant value = sourceModel()->data(mapToSource(index), format->sourceRole);
    const int type = format->operation.parameterType(0);
    if (!value.convert(type))
        value = QVariant(type, nullptr);

    QString text;
    int argument = format->argument;
    format->operation.invoke(const_cast<DeclarativeFormatter *>(&m_formatter), Qt::DirectConnection,
                             Q_RETURN_ARG(QString, text),
                             QGenericArgument(QMetaType::typeName(type), value.constData()),
                             Q_ARG(int, argument));
    return text;
}

void FormattingProxyModel::sourceDataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                                             const QVector<int> &roles)
{
    QVector<int> formatted;
    for (const Format &format : qAsConst(m_formats)) {
        const int sourceRole = sourceRoleOf(format);
        if (format.role >= 0 && sourceRole >= 0 && (roles.isEmpty() || roles.contains(sourceRole)))
            formatted.append(format.role);
    }
    if (!formatted.isEmpty())
        Q_EMIT dataChanged(mapFromSource(topLeft), mapFromSource(bottomRight), formatted);
}

void FormattingProxyModel::refresh()
{
    QVector<int> formatted;
    for (const Format &format : qAsConst(m_formats)) {
        if (format.role >= 0 && sourceRoleOf(format) >= 0)
            formatted.append(format.role);
    }
    const int rows = rowCount();
    if (rows > 0 && !formatted.isEmpty())
        Q_EMIT dataChanged(index(0, 0), index(rows - 1, qMax(0, columnCount() - 1)), formatted);
}
