#include "virtualeventdispatcher.h"

#include <QCoreApplication>
#include <QThread>
#include <QTimerEvent>

#include <QtDebug>
#include <algorithm>
#include <limits>

// The number of events posted and not yet delivered, over all threads (Qt's own dispatchers ask
// the same when deciding whether to block).
Q_CORE_EXPORT uint qGlobalPostedEventsCount();

namespace Simulator {

namespace {
// A zero-interval timer that re-arms itself forever would keep the clock from ever being idle.
constexpr int MaximumRoundsAtOneTime = 100000;

// `milliseconds` (negative counts as none) after `time`; the clock saturates instead of wrapping
// round, so time never runs backwards.
qint64 later(qint64 time, qint64 milliseconds)
{
    const qint64 step = qMax<qint64>(0, milliseconds);
    return step > std::numeric_limits<qint64>::max() - time ? std::numeric_limits<qint64>::max()
                                                            : time + step;
}
} // namespace

VirtualEventDispatcher::VirtualEventDispatcher(QObject *parent)
    : QAbstractEventDispatcher(parent)
{ }

VirtualEventDispatcher::~VirtualEventDispatcher() = default;

VirtualEventDispatcher *VirtualEventDispatcher::instance()
{
    return qobject_cast<VirtualEventDispatcher *>(QAbstractEventDispatcher::instance());
}

bool VirtualEventDispatcher::deliverPostedEvents()
{
    if (qGlobalPostedEventsCount() == 0)
        return false;
    QCoreApplication::sendPostedEvents();
    // Outside any event loop deleteLater() is only honoured when asked for explicitly.
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return true;
}

int VirtualEventDispatcher::indexOf(int timerId) const
{
    for (int i = 0; i < m_timers.size(); ++i) {
        if (m_timers.at(i).id == timerId)
            return i;
    }
    return -1;
}

qint64 VirtualEventDispatcher::nextDueTime() const
{
    qint64 due = -1;
    for (const Timer &timer : m_timers) {
        if (due < 0 || timer.due < due)
            due = timer.due;
    }
    return due;
}

qint64 VirtualEventDispatcher::startedAt(int timerId) const
{
    const int index = indexOf(timerId);
    return index < 0 ? -1 : m_timers.at(index).since;
}

bool VirtualEventDispatcher::fireNextTimer(qint64 until)
{
    int next = -1;
    for (int i = 0; i < m_timers.size(); ++i) {
        const Timer &timer = m_timers.at(i);
        if (timer.due > until)
            continue;
        if (next < 0 || timer.due < m_timers.at(next).due
            || (timer.due == m_timers.at(next).due && timer.order < m_timers.at(next).order))
            next = i;
    }
    if (next < 0)
        return false;

    Timer &timer = m_timers[next];
    if (timer.due > m_now)
        m_now = timer.due;
    // Re-arm before delivery: the receiver may stop or restart the timer while handling it.
    timer.due = later(m_now, timer.interval);
    timer.order = ++m_order;
    const int id = timer.id;
    QObject *object = timer.object;
    QTimerEvent event(id);
    QCoreApplication::sendEvent(object, &event);
    return true;
}

void VirtualEventDispatcher::runUntilIdle()
{
    for (int round = 0; round < MaximumRoundsAtOneTime; ++round) {
        const bool delivered = deliverPostedEvents();
        const bool fired = fireNextTimer(m_now);
        if (!delivered && !fired)
            return;
    }
    qWarning("Simulator: events keep coming at %lld ms; moving on", m_now);
}

void VirtualEventDispatcher::advance(qint64 milliseconds)
{
    // The clock saturates instead of wrapping round: time never runs backwards.
    const qint64 until = later(m_now, milliseconds);
    runUntilIdle();
    while (fireNextTimer(until))
        runUntilIdle();
    m_now = until;
    runUntilIdle();
}

bool VirtualEventDispatcher::processEvents(QEventLoop::ProcessEventsFlags flags)
{
    emit awake();
    bool handled = deliverPostedEvents();
    if (!(flags & QEventLoop::X11ExcludeTimers))
        handled = fireNextTimer(m_now) || handled;
    if (!handled && (flags & QEventLoop::WaitForMoreEvents)) {
        // Waiting means letting virtual time pass until the next timer.
        const qint64 due = nextDueTime();
        if (due >= 0)
            handled = fireNextTimer(due);
    }
    return handled;
}

bool VirtualEventDispatcher::hasPendingEvents()
{
    return qGlobalPostedEventsCount() > 0;
}

void VirtualEventDispatcher::registerSocketNotifier(QSocketNotifier *)
{
    // The simulated head unit has no sockets; nothing to watch.
}

void VirtualEventDispatcher::unregisterSocketNotifier(QSocketNotifier *) { }

void VirtualEventDispatcher::registerTimer(int timerId, int interval, Qt::TimerType timerType,
                                           QObject *object)
{
    const int existing = indexOf(timerId);
    if (existing >= 0)
        m_timers.removeAt(existing);
    m_timers.append(Timer{timerId, qMax(0, interval), timerType, object,
                          later(m_now, qMax(0, interval)), ++m_order, m_now});
}

bool VirtualEventDispatcher::unregisterTimer(int timerId)
{
    const int index = indexOf(timerId);
    if (index < 0)
        return false;
    m_timers.removeAt(index);
    return true;
}

bool VirtualEventDispatcher::unregisterTimers(QObject *object)
{
    const int before = m_timers.size();
    m_timers.erase(std::remove_if(m_timers.begin(), m_timers.end(),
                                  [object](const Timer &timer) { return timer.object == object; }),
                   m_timers.end());
    return m_timers.size() != before;
}

QList<QAbstractEventDispatcher::TimerInfo> VirtualEventDispatcher::registeredTimers(
        QObject *object) const
{
    QList<TimerInfo> result;
    for (const Timer &timer : m_timers) {
        if (timer.object == object)
            result.append(TimerInfo(timer.id, timer.interval, timer.type));
    }
    return result;
}

int VirtualEventDispatcher::remainingTime(int timerId)
{
    const int index = indexOf(timerId);
    if (index < 0)
        return -1;
    return int(qMax<qint64>(0, m_timers.at(index).due - m_now));
}

void VirtualEventDispatcher::wakeUp()
{
    // Never asleep: posted events are picked up by the next round.
}

void VirtualEventDispatcher::interrupt() { }

void VirtualEventDispatcher::flush() { }

} // namespace Simulator
