#include "datastore.h"

#include "statusbarcontroller.h"
#include "viewmanager.h"

#include <QHash>
#include <QPointer>

namespace Brisken {

namespace {

struct Store
{
    // The default services live as long as the process, whatever the host publishes: modules
    // may keep the pointers they were given.
    ViewManager viewManager;
    StatusBarController statusBarController;
    QHash<QString, QPointer<QObject>> objects;

    Store() { restoreDefaults(); }

    void restoreDefaults()
    {
        viewManager.setDisplayContext(0);
        statusBarController.setStatusBarVisible(true);
        statusBarController.clearTransientWidgets();
        objects.clear();
        objects.insert(QStringLiteral("ViewManager"), &viewManager);
        objects.insert(QStringLiteral("StatusBarController"), &statusBarController);
    }
};

Store &store()
{
    static Store instance;
    return instance;
}

} // namespace

QObject *DataStore::get(const QString &key)
{
    return store().objects.value(key);
}

void DataStore::set(const QString &key, QObject *object)
{
    if (!object) {
        remove(key);
        return;
    }
    store().objects.insert(key, object);
}

void DataStore::remove(const QString &key)
{
    store().objects.remove(key);
}

void DataStore::reset()
{
    store().restoreDefaults();
}

} // namespace Brisken
