#pragma once

#include <QObject>
#include <QString>

namespace Brisken {

// The GUI framework's store of shared service objects, by key. By default it holds a
// ViewManager under "ViewManager" and a StatusBarController under "StatusBarController"; the
// host may replace or remove them. The store does not own objects that the host sets.
class DataStore
{
public:
    static QObject *get(const QString &key);
    template<typename T> static T *get(const QString &key) { return qobject_cast<T *>(get(key)); }

    // Host side: publish `object` under `key` (null removes the entry).
    static void set(const QString &key, QObject *object);
    static void remove(const QString &key);
    // Host side: back to the default objects, in their default state.
    static void reset();

private:
    DataStore() = delete;
};

} // namespace Brisken
