#pragma once

#include <QAbstractListModel>
#include <QStringList>
#include <QVariantList>

namespace Mavrosk {

// A list of rows, each a map of role name to value, read by role name: the phone's alphabet bar
// ("alphabet", "letterIndex") is one. The roles a list declares are its roles from the start, so
// that views can bind to them before the first row arrives; a row may bring more.
class MultiDPListModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)
public:
    explicit MultiDPListModel(QObject *parent = nullptr);
    MultiDPListModel(const QStringList &roles, QObject *parent);

    int count() const { return m_rows.size(); }
    // The value of the role in the row; invalid outside the rows or for an unknown role.
    Q_INVOKABLE QVariant get(int row, const QString &role) const;

    // Bridge side: replaces every row (a list of QVariantMap).
    Q_INVOKABLE void setRows(const QVariantList &rows);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

signals:
    void countChanged(int count);

private:
    QVariantList m_rows;
    QList<QByteArray> m_declaredRoles;
    QList<QByteArray> m_roles;
};

} // namespace Mavrosk
