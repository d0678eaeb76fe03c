#pragma once

#include "multidplistmodel.h"

namespace Mavrosk {

// A long list that the phone delivers in windows (the contact list): listLength() is the length
// of the whole list, whatever part of it has been loaded. Loaded rows are maps read by role name,
// as in MultiDPListModel; count() is the number of rows loaded.
class InfiniteListModel : public MultiDPListModel
{
    Q_OBJECT
    Q_PROPERTY(int listLength READ listLength WRITE setListLength NOTIFY listLengthChanged)

public:
    explicit InfiniteListModel(QObject *parent = nullptr);
    InfiniteListModel(const QStringList &roles, QObject *parent);

    int listLength() const { return m_listLength; }
    // Bridge side: the length of the whole list.
    void setListLength(int length);

    // Bridge side: the loaded rows from row 0 (a list of QVariantMap); the length grows to hold
    // them.
    Q_INVOKABLE void setRows(const QVariantList &rows);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;

signals:
    void listLengthChanged(int listLength);

private:
    int m_listLength = 0;
};

} // namespace Mavrosk
