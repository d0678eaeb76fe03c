#pragma once

#include <QObject>
#include <QString>
#include <QStringList>

namespace Brisken {

// The status bar: shows and hides transient messages, and tells whether it is visible at all.
// Shared through the DataStore under "StatusBarController"; a host may run without one.
class StatusBarController : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool statusBarVisible READ statusBarVisible NOTIFY statusBarVisibleChanged)
public:
    explicit StatusBarController(QObject *parent = nullptr);
    ~StatusBarController() override;

    virtual void requestTransientWidget(const QString &name, int value);
    virtual void hideTransientWidget(const QString &name);
    // The transients requested and not hidden since, oldest first.
    QStringList transientWidgets() const { return m_transients; }
    // Host side: forget the shown transients without hiding them one by one.
    void clearTransientWidgets() { m_transients.clear(); }

    bool statusBarVisible() const { return m_visible; }
    void setStatusBarVisible(bool visible);

signals:
    void statusBarVisibleChanged(bool visible);

private:
    QStringList m_transients;
    bool m_visible = true;
};

} // namespace Brisken
