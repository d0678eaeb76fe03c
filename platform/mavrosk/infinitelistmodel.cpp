#include "infinitelistmodel.h"

namespace Mavrosk {

InfiniteListModel::InfiniteListModel(QObject *parent)
    : MultiDPListModel(parent)
{ }

InfiniteListModel::InfiniteListModel(const QStringList &roles, QObject *parent)
    : MultiDPListModel(roles, parent)
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

void InfiniteListModel::setRows(const QVariantList &rows)
{
    MultiDPListModel::setRows(rows);
    if (count() > m_listLength)
        setListLength(count());
}

int InfiniteListModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_listLength;
}

} // namespace Mavrosk
