#pragma once

// Inner workings of the HMI state machine shared by the framework's state and transition
// classes. Not part of the module's API.

#include <quorvel/statemachine.h>

#include <QEvent>
#include <QHash>
#include <QPointer>
#include <QSet>
#include <QState>
#include <QVector>

namespace Quorvel {

class HmiAbstractTransition;
class HmiViewState;
class NamedState;
class PopupState;
class StateMachinePrivate;

// Asks one transition to fire, as its turn in the fan-out of one notification.
class FireEvent : public QEvent
{
public:
    FireEvent(HmiAbstractTransition *transition, quint64 batch, const QVariant &data);
    static QEvent::Type eventType();

    QPointer<HmiAbstractTransition> transition;
    quint64 batch;
    QVariant data;
};

// A popup region: the framework enters the top popup of its stack, or its idle state.
class PopupRegion : public QState
{
public:
    PopupRegion(const QString &name, QState *parent);
    QState *idleState() const { return m_idle; }

protected:
    void onExit(QEvent *event) override;

private:
    QState *m_idle;
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
    PopupRegion *createPopupRegion(const QString &name, QState *parent);
    bool isActive(const QAbstractState *state) const;

    // Transitions: trigger index and fan-out.
    quint64 nextSequence() { return ++m_sequence; }
    void listenToEvent(HmiAbstractTransition *transition, const QString &eventName);
    bool listenToSignal(HmiAbstractTransition *transition, const QObject *sender, int signalIndex);
    void forget(HmiAbstractTransition *transition);
    void dispatchSignal(SignalRelay *relay, void **argv);
    void notify(const QVector<HmiAbstractTransition *> &listeners, const QVariantList &arguments,
                QEvent *testEvent);
    void beginSelect(QEvent *event);
    void endMicrostep(QEvent *event);
    QState *domainFor(QAbstractState *target) const;

    // Names.
    void registerName(NamedState *state, const QString &name);
    void forgetName(NamedState *state);
    NamedState *stateForName(const QString &name) const;

    // Views and back stack.
    void viewEntered(HmiViewState *view);
    void viewExited(HmiViewState *view);
    bool back(int steps);

    // Popups.
    void registerPopup(PopupState *popup);
    void forgetPopup(PopupState *popup);
    PopupState *popupFor(const QString &viewId) const;
    bool requestPopup(const QString &viewId, const QVariant &data);
    void dismissPopup(const QString &viewId);
    void dismissPopupNow(PopupState *popup);
    void popupEntered(PopupState *popup);
    void popupExited(PopupState *popup);
    void regionExited(PopupRegion *region);
    void scheduleSync(PopupRegion *region);

    void goToState(QAbstractState *target);

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

    quint64 m_sequence = 0;
    QHash<QString, QVector<HmiAbstractTransition *>> eventListeners;
    QHash<QPair<const QObject *, int>, SignalRelay *> relays;
    QHash<QString, QVector<NamedState *>> names;

    QPointer<HmiViewState> activeView;
    QString lastKnownView;
    QList<QPointer<HmiViewState>> backStack;

    QHash<QString, QVector<PopupState *>> popupsById;
    QVector<PopupRegion *> regions; // creation order
    QHash<PopupRegion *, QList<QPointer<PopupState>>> stacks;
    QSet<PopupRegion *> syncPending;
    PopupRegion *syncingRegion = nullptr;

    quint64 m_batch = 0;
    quint64 currentBatch = 0;
    QHash<quint64, QList<PopupOp>> batchOps;
    QList<PopupOp> microstepOps;
    bool inMicrostep = false;

    QAbstractTransition *router = nullptr;
    // Adopted framework transitions wait on this never-active state, so that the machine does
    // not look at them for other notifications; each is moved to its level (or to its target's
    // domain) for its own turn only.
    QState *adoptedHolder = nullptr;
    QPointer<HmiAbstractTransition> movedTransition;
    void parkMovedTransition();
};

} // namespace Quorvel
