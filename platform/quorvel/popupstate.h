#pragma once

#include <quorvel/hmistate.h>

#include <QList>
#include <QPointer>
#include <QVariant>

class QAbstractTransition;
class QTimer;

namespace Quorvel {

class HmiLayeredState;
class PopupHolder;

// The state of a popup, named by its view identifier. A popup with a layer lives in that
// layered state's layer region; one without joins the global popup region when the host
// installs it.
//
// A popup is open (an active state) from the moment a request for it is applied until it is
// dismissed: by a dismissal request, by its auto-dismiss timeout, by a transition registered with
// registerDismissingTransition (or PopupUtils::makeExclusive), by a popup registered with
// registerDismissingPopup opening, or by a transition that leaves it. A transition from an open
// popup (or one of its states) to a state outside it closes only that popup, and leaves only the
// states below its target's deepest active ancestor, as an adopted transition does.
//
// Open popups of one region stack by priority (a higher value lies above, the newest on top
// among equals); the top one is shown. Covering a popup changes only what is shown: the covered
// popup is not left, keeps its child states, and its transitions keep listening. A request for
// a popup already open only brings it to the top of its priority group.
class PopupState : public HmiState
{
    Q_OBJECT
public:
    PopupState(const QString &viewId, int priority);
    PopupState(const QString &viewId, HmiLayeredState *layer, int priority);
    ~PopupState() override;

    QString viewId() const;
    int priority() const;
    HmiLayeredState *layer() const;
    // The data of the request that showed the popup.
    QVariant popupData() const;

    // Auto-dismiss: the popup is dismissed when the interval (ms) has passed since it opened,
    // covered or not.
    void setAutoDismissTimeoutActive(bool active);
    bool autoDismissTimeoutActive() const;
    void setAutoDismissTimeoutInterval(int milliseconds);
    int autoDismissTimeoutInterval() const;
    // Starts the interval again if the popup is open.
    void restartAutoDismissTimer();

    // The popup is dismissed when `transition` fires (at once, as part of the firing).
    void registerDismissingTransition(QAbstractTransition *transition);
    // The popup is dismissed when `popup` opens.
    void registerDismissingPopup(PopupState *popup);

protected:
    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

private:
    friend class StateMachine;
    friend class StateMachinePrivate;

    QTimer *autoDismissTimer();

    int m_priority = 0;
    QPointer<HmiLayeredState> m_layer;
    // The region the popup opens in while its layer is active (the global region for a global
    // popup), and the place it is open in (null while closed). See popupregions.cpp.
    QPointer<QState> m_home;
    PopupHolder *m_holder = nullptr;
    QVariant m_data;
    bool m_autoDismiss = false;
    int m_autoDismissInterval = 0;
    QTimer *m_timer = nullptr;
    // The popups that this one dismisses when it is shown.
    QList<QPointer<PopupState>> m_dismissesWhenShown;
};

} // namespace Quorvel
