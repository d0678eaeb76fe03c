#include "infinitelistmodel.h"

namespace Mavrosk {

InfiniteListModel::InfiniteListModel(QObject *parent)
    : QAbstractListModel(parent)
{ }

void InfiniteListModel::setListLength(int length)
{
    length = qMax(0, length);
    if (length == m_listLength)
        return;
    beginResetModel();
    m_listLength = length;
    endResetModel();
    emit listLengthChanged(m_listLength);
}

QVariant InfiniteListModel::get(int row, const QString &role) const
{
    if (row < 0 || row >= m_rows.size())
        return {};
    return m_rows.at(row).toMap().value(role);
}

void InfiniteListModel::setRows(const QVariantList &rows)
{
    beginResetModel();
    m_rows = rows;
    endResetModel();
    if (m_rows.size() > m_listLength)
        setListLength(m_rows.size());
}

int InfiniteListModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_listLength;
}

QVariant InfiniteListModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return {};
    return get(index.row(), QString::fromUtf8(roleNames().value(role)));
}

QHash<int, QByteArray> InfiniteListModel::roleNames() const
{
    QHash<int, QByteArray> names;
    const QStringList keys = m_rows.isEmpty() ? QStringList() : m_rows.constFirst().toMap().keys();
    for (int i = 0; i < keys.size(); ++i)
        names.insert(Qt::UserRole + 1 + i, keys.at(i).toUtf8());
    return names;
}

} // namespace Mavrosk
