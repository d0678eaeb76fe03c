#include "statemachine_p.h"

#include "hmilayeredstate.h"
#include "popupstate.h"

#include <journal/journal.h>

#include <QLoggingCategory>

// Popup regions.
//
// What the driver sees. A popup is open from the moment a request for it is applied until it is
// dismissed (a dismissal request, its auto-dismiss timeout, a dismissing transition or popup, or
// the driver's answer when the module leaves its closing to the framework) or a transition leaves
// it. The open popups of a region stack by priority (a higher value lies above, the newest on top
// among equals); the top one is shown. Covering a popup changes only what is reported on top,
// never its state: it is not left, its child states stay and its transitions keep listening.
// "popup-shown" and "popup-hidden" report the top of each region; a popup that closes while
// covered is reported "popup-closed".
//
// How the machine holds them. Qt's transition selection sorts every active atomic state on each
// event, so what a region costs must follow the popups open in it, not those declared. A region
// is a chain of places, grown as deep as the most popups it has had open at once:
//
//   region (exclusive) -+- vacant
//                       '- link 0 (parallel) -+- holder 0 (exclusive) -+- empty
//                                             |                        '- the popup open here
//                                             '- slot 1 (exclusive) -+- vacant
//                                                                    '- link 1 -+- holder 1 ...
//                                                                               '- slot 2 ...
//
// A popup opens in the first holder of an active link that holds nothing; with none free, the
// last active slot's mover enters it in the next holder, which enters the link beside it and
// leaves nothing but the slot's vacant state. A popup closes by its holder's mover, which leaves
// nothing outside the holder. When no popup stays open in a link or below it, the slot above the
// link closes it all at once, back to vacant. A closed popup waits in the machine's parking
// state, which is never active: it is put in a holder when it opens and parked again after the
// step in which it closed (never during a step).
//
// Requests and dismissals change a region's stack; a sync of the region then opens and closes the
// popups to match, all in one step.
//
// Where a popup opens: a layer's popup in its layered state's region while that state is active;
// otherwise (a layer's popup asked for from another screen, and every global popup) in the global
// region, where a layer's popup stays until it is dismissed or its layer, once entered, is left.
//
// Invariants between steps (checkPopupInvariants): an open popup lies in a holder of an active
// link of its region and occupies it; every other holder of an active link is empty, and the
// holders below the active links are free; a closed popup lies in the parking state; the last
// active link holds an open popup unless a sync is pending. So a region with nothing open costs
// two active states, and each open popup adds at most four (link, holder, the popup or an empty
// state, the next slot) beside its own.

Q_DECLARE_LOGGING_CATEGORY(quorvelLog)

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

// A request the framework cannot honour is said, never dropped silently.
void recordDropped(const QString &viewId, const QString &reason)
{
    qCWarning(quorvelLog).noquote() << "popup" << viewId << "dropped:" << reason;
    Platform::Journal::instance()->append(
            QStringLiteral("popup-dropped"),
            {{QStringLiteral("id"), viewId}, {QStringLiteral("reason"), reason}});
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

void ArmedTransition::addTarget(QAbstractState *target)
{
    Q_ASSERT(m_armed);
    QList<QAbstractState *> targets = targetStates();
    targets.append(target);
    setTargetStates(targets);
}

PopupHolder::PopupHolder(PopupRegion *region, QState *link, int index)
    : QState(link)
    , m_region(region)
    , m_empty(new QState(this))
    , m_mover(new ArmedTransition(QStringLiteral("PopupMover"), this))
{
    setObjectName(region->objectName() + QStringLiteral("Holder%1").arg(index));
    m_empty->setObjectName(objectName() + QStringLiteral("Empty"));
    setInitialState(m_empty);
}

PopupSlot::PopupSlot(const QString &name, QState *parent)
    : QState(parent)
    , m_vacant(new QState(this))
    , m_mover(new ArmedTransition(QStringLiteral("PopupMover"), this))
{
    setObjectName(name);
    m_vacant->setObjectName(name + QStringLiteral("Vacant"));
    setInitialState(m_vacant);
}

PopupRegion::PopupRegion(const QString &name, QState *parent)
    : PopupSlot(name, parent)
{
    slotChain.append(this);
}

void PopupRegion::extend()
{
    const int index = holders.size();
    PopupSlot *last = slotChain.last();
    auto *link = new QState(QState::ParallelStates, last);
    link->setObjectName(objectName() + QStringLiteral("Link%1").arg(index));
    holders.append(new PopupHolder(this, link, index));
    slotChain.append(new PopupSlot(objectName() + QStringLiteral("Slot%1").arg(index + 1), link));
    last->link = link;
}

PopupRegion *StateMachinePrivate::createPopupRegion(const QString &name, QState *parent)
{
    auto *region = new PopupRegion(name, parent);
    regions.append(region);
    QObject::connect(region, &QAbstractState::exited, q, [this, region] { regionExited(region); });
    QObject::connect(region, &QObject::destroyed, q, [this, region] {
        regions.removeAll(region);
        topsToReport.removeAll(region);
    });
    return region;
}

void StateMachinePrivate::setHomeRegion(PopupState *popup, PopupRegion *region)
{
    popup->m_home = region;
    popup->setParent(popupParking);
}

PopupRegion *StateMachinePrivate::regionOf(const PopupState *popup) const
{
    if (!popup)
        return nullptr;
    if (popup->m_holder)
        return popup->m_holder->region();
    auto *home = static_cast<PopupRegion *>(popup->m_home.data());
    return !home || isActive(home) ? home : popups;
}

int StateMachinePrivate::activeLinks(const PopupRegion *region) const
{
    int links = 0;
    while (links < region->holders.size() && isActive(region->slotChain.at(links)->link))
        ++links;
    return links;
}

// Puts a closed popup in the first free place of `region` for the step under way. Returns the
// state from which a transition enters it there without leaving anything open: its holder when
// the holder's link is active, else the last active slot.
QState *StateMachinePrivate::placePopup(PopupState *popup, PopupRegion *region, QEvent *event)
{
    Q_ASSERT(!popup->m_holder && !isActive(popup));
    const int links = activeLinks(region);
    int index = 0;
    while (index < region->holders.size() && region->holders.at(index)->occupant)
        ++index;
    if (index == region->holders.size())
        region->extend();
    PopupHolder *holder = region->holders.at(index);
    holder->occupant = popup;
    popup->m_holder = holder;
    popup->setParent(holder);
    unsettled.append(popup);
    if (index < links) {
        if (event)
            arm(holder->mover(), event, popup);
        return holder;
    }
    // Below the active links: the holders reserved in this step follow each other.
    PopupSlot *tail = region->slotChain.at(links);
    if (event)
        arm(tail->mover(), event, popup);
    return tail;
}

void StateMachinePrivate::closeInStep(PopupState *popup, QEvent *event)
{
    PopupHolder *holder = popup->m_holder;
    Q_ASSERT(holder && isActive(popup));
    arm(holder->mover(), event, holder->emptyState());
}

void StateMachinePrivate::arm(ArmedTransition *mover, QEvent *event, QAbstractState *target)
{
    if (mover->isArmed()) {
        mover->addTarget(target);
        return;
    }
    mover->arm(event, target);
    armedMovers.append(mover);
}

// After a step: the popups that closed (or were placed and not entered) go back to the parking
// state and free their holders; a region left with empty links at the end of its chain is
// synced once more, which closes them.
void StateMachinePrivate::settlePopups()
{
    QVector<PopupRegion *> trimmed;
    const QVector<QPointer<PopupState>> popupsToSettle = std::move(unsettled);
    unsettled.clear();
    for (PopupState *popup : popupsToSettle) {
        if (!popup || isActive(popup))
            continue;
        if (PopupHolder *holder = popup->m_holder) {
            if (holder->occupant == popup)
                holder->occupant = nullptr;
            if (!trimmed.contains(holder->region()))
                trimmed.append(holder->region());
        }
        popup->m_holder = nullptr;
        popup->setParent(popupParking);
    }
    for (PopupRegion *region : qAsConst(trimmed)) {
        const int links = activeLinks(region);
        if (links > 0 && !region->holders.at(links - 1)->occupant)
            scheduleSync(region);
    }
    checkPopupInvariants();
}

void StateMachinePrivate::checkPopupInvariants() const
{
#ifndef QT_NO_DEBUG
    if (!q->isRunning())
        return;
    for (const PopupRegion *region : regions) {
        const int links = activeLinks(region);
        for (int i = 0; i < region->holders.size(); ++i) {
            const PopupState *occupant = region->holders.at(i)->occupant;
            if (i >= links) {
                Q_ASSERT(!occupant);
                continue;
            }
            Q_ASSERT(!occupant
                     || (isActive(occupant) && occupant->parent() == region->holders.at(i)
                         && occupant->m_holder == region->holders.at(i)));
        }
        Q_ASSERT(region->syncPending || links == 0 || region->holders.at(links - 1)->occupant);
    }
    for (const QVector<PopupState *> &popupsOfView : popupsById) {
        for (const PopupState *popup : popupsOfView) {
            Q_ASSERT(isActive(popup) == (popup->m_holder != nullptr));
            Q_ASSERT(popup->m_holder || !popup->m_home || popup->parent() == popupParking);
        }
    }
#endif
}

// A layered state is left: its popups that opened in the global region while it was elsewhere
// close with it.
void StateMachinePrivate::regionExited(PopupRegion *region)
{
    for (const QVector<PopupState *> &popupsOfView : qAsConst(popupsById)) {
        for (PopupState *popup : popupsOfView) {
            if (popup->m_home == region && popup->m_holder && popup->m_holder->region() != region)
                dismissPopupNow(popup);
        }
    }
}

void StateMachinePrivate::registerPopup(PopupState *popup)
{
    popupsById[popup->viewId()].append(popup);
    // A global popup gets its region when the host installs it.
    if (HmiLayeredState *layer = popup->layer())
        popup->m_home = layer->layerState();
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

// The popup of that view: the one open, else the one whose layer is active, else the first made.
PopupState *StateMachinePrivate::popupFor(const QString &viewId) const
{
    const QVector<PopupState *> candidates = popupsById.value(viewId);
    for (PopupState *popup : candidates) {
        if (popup->m_holder)
            return popup;
    }
    for (PopupState *popup : candidates) {
        if (popup->m_home && isActive(popup->m_home))
            return popup;
    }
    return candidates.isEmpty() ? nullptr : candidates.first();
}

bool StateMachinePrivate::requestPopup(const QString &viewId, const QVariant &data)
{
    const bool known = popupsById.contains(viewId);
    if (known)
        queueOrPerform({true, viewId, data});
    else
        recordDropped(viewId, QStringLiteral("no popup state shows this view"));
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
    if (!q->isRunning()) {
        recordDropped(op.viewId, QStringLiteral("the state machine is not running"));
        return;
    }
    if (!region || !isActive(region)) {
        recordDropped(op.viewId, QStringLiteral("the popup was never installed in a region"));
        return;
    }
    popup->m_data = op.data;
    // A popup already open only moves to the top of its priority group.
    for (PopupRegion *each : qAsConst(regions)) {
        each->stack.removeAll(nullptr);
        each->stack.removeAll(popup);
    }
    region->stack.insert(insertionIndex(region->stack, popup), popup);
    Q_ASSERT(ordered(region->stack));
    scheduleSync(region);
}

void StateMachinePrivate::dismissPopupNow(PopupState *popup)
{
    for (PopupRegion *region : qAsConst(regions)) {
        if (region->stack.removeAll(popup) > 0)
            scheduleSync(region);
    }
    if (PopupRegion *region = regionOf(popup); region && isActive(popup))
        scheduleSync(region);
}

void StateMachinePrivate::scheduleSync(PopupRegion *region)
{
    if (!q->isRunning() || region->syncPending)
        return;
    region->syncPending = true;
    queueWork({FireTurn(), 0, false, region});
}

// Arms the movers that bring the region's open popups in line with its stack: popups open and
// not stacked close, stacked popups not open open, and links left with nothing open below them
// close. The machine takes them all in the step of this event. When nothing is to move (a popup
// already open moved up), only the top is reported.
void StateMachinePrivate::syncRegion(PopupRegion *region, QEvent *event)
{
    region->syncPending = false;
    if (!isActive(region))
        return;
    region->stack.removeAll(nullptr);
    Q_ASSERT(armedMovers.isEmpty());
    const int links = activeLinks(region);
    // The links to keep: down to the deepest holder whose popup stays open.
    int keep = 0;
    QVector<PopupState *> closing;
    for (int i = 0; i < links; ++i) {
        PopupState *occupant = region->holders.at(i)->occupant;
        if (!occupant)
            continue;
        if (region->stack.contains(occupant))
            keep = i + 1;
        else
            closing.append(occupant);
    }
    for (PopupState *popup : qAsConst(region->stack)) {
        if (popup->m_holder)
            continue;
        placePopup(popup, region, event);
        keep = qMax(keep, region->holders.indexOf(popup->m_holder) + 1);
    }
    if (keep < links)
        arm(region->slotChain.at(keep)->mover(), event, region->slotChain.at(keep)->vacantState());
    for (PopupState *popup : qAsConst(closing)) {
        // Those below the kept links close with them.
        if (region->holders.indexOf(popup->m_holder) < keep)
            closeInStep(popup, event);
    }
    markTopToReport(region);
    if (armedMovers.isEmpty())
        reportTops();
    else
        Q_ASSERT(!router->isArmed()); // one step opens and closes the popups, nothing else
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
    unsettled.append(popup);
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

// A popup whose state has no transition of its own: the module leaves its closing to the
// framework, which closes it when the driver answers it.
bool StateMachinePrivate::leavesClosingToFramework(const PopupState *popup) const
{
    return popup->findChildren<QAbstractTransition *>().isEmpty();
}

void StateMachinePrivate::closeAnsweredPopup(const QString &viewId)
{
    PopupState *popup = popupFor(viewId);
    if (popup && isActive(popup) && leavesClosingToFramework(popup))
        dismissPopupNow(popup);
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
