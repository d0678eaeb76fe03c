#pragma once

#include <QAbstractListModel>
#include <QVariantList>

namespace Mavrosk {

// A long list that the phone delivers in windows (the contact list): listLength() is the length
// of the whole list, whatever part of it has been loaded. Loaded rows are maps read by role name.
class InfiniteListModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int listLength READ listLength WRITE setListLength NOTIFY listLengthChanged)
public:
    explicit InfiniteListModel(QObject *parent = nullptr);

    int listLength() const { return m_listLength; }
    // Bridge side: the length of the whole list.
    void setListLength(int length);

    Q_INVOKABLE QVariant get(int row, const QString &role) const;
    // Bridge side: the loaded rows from row 0 (a list of QVariantMap); the length grows to hold
    // them.
    Q_INVOKABLE void setRows(const QVariantList &rows);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

signals:
    void listLengthChanged(int listLength);

private:
    int m_listLength = 0;
    QVariantList m_rows;
};

} // namespace Mavrosk
