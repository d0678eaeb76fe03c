#pragma once

#include <QAbstractEventDispatcher>
#include <QElapsedTimer>
#include <QList>

namespace Simulator {

// An event dispatcher for the GUI thread that runs on a virtual clock. Posted events are delivered
// as usual; timers fall due on the virtual clock only, which moves when the simulator advances it.
// Nothing ever waits in real time, so a minute of popups and module timers passes in an instant
// and every run of a scenario is the same.
//
// Install it before the application object exists:
//     QCoreApplication::setEventDispatcher(new VirtualEventDispatcher);
class VirtualEventDispatcher : public QAbstractEventDispatcher
{
    Q_OBJECT
public:
    explicit VirtualEventDispatcher(QObject *parent = nullptr);
    ~VirtualEventDispatcher() override;

    // The dispatcher of the current thread, if it is a virtual one.
    static VirtualEventDispatcher *instance();

    // Virtual milliseconds since start.
    qint64 now() const { return m_realTime.isValid() ? m_realTime.elapsed() : m_now; }

    // For a host whose thread runs the platform's own event loop (the window), where timers fall
    // due in real time: the clock is not installed as a dispatcher and now() reads the real
    // milliseconds elapsed since this call.
    void followRealTime() { m_realTime.start(); }

    // Delivers posted events, deferred deletions and the timers due now, until none is left.
    // The clock does not move.
    void runUntilIdle();
    // Lets `milliseconds` of virtual time pass: every timer that falls due on the way fires at its
    // own time, in order of due time and then of arming, with the events it causes delivered
    // before the next one.
    void advance(qint64 milliseconds);
    // The due time of the earliest armed timer, or -1 when none is armed.
    qint64 nextDueTime() const;
    // When the timer was started (a repeating timer runs on from then), or -1 when it is not.
    qint64 startedAt(int timerId) const;

    bool processEvents(QEventLoop::ProcessEventsFlags flags) override;
    bool hasPendingEvents() override;
    void registerSocketNotifier(QSocketNotifier *notifier) override;
    void unregisterSocketNotifier(QSocketNotifier *notifier) override;
    void registerTimer(int timerId, int interval, Qt::TimerType timerType,
                       QObject *object) override;
    bool unregisterTimer(int timerId) override;
    bool unregisterTimers(QObject *object) override;
    QList<TimerInfo> registeredTimers(QObject *object) const override;
    int remainingTime(int timerId) override;
    void wakeUp() override;
    void interrupt() override;
    void flush() override;

private:
    struct Timer
    {
        int id;
        int interval;
        Qt::TimerType type;
        QObject *object;
        qint64 due;
        quint64 order; // arming order among timers of the same due time
        qint64 since; // when it was started
    };

    bool deliverPostedEvents();
    // Fires the earliest timer due at or before `until`; false when there is none.
    bool fireNextTimer(qint64 until);
    int indexOf(int timerId) const;

    QList<Timer> m_timers;
    qint64 m_now = 0;
    QElapsedTimer m_realTime;
    quint64 m_order = 0;
};

} // namespace Simulator
