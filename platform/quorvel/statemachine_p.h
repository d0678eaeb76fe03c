#pragma once

// Inner workings of the HMI state machine shared by the framework's state and transition
// classes. Not part of the module's API.

#include <quorvel/statemachine.h>

#include <QAbstractTransition>
#include <QEvent>
#include <QHash>
#include <QPointer>
#include <QSet>
#include <QState>
#include <QVector>

namespace Quorvel {

class HmiAbstractTransition;
class HmiLayeredState;
class HmiViewState;
class NamedState;
class PopupRegion;
class PopupState;
class StateMachinePrivate;

// The framework's own events. Each is posted at high priority, so it is handled before any
// module event still waiting.

// One enabled transition of a notification, with the data it fires with.
struct FireEntry
{
    QPointer<HmiAbstractTransition> transition;
    QVariant data;
};
// A turn in the fan-out of one notification: the transitions that fire together, for one event
// (one targeted transition, or a run of targetless ones next to each other in creation order).
using FireTurn = QVector<FireEntry>;

// Asks for one turn of a notification's fan-out; `last` closes the notification.
class FireEvent : public QEvent
{
public:
    FireEvent(const FireTurn &turn, quint64 batch, bool last);
    static QEvent::Type eventType() { return s_type; }

    FireTurn turn;
    quint64 batch;
    bool last;

private:
    static const QEvent::Type s_type;
};

// Fires a run of targetless transitions as one transition: the machine takes it for the turn's
// event only, and it emits each transition's triggered() in creation order.
class FanOutTransition : public QAbstractTransition
{
public:
    FanOutTransition(StateMachinePrivate *d, QState *source);
    void arm(QEvent *event, const FireTurn &turn);
    void disarm();
    bool isArmed() const { return m_armed; }

protected:
    bool eventTest(QEvent *event) override { return event == m_armed; }
    void onTransition(QEvent *) override;

private:
    StateMachinePrivate *d;
    QEvent *m_armed = nullptr;
    FireTurn m_turn;
};

// Wakes the machine for the framework's own work waiting in StateMachinePrivate::pending (see
// fanout.cpp): what its eventless selections have not taken by then, it takes.
class WakeEvent : public QEvent
{
public:
    WakeEvent();
    static QEvent::Type eventType() { return s_type; }

private:
    static const QEvent::Type s_type;
};

// Moves the machine to a state (navigation). A move made by back navigation has the type
// StateMachine::BackEventType, so that the states entered can tell a return from a fresh entry.
class RouteEvent : public QEvent
{
public:
    RouteEvent(QAbstractState *target, QEvent::Type type);
    static QEvent::Type eventType() { return s_type; }

    QPointer<QAbstractState> target;

private:
    static const QEvent::Type s_type;
};

// Opens and closes the popups of one region as its stack says.
class PopupSyncEvent : public QEvent
{
public:
    explicit PopupSyncEvent(PopupRegion *region);
    static QEvent::Type eventType() { return s_type; }

    QPointer<PopupRegion> region;

private:
    static const QEvent::Type s_type;
};

// The driver answered a popup: posted behind the events its answer posted, it closes the popup
// then if the module leaves its closing to the framework and it is still open.
class PopupAnsweredEvent : public QEvent
{
public:
    explicit PopupAnsweredEvent(const QString &viewId);
    static QEvent::Type eventType() { return s_type; }

    QString viewId;

private:
    static const QEvent::Type s_type;
};

// A framework transition that the machine takes for one event only: the event it is armed with.
class ArmedTransition : public QAbstractTransition
{
public:
    ArmedTransition(const QString &name, QState *source);
    void arm(QEvent *event, QAbstractState *target);
    // One more target for the event it is armed with (a slot opening several popups at once).
    void addTarget(QAbstractState *target);
    void disarm() { m_armed = nullptr; }
    bool isArmed() const { return m_armed; }

protected:
    bool eventTest(QEvent *event) override { return m_armed && event == m_armed; }
    void onTransition(QEvent *) override { }

private:
    QEvent *m_armed = nullptr;
};

class PopupRegion;

// The place of one open popup in its region: the popup, or nothing (its empty state).
class PopupHolder : public QState
{
public:
    PopupHolder(PopupRegion *region, QState *link, int index);
    PopupRegion *region() const { return m_region; }
    QState *emptyState() const { return m_empty; }
    ArmedTransition *mover() const { return m_mover; }

    // The popup put here: open, or opening in the step under way.
    QPointer<PopupState> occupant;

private:
    PopupRegion *m_region;
    QState *m_empty;
    ArmedTransition *m_mover;
};

// One step of a region's chain: vacant, or a link (a parallel pair of a holder and the next
// slot). Its mover opens popups in the holders below it, or closes every link below it.
class PopupSlot : public QState
{
public:
    PopupSlot(const QString &name, QState *parent);
    QState *vacantState() const { return m_vacant; }
    ArmedTransition *mover() const { return m_mover; }

    QState *link = nullptr; // made when the chain first grows this deep

private:
    QState *m_vacant;
    ArmedTransition *m_mover;
};

// A popup region: the global one, or the layer of a layered state. See popupregions.cpp for how
// its chain of places holds the open popups. The stack orders the open popups by priority; its
// top is the one shown.
class PopupRegion : public PopupSlot
{
public:
    PopupRegion(const QString &name, QState *parent);

    // Grows the chain by one link: a holder and the slot after it.
    void extend();

    // The chain: slotChain[0] is the region itself; holders[i] and slotChain[i + 1] form the link
    // below slotChain[i]. Links are made as the chain first grows and kept for later.
    QVector<PopupSlot *> slotChain;
    QVector<PopupHolder *> holders;
    // The popups open or about to open (requested and not dismissed), bottom first.
    QList<QPointer<PopupState>> stack;
    // The popup last reported on top ("popup-shown"), until it is reported hidden.
    QPointer<PopupState> shown;
    bool syncPending = false;
};

// Forwards each emission of one signal of one sender to the dispatcher, with its arguments.
class SignalRelay : public QObject
{
public:
    SignalRelay(StateMachinePrivate *d, const QObject *sender, int signalIndex);
    int qt_metacall(QMetaObject::Call call, int id, void **argv) override;

    StateMachinePrivate *d;
    const QObject *sender;
    int signalIndex;
    QVector<int> parameterTypes;
    QVector<HmiAbstractTransition *> listeners;
};

class StateMachinePrivate
{
public:
    explicit StateMachinePrivate(StateMachine *machine);
    ~StateMachinePrivate();

    // The instance's private part, making the instance if needed / only if it exists.
    static StateMachinePrivate *get();
    static StateMachinePrivate *existing();

    void build();
    bool isActive(const QAbstractState *state) const;
    // The deepest active exclusive ancestor of `target`: a transition placed there leaves only
    // what lies below it before entering `target`.
    QState *domainFor(QAbstractState *target) const;

    // Posting (statemachine.cpp): every HmiEvent is journaled when posted; events posted before
    // the machine runs wait for it.
    void post(QEvent *event, QStateMachine::EventPriority priority);
    void postHeld();

    // Notifications and their fan-out (fanout.cpp).
    void listenToEvent(HmiAbstractTransition *transition, const QString &eventName);
    bool listenToSignal(HmiAbstractTransition *transition, const QObject *sender, int signalIndex);
    void forget(HmiAbstractTransition *transition);
    void dispatchSignal(SignalRelay *relay, void **argv);
    void notify(const QVector<HmiAbstractTransition *> &listeners, const QVariantList &arguments,
                QEvent *testEvent, QEvent *current = nullptr);
    bool takeTurn(const FireTurn &turn, QEvent *event);
    void fireTargetless(const FireTurn &turn);
    void finishBatch();
    // The framework's own work, in order: turns of notifications and popup syncs wait in
    // `pending` and are taken by the machine's eventless selections, one step each; behind an
    // event of the framework's still in Qt's queue (a route), they are posted after it instead.
    struct PendingWork
    {
        FireTurn turn;
        quint64 batch = 0;
        bool last = false;
        QPointer<PopupRegion> sync;
    };
    void queueWork(const PendingWork &work);
    bool takePending(QEvent *event);
    void postInternal(QEvent *event);
    void beginSelect(QEvent *event);
    void endSelect();
    void endMicrostep();

    // The turn of one fired transition (adoption.cpp): adopted ones and those that leave an open
    // popup are moved for that turn only.
    void placeForTurn(HmiAbstractTransition *transition, QEvent *fire);
    void moveForTurn(HmiAbstractTransition *transition, QState *domain);
    void parkMovedTransition();

    // Names.
    void registerName(NamedState *state, const QString &name);
    void forgetName(NamedState *state);
    NamedState *stateForName(const QString &name) const;

    // Views and back stack (backstack.cpp).
    void viewEntered(HmiViewState *view);
    void viewExited(HmiViewState *view);
    bool back(int steps);
    void goToState(QAbstractState *target, QEvent::Type type = QEvent::None);
    void route(QEvent *event, QAbstractState *target);

    // Popups (popupregions.cpp).
    PopupRegion *createPopupRegion(const QString &name, QState *parent);
    void setHomeRegion(PopupState *popup, PopupRegion *region);
    // The region a popup is open in, or else the one it would open in now.
    PopupRegion *regionOf(const PopupState *popup) const;
    int activeLinks(const PopupRegion *region) const;
    QState *placePopup(PopupState *popup, PopupRegion *region, QEvent *event);
    void closeInStep(PopupState *popup, QEvent *event);
    void arm(ArmedTransition *mover, QEvent *event, QAbstractState *target);
    void settlePopups();
    void regionExited(PopupRegion *region);
    bool leavesClosingToFramework(const PopupState *popup) const;
    void closeAnsweredPopup(const QString &viewId);
    void checkPopupInvariants() const;
    // Where a popup waits when it is made: a layer's popup closed in the parking state, a global
    // one without a parent until the host installs it.
    QState *homeParent(HmiLayeredState *layer) const { return layer ? popupParking : nullptr; }
    void registerPopup(PopupState *popup);
    void forgetPopup(PopupState *popup);
    PopupState *popupFor(const QString &viewId) const;
    bool requestPopup(const QString &viewId, const QVariant &data);
    void dismissPopup(const QString &viewId);
    void dismissPopupNow(PopupState *popup);
    void popupEntered(PopupState *popup);
    void popupExited(PopupState *popup);
    void scheduleSync(PopupRegion *region);
    void syncRegion(PopupRegion *region, QEvent *event);
    void markTopToReport(PopupRegion *region);
    void reportTop(PopupRegion *region);
    void putOnTop(PopupRegion *region, PopupState *top);
    void reportTops();
    QStringList openPopups() const;

    struct PopupOp
    {
        bool request;
        QString viewId;
        QVariant data;
    };
    void perform(const PopupOp &op);
    void queueOrPerform(const PopupOp &op);

    StateMachine *q;
    HmiState *levels[3] = {nullptr, nullptr, nullptr};
    HmiState *screens = nullptr;
    PopupRegion *popups = nullptr;
    QList<QEvent *> held; // posted before the machine ran, in posting order

    QHash<QString, QVector<HmiAbstractTransition *>> eventListeners;
    QHash<QPair<const QObject *, int>, SignalRelay *> relays;
    // The senders whose destruction removes their relays; the watch ends with this object.
    QSet<const QObject *> watchedSenders;
    QObject senderWatch;
    QHash<QString, QVector<NamedState *>> names;

    QPointer<HmiViewState> activeView;
    QString lastKnownView; // the name of the view state shown before the current one
    QList<QPointer<HmiViewState>> backStack;

    QHash<QString, QVector<PopupState *>> popupsById;
    QVector<PopupRegion *> regions; // creation order
    QVector<PopupRegion *> topsToReport; // regions whose top may have changed, in that order
    // The movers armed for the step under way, and the popups placed or left in it.
    QVector<ArmedTransition *> armedMovers;
    QVector<QPointer<PopupState>> unsettled;
    // Closed popups wait on this never-active state: they cost nothing while closed.
    QState *popupParking = nullptr;

    QList<PendingWork> pending;
    int queuedInQt = 0; // the framework's events posted to Qt's queue and not yet taken
    bool wakePending = false;
    bool inLoop = false; // selecting or stepping: an eventless selection follows a step

    quint64 m_batch = 0;
    quint64 currentBatch = 0;
    // The turn being taken closes its notification; whether the machine takes a step for it.
    bool lastTurn = false;
    bool turnSteps = false;
    FanOutTransition *fanOut = nullptr;
    QPointer<HmiAbstractTransition> armedTransition;
    QHash<quint64, QList<PopupOp>> batchOps;
    QList<PopupOp> microstepOps;
    bool inMicrostep = false;

    ArmedTransition *router = nullptr;
    // Adopted framework transitions wait on this never-active state, so that the machine does
    // not look at them for other notifications; each is moved to its level (or to its target's
    // domain) for its own turn only, as is a transition that leaves an open popup.
    QState *adoptedHolder = nullptr;
    QPointer<HmiAbstractTransition> movedTransition;
    QPointer<QState> movedFrom;
    QAbstractTransition::TransitionType movedType = QAbstractTransition::ExternalTransition;
};

} // namespace Quorvel
