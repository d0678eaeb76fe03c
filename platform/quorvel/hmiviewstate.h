#pragma once

#include <quorvel/hmistate.h>

#include <QList>
#include <QPointer>
#include <QSharedPointer>

namespace Quorvel {

class HmiTargetFilter;

// A state whose view is on screen while it is active: entering it shows the view (journal
// "view" {id}) and makes it the active view state.
//
// Back navigation (StateMachine::back, reached through the view controller): every view state
// entered that has a back-stack presence is pushed on the back stack; going back n steps pops
// entries and enters the one reached. The settings:
//   setHasBackStackPresence(false)   the view is never pushed;
//   setBackTargetProviderState(s)    back from this view (when it is not on the stack) goes
//                                    where back from the view state s would go (to s itself
//                                    when s is no view state);
//   createDirectBackTransition(s)    back from this view goes straight to s;
//   setBackStackStateId(id, unique)  going back to this view enters the state named id instead
//                                    (so a component can choose its screen again); when unique
//                                    is true, entering the view drops its older entries;
//   addBackTargetFilter(f)           back from this view skips the entries f refuses;
//   setHandlesBackEvent(true)        the view answers the back key itself (its view calls back).
class HmiViewState : public HmiState
{
    Q_OBJECT
public:
    HmiViewState(const QString &viewId, const QString &name, QState *parent = nullptr);
    // A view state named after its view.
    explicit HmiViewState(const QString &viewId, QState *parent = nullptr);
    ~HmiViewState() override;

    // A view state that shows no view (a landing place that hands over to someone else).
    // `viewIndex` is kept for the host; `hasBackStackPresence` sets the back-stack presence.
    static HmiViewState *createDummyViewState(const QString &name, QState *parent,
                                              int viewIndex = -1,
                                              bool hasBackStackPresence = false);

    QString targetView() const;
    bool isDummy() const;

    // The view state on screen, or null.
    static HmiViewState *activeViewState();
    // The name of the view state shown before the one on screen (or being entered).
    static QString lastKnownViewState();

    void setHandlesBackEvent(bool handles);
    bool handlesBackEvent() const;
    void setBackStackStateId(const QString &stateId, bool unique);
    QString backStackStateId() const;
    bool backStackEntryUnique() const;
    void setHasBackStackPresence(bool presence);
    bool hasBackStackPresence() const;
    void setBackTargetProviderState(QAbstractState *state);
    QAbstractState *backTargetProviderState() const;
    void createDirectBackTransition(QAbstractState *target);
    QAbstractState *directBackTarget() const;
    void addBackTargetFilter(const QSharedPointer<HmiTargetFilter> &filter);
    QList<QSharedPointer<HmiTargetFilter>> backTargetFilters() const;

protected:
    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

private:
    QString m_viewId;
    bool m_dummy = false;
    int m_viewIndex = -1;
    bool m_handlesBackEvent = false;
    QString m_backStackStateId;
    bool m_backStackEntryUnique = false;
    bool m_hasBackStackPresence = true;
    QPointer<QAbstractState> m_backTargetProvider;
    QPointer<QAbstractState> m_directBackTarget;
    QList<QSharedPointer<HmiTargetFilter>> m_filters;
};

} // namespace Quorvel
