#pragma once

#include <QObject>
#include <QString>

namespace Brisken {

// The GUI framework's registry of views. Shared through the DataStore under "ViewManager".
class ViewManager : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int displayContext READ displayContext NOTIFY displayContextChanged)
public:
    explicit ViewManager(QObject *parent = nullptr);
    ~ViewManager() override;

    // The identifier of `view` of `module`: module + "." + view (e.g. "PHONE.PhoneMenu"). Pure
    // string work, usable during library load before any application object exists.
    static QString viewIdentifier(const QString &module, const QString &view);

    // What the display currently shows, as the host reports it.
    virtual int displayContext() const;
    void setDisplayContext(int displayContext);

signals:
    void displayContextChanged(int displayContext);

private:
    int m_displayContext = 0;
};

} // namespace Brisken
