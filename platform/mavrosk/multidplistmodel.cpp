#include "multidplistmodel.h"

namespace Mavrosk {

MultiDPListModel::MultiDPListModel(QObject *parent)
    : QAbstractListModel(parent)
{ }

MultiDPListModel::MultiDPListModel(const QStringList &roles, QObject *parent)
    : QAbstractListModel(parent)
{
    for (const QString &role : roles)
        m_declaredRoles.append(role.toUtf8());
    m_roles = m_declaredRoles;
}

QVariant MultiDPListModel::get(int row, const QString &role) const
{
    if (row < 0 || row >= m_rows.size())
        return {};
    return m_rows.at(row).toMap().value(role);
}

void MultiDPListModel::setRows(const QVariantList &rows)
{
    const int before = m_rows.size();
    beginResetModel();
    m_rows = rows;
    m_roles = m_declaredRoles;
    for (const QVariant &row : rows) {
        const QStringList keys = row.toMap().keys();
        for (const QString &key : keys) {
            if (!m_roles.contains(key.toUtf8()))
                m_roles.append(key.toUtf8());
        }
    }
    endResetModel();
    if (before != m_rows.size())
        emit countChanged(m_rows.size());
}

int MultiDPListModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_rows.size();
}

QVariant MultiDPListModel::data(const QModelIndex &index, int role) const
{
    const int roleIndex = role - Qt::UserRole - 1;
    if (!index.isValid() || roleIndex < 0 || roleIndex >= m_roles.size())
        return {};
    return get(index.row(), QString::fromUtf8(m_roles.at(roleIndex)));
}

QHash<int, QByteArray> MultiDPListModel::roleNames() const
{
    QHash<int, QByteArray> names;
    for (int i = 0; i < m_roles.size(); ++i)
        names.insert(Qt::UserRole + 1 + i, m_roles.at(i));
    return names;
}

} // namespace Mavrosk
