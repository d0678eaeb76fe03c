#pragma once

#include <quorvel/statelevel.h>

#include <QAbstractTransition>
#include <QVariant>
#include <QVariantList>

namespace Quorvel {

// The base of the framework's transitions.
//
// Fan-out: a notification (a posted HmiEvent, a signal, a property's change notification, a key
// event) fires every transition it enables, not only the first one per state. A transition is
// enabled when its source state is active (an adopted, source-less one: always), its trigger
// matches and its guard allows. Guards are asked once, when the machine handles the
// notification, in the order in which the transitions were created; the enabled ones then run in
// that order, each as a normal Qt transition (a targeted one exits and enters states, a
// targetless one only emits triggered()). One whose source state is no longer active when its
// turn comes is dropped. Signal and property transitions see every emission of their sender
// (whatever is active), so a property-change transition always knows the previous value.
//
// Guard: when a slot is connected to transitionTest(QEvent*), each test starts from the default
// permission (false unless setAllowTransitionDefault(true)), emits transitionTest, and the
// transition fires only if a slot left setAllowTransition(true). Without a connected slot the
// trigger alone decides.
class HmiAbstractTransition : public QAbstractTransition
{
    Q_OBJECT
public:
    ~HmiAbstractTransition() override;

    void setAllowTransition(bool allow);
    bool allowTransition() const;
    void setAllowTransitionDefault(bool allow);
    bool allowTransitionDefault() const;

    // The data of the notification being tested or fired: the event's value, the signal's
    // argument (a list when it has several), or the property's new value.
    QVariant transitionData() const;

    // Stored for the host; fan-out already gives every enabled transition its turn.
    void makeParallelExclusive(int group);
    int parallelExclusiveGroup() const;
    void setIsVREventTransition(bool isVREvent, const QVariant &data = QVariant());
    bool isVREventTransition() const;
    QVariant vrEventData() const;

    // Set when the host adopts the transition through a root-hierarchy list.
    bool isAdopted() const;
    StateLevel adoptedLevel() const;

signals:
    void transitionTest(QEvent *event);

protected:
    explicit HmiAbstractTransition(QState *source = nullptr);

    // Listens to the HmiEvents of that name.
    void listenToEvent(const QString &eventName);
    // Listens to a signal of `sender` (a method index of its meta-object); false when there is
    // no such signal (a critical message is written).
    bool listenToSignal(const QObject *sender, int signalIndex);

    // The trigger's own test for one notification, asked before the guard (and also while the
    // source is inactive, so that a transition can follow values). `arguments` are the signal's
    // arguments, or the event's value. Returns whether the notification is a match; may set
    // the transition data with setTransitionData().
    virtual bool testTrigger(const QVariantList &arguments);
    void setTransitionData(const QVariant &data);

    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    friend class StateMachinePrivate;
    friend class StateMachine;

    // Asks the connected guard slots; true when there is none.
    bool runGuard(QEvent *event);

    bool m_allow = false;
    bool m_allowDefault = false;
    QVariant m_data;
    int m_parallelExclusive = -1;
    bool m_vrEvent = false;
    QVariant m_vrData;
    bool m_adopted = false;
    StateLevel m_level = StateLevel3;
};

} // namespace Quorvel
