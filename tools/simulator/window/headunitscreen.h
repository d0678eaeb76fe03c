#pragma once

#include <QObject>
#include <QString>
#include <QStringList>
#include <QVariantList>

namespace Simulator {

class VirtualEventDispatcher;

// What the head unit's display shows, read from the framework for the window's QML ("_headUnit"):
// the view on screen, the popups as the framework stacks them, the status bar's transient
// messages and the clock. It follows the platform journal, so it changes as the module asks.
class HeadUnitScreen : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString view READ view NOTIFY changed)
    // One map per popup, bottom first: {"id", "name", "top"}; a popup under another one of its
    // region is still open but covered.
    Q_PROPERTY(QVariantList popups READ popups NOTIFY changed)
    Q_PROPERTY(QStringList transients READ transients NOTIFY changed)
    Q_PROPERTY(qint64 time READ time NOTIFY timeChanged)

public:
    // `ticking`: the clock runs in real time and the screen reads it every second; on the
    // virtual clock it is read after each step.
    HeadUnitScreen(VirtualEventDispatcher *clock, bool ticking, QObject *parent = nullptr);
    ~HeadUnitScreen() override;

    QString view() const { return m_view; }
    QVariantList popups() const { return m_popups; }
    QStringList transients() const { return m_transients; }
    qint64 time() const;

    // Reads everything again; the window calls it after each step and the journal after each
    // change of the screen.
    void refresh();

signals:
    void changed();
    void timeChanged();

private:
    VirtualEventDispatcher *m_clock;
    QString m_view;
    QVariantList m_popups;
    QStringList m_transients;
    qint64 m_time = -1;
};

} // namespace Simulator
