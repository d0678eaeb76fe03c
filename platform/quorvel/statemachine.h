#pragma once

#include <quorvel/statelevel.h>

#include <QList>
#include <QPair>
#include <QStateMachine>
#include <QStringList>
#include <QVariant>

class QAbstractTransition;

namespace Quorvel {

class HmiState;
class HmiViewState;
class PopupState;
class StateMachinePrivate;

// The HMI's single state machine.
//
// Its root hierarchy is built when the instance is made:
//
//   "StateLevel1" > "StateLevel2" > "StateLevel3" > "RootLayers" (parallel)
//                                                     |- "Screens"  the host's screens and the
//                                                     |             parent states it hands to
//                                                     |             modules (initially
//                                                     "ScreensIdle")
//                                                     '- "Popups"   the global popup region
//
// A popup region (the global one, and the layer of each layered state) holds the popups open in
// it, on top or covered, each an active state; a closed popup is no state of the running
// configuration, so what a region costs follows the popups open, not those declared (see
// PopupState for when a popup opens and closes, popupregions.cpp for how).
//
// Host side, in this order:
//   1. add screens under screensState() (and setInitialHmiState() on it), hand it to modules;
//   2. installRootHierarchy() with each module's two root-hierarchy lists;
//   3. start() (QStateMachine::start, asynchronous: run the event loop).
// Tests and the simulator call destroyInstance() between cases: it stops the machine and deletes
// it with its whole state tree (adopted popups and transitions included); the next instance()
// builds a fresh machine.
//
// Notifications fan out: one HmiEvent, signal emission, property change or key event fires every
// framework transition it enables, in creation order (see HmiAbstractTransition).
class StateMachine : public QStateMachine
{
    Q_OBJECT
public:
    using RootHierarchyTransitions = QList<QPair<StateLevel, QAbstractTransition *>>;
    using RootHierarchyPopupStates = QList<QPair<StateLevel, PopupState *>>;

    // The type of the event with which back navigation (back(), direct back transitions) enters
    // its target; any other entry comes with another event.
    static constexpr QEvent::Type BackEventType = static_cast<QEvent::Type>(QEvent::User + 263);

    static StateMachine *instance();
    // The instance if one exists, without making one.
    static StateMachine *existingInstance();
    // Stops and deletes the machine with its state tree.
    static void destroyInstance();

    ~StateMachine() override;

    HmiState *levelState(StateLevel level) const;
    // The screens region: the host's screens and the parent states of the modules go here.
    HmiState *screensState() const;
    // The global popup region (a parallel state of popup slots, managed by the framework).
    QState *popupRegion() const;

    // Installs a module's root-hierarchy lists. Each popup joins the global popup region. Each
    // transition without a source state is adopted at its level: it is armed whatever is shown,
    // and a targeted one leaves only the active states below the deepest active proper ancestor
    // of its target (the target itself when it is active) before entering the target, so shown
    // popups stay. A listed transition that has a source state stays on it. Everything installed
    // becomes owned by the machine's tree.
    void installRootHierarchy(const RootHierarchyTransitions &transitions,
                              const RootHierarchyPopupStates &popups);

    // Posts an event to the machine. Every HmiEvent posted, by whoever posts it, is journaled
    // once as "event" {name, value} when posted. Events posted before the machine runs wait for
    // it and are posted, in order, when it has started (Qt's own postEvent drops them); they are
    // dropped with the machine if it is destroyed first.
    void postEvent(QEvent *event, EventPriority priority = NormalPriority);

    // Popups, by view identifier (the view controller's requests end here).
    // Returns false when no popup state carries the identifier (nothing is entered then). A
    // request that cannot be honoured is journaled as "popup-dropped" {id, reason} and warned.
    // Requests and dismissals made while the transitions of one notification run take effect
    // after all of them have run, in the order made.
    bool requestPopup(const QString &viewId, const QVariant &data = QVariant());
    void dismissPopup(const QString &viewId);
    PopupState *popupState(const QString &viewId) const;
    // The popups on screen (the top of each active popup region), in region creation order.
    QStringList shownPopups() const;
    // The popups open, on top or covered: region by region in creation order, bottom first.
    QStringList openPopups() const;
    // The popups requested and not dismissed in the region of `viewId`'s popup, bottom first.
    QStringList popupStack(const QString &viewId) const;
    // The driver answered the popup (a view's button made its controller call). Once the events
    // posted so far have been handled, the popup closes if it is still open and the module
    // leaves its closing to the framework: it has no transition of its own.
    void popupAnswered(const QString &viewId);
    // The popup regions, in creation order (the global one first), and the popups that open in
    // one while its layer is active (for tools that draw the chart).
    QList<QState *> popupRegions() const;
    QList<PopupState *> regionPopups(const QState *region) const;

    // Moves to `target` as an adopted transition would: leaves the active states below the
    // deepest active proper ancestor of `target`, then enters it. Asynchronous.
    void goToState(QAbstractState *target);

    // Back navigation through the views shown (see HmiViewState for the per-view settings).
    // Returns false when there is nothing to go back to.
    bool back(int steps = 1);
    // The most views the back stack keeps: the oldest drop off.
    static constexpr int BackStackDepth = 50;
    // The view states in the back stack, by state name, bottom first.
    QStringList backStack() const;
    // Finds the view state that shows the view `nameOrViewId`, or else the state of that name.
    QAbstractState *findViewTarget(const QString &nameOrViewId) const;

signals:
    void viewStateEntered(Quorvel::HmiViewState *state);
    void popupShown(Quorvel::PopupState *popup);
    void popupHidden(Quorvel::PopupState *popup);

protected:
    void beginSelectTransitions(QEvent *event) override;
    void endSelectTransitions(QEvent *event) override;
    void beginMicrostep(QEvent *event) override;
    void endMicrostep(QEvent *event) override;

private:
    explicit StateMachine(QObject *parent = nullptr);

    friend class StateMachinePrivate;
    StateMachinePrivate *d;
};

} // namespace Quorvel
