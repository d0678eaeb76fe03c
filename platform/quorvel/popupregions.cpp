#include "statemachine_p.h"

#include "popupstate.h"

#include <journal/journal.h>

// Popup regions. A popup is open from the moment a request for it is applied until it is
// dismissed (a dismissal request, its auto-dismiss timeout, a dismissing transition or popup) or
// a transition leaves it. Each popup has a slot of its own in its region, so covering a popup
// changes only what is reported on top, never its state: it is not left, its child states stay
// and its transitions keep listening.
//
// Each region keeps its open popups in a stack ordered by priority (a higher value lies above,
// the newest on top among equals). Requests and dismissals change the stack; a PopupSyncEvent
// then opens and closes the slots to match, all in one step. "popup-shown" and "popup-hidden"
// report the top of each region; a popup that closes while covered is reported "popup-closed".

namespace Quorvel {

namespace {

int insertionIndex(const QList<QPointer<PopupState>> &stack, const PopupState *popup)
{
    int index = stack.size();
    while (index > 0 && stack.at(index - 1) && stack.at(index - 1)->priority() > popup->priority())
        --index;
    return index;
}

// The stack is ordered by priority, bottom first.
bool ordered(const QList<QPointer<PopupState>> &stack)
{
    for (int i = 1; i < stack.size(); ++i) {
        if (stack.at(i - 1) && stack.at(i) && stack.at(i - 1)->priority() > stack.at(i)->priority())
            return false;
    }
    return true;
}

void record(const QString &kind, const PopupState *popup)
{
    Platform::Journal::instance()->append(kind, {{QStringLiteral("id"), popup->viewId()}});
}

} // namespace

ArmedTransition::ArmedTransition(const QString &name, QState *source)
    : QAbstractTransition(source)
{
    setObjectName(name);
    setTransitionType(QAbstractTransition::InternalTransition);
}

void ArmedTransition::arm(QEvent *event, QAbstractState *target)
{
    Q_ASSERT(!m_armed);
    setTargetState(target);
    m_armed = event;
}

PopupRegion::PopupRegion(const QString &name, QState *parent)
    : QState(QState::ParallelStates, parent)
{
    setObjectName(name);
}

PopupSlot::PopupSlot(PopupState *popup, PopupRegion *region)
    : QState(region)
    , m_popup(popup)
    , m_closed(new QState(this))
    , m_mover(new ArmedTransition(QStringLiteral("PopupMover"), this))
{
    setObjectName(popup->viewId() + QStringLiteral("Slot"));
    m_closed->setObjectName(popup->viewId() + QStringLiteral("Closed"));
    setInitialState(m_closed);
    popup->setParent(this);
}

PopupState *PopupSlot::popup() const
{
    return m_popup;
}

PopupRegion *StateMachinePrivate::createPopupRegion(const QString &name, QState *parent)
{
    auto *region = new PopupRegion(name, parent);
    regions.append(region);
    QObject::connect(region, &QObject::destroyed, q, [this, region] {
        regions.removeAll(region);
        topsToReport.removeAll(region);
    });
    return region;
}

void StateMachinePrivate::placeInRegion(PopupState *popup, PopupRegion *region)
{
    new PopupSlot(popup, region);
}

PopupSlot *StateMachinePrivate::slotOf(const PopupState *popup)
{
    return popup ? dynamic_cast<PopupSlot *>(popup->parentState()) : nullptr;
}

PopupRegion *StateMachinePrivate::regionOf(const PopupState *popup)
{
    PopupSlot *slot = slotOf(popup);
    return slot ? slot->region() : nullptr;
}

void StateMachinePrivate::registerPopup(PopupState *popup)
{
    popupsById[popup->viewId()].append(popup);
    // A popup made with a layer is made in the layer's region; a global one is placed when the
    // host installs it.
    if (auto *region = dynamic_cast<PopupRegion *>(popup->parent()))
        placeInRegion(popup, region);
}

void StateMachinePrivate::forgetPopup(PopupState *popup)
{
    auto it = popupsById.find(popup->viewId());
    if (it != popupsById.end()) {
        it.value().removeAll(popup);
        if (it.value().isEmpty())
            popupsById.erase(it);
    }
}

PopupState *StateMachinePrivate::popupFor(const QString &viewId) const
{
    const QVector<PopupState *> candidates = popupsById.value(viewId);
    for (PopupState *popup : candidates) {
        if (isActive(regionOf(popup)))
            return popup;
    }
    return candidates.isEmpty() ? nullptr : candidates.first();
}

bool StateMachinePrivate::requestPopup(const QString &viewId, const QVariant &data)
{
    const bool known = popupsById.contains(viewId);
    if (known)
        queueOrPerform({true, viewId, data});
    return known;
}

void StateMachinePrivate::dismissPopup(const QString &viewId)
{
    if (popupsById.contains(viewId))
        queueOrPerform({false, viewId, QVariant()});
}

// Requests and dismissals made while the transitions of one notification run take effect when
// all of them have run; those made while the machine enters or leaves states take effect when
// the step is complete (so a state entering can ask for a popup of its own layer).
void StateMachinePrivate::queueOrPerform(const PopupOp &op)
{
    if (currentBatch)
        batchOps[currentBatch].append(op);
    else if (inMicrostep)
        microstepOps.append(op);
    else
        perform(op);
}

void StateMachinePrivate::perform(const PopupOp &op)
{
    if (!op.request) {
        for (PopupState *popup : popupsById.value(op.viewId))
            dismissPopupNow(popup);
        return;
    }
    PopupState *popup = popupFor(op.viewId);
    PopupRegion *region = regionOf(popup);
    if (!region || !isActive(region))
        return;
    popup->m_data = op.data;
    // A popup already open only moves to the top of its priority group.
    region->stack.removeAll(nullptr);
    region->stack.removeAll(popup);
    region->stack.insert(insertionIndex(region->stack, popup), popup);
    Q_ASSERT(ordered(region->stack));
    scheduleSync(region);
}

void StateMachinePrivate::dismissPopupNow(PopupState *popup)
{
    PopupRegion *region = regionOf(popup);
    if (region && (region->stack.removeAll(popup) > 0 || isActive(popup)))
        scheduleSync(region);
}

void StateMachinePrivate::scheduleSync(PopupRegion *region)
{
    if (!q->isRunning() || region->syncPending)
        return;
    region->syncPending = true;
    q->QStateMachine::postEvent(new PopupSyncEvent(region), QStateMachine::HighPriority);
}

// Arms the slot of each popup whose state differs from the stack: the machine opens and closes
// them all in the step of this event. When none differs (a popup already open moved up), only
// the top is reported.
void StateMachinePrivate::syncRegion(PopupRegion *region, QEvent *event)
{
    region->syncPending = false;
    if (!isActive(region))
        return;
    region->stack.removeAll(nullptr);
    Q_ASSERT(armedSlots.isEmpty());
    for (QObject *child : region->children()) {
        auto *slot = dynamic_cast<PopupSlot *>(child);
        if (!slot || !slot->popup())
            continue;
        const bool open = region->stack.contains(slot->popup());
        if (open != isActive(slot->popup())) {
            slot->mover()->arm(event,
                               open ? static_cast<QAbstractState *>(slot->popup())
                                    : slot->closedState());
            armedSlots.append(slot);
        }
    }
    markTopToReport(region);
    if (armedSlots.isEmpty())
        reportTops();
    else
        Q_ASSERT(!router->isArmed()); // one step opens and closes the slots, nothing else
}

void StateMachinePrivate::popupEntered(PopupState *popup)
{
    if (PopupRegion *region = regionOf(popup)) {
        QList<QPointer<PopupState>> &stack = region->stack;
        stack.removeAll(nullptr);
        // Entered by a module transition rather than by a request: open now.
        if (!stack.contains(popup))
            stack.insert(insertionIndex(stack, popup), popup);
        Q_ASSERT(ordered(stack));
        if (stack.last() == popup && region->shown != popup)
            putOnTop(region, popup);
    }
    for (const QPointer<PopupState> &dismissed : qAsConst(popup->m_dismissesWhenShown)) {
        if (dismissed)
            dismissPopupNow(dismissed);
    }
}

void StateMachinePrivate::popupExited(PopupState *popup)
{
    PopupRegion *region = regionOf(popup);
    if (!region)
        return;
    // Closed by the framework, or left by a transition: no longer open either way.
    region->stack.removeAll(popup);
    if (region->shown == popup) {
        region->shown = nullptr;
        record(QStringLiteral("popup-hidden"), popup);
        emit q->popupHidden(popup);
        markTopToReport(region);
    } else {
        record(QStringLiteral("popup-closed"), popup);
    }
}

// Reports the regions whose top changed without a popup entering on top: a covered popup shows
// again, or one that is already open moved up.
void StateMachinePrivate::reportTops()
{
    const QVector<PopupRegion *> regionsToReport = topsToReport;
    topsToReport.clear();
    for (PopupRegion *region : regionsToReport)
        reportTop(region);
}

void StateMachinePrivate::markTopToReport(PopupRegion *region)
{
    if (!topsToReport.contains(region))
        topsToReport.append(region);
}

void StateMachinePrivate::reportTop(PopupRegion *region)
{
    PopupState *top = nullptr;
    if (isActive(region)) {
        for (int i = region->stack.size() - 1; i >= 0 && !top; --i) {
            if (isActive(region->stack.at(i)))
                top = region->stack.at(i);
        }
    }
    // A popup reported on top is open, or was reported hidden when it closed.
    Q_ASSERT(!region->shown || isActive(region->shown));
    if (top != region->shown)
        putOnTop(region, top);
}

// The popup shown on top of the region changes: the one there is hidden (it stays open,
// covered), `top` (if any) is shown.
void StateMachinePrivate::putOnTop(PopupRegion *region, PopupState *top)
{
    if (region->shown) {
        record(QStringLiteral("popup-hidden"), region->shown);
        emit q->popupHidden(region->shown);
    }
    region->shown = top;
    if (top) {
        record(QStringLiteral("popup-shown"), top);
        emit q->popupShown(top);
    }
}

QStringList StateMachinePrivate::openPopups() const
{
    QStringList open;
    for (PopupRegion *region : regions) {
        for (const QPointer<PopupState> &popup : region->stack) {
            if (isActive(popup))
                open.append(popup->viewId());
        }
    }
    return open;
}

} // namespace Quorvel
