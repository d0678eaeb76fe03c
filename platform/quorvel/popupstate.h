#pragma once

#include <quorvel/hmistate.h>

#include <QList>
#include <QPointer>
#include <QVariant>

class QAbstractTransition;
class QTimer;

namespace Quorvel {

class HmiLayeredState;

// The state of a popup, named by its view identifier. A popup with a layer lives in that
// layered state's layer region; one without joins the global popup region when the host
// installs it. Popups are shown by the view controller's requests: popups of one region stack
// by priority (a higher value lies above, the newest on top among equals), the top one is
// entered, and dismissing it reveals the next one still requested.
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

    // Auto-dismiss: while shown, the popup is dismissed when the interval (ms) has passed.
    void setAutoDismissTimeoutActive(bool active);
    bool autoDismissTimeoutActive() const;
    void setAutoDismissTimeoutInterval(int milliseconds);
    int autoDismissTimeoutInterval() const;
    // Starts the interval again if the popup is shown.
    void restartAutoDismissTimer();

    // The popup is dismissed when `transition` fires (at once, as part of the firing).
    void registerDismissingTransition(QAbstractTransition *transition);
    // The popup is dismissed when `popup` is shown.
    void registerDismissingPopup(PopupState *popup);

protected:
    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

private:
    friend class StateMachinePrivate;

    int m_priority = 0;
    QPointer<HmiLayeredState> m_layer;
    QVariant m_data;
    bool m_autoDismiss = false;
    int m_autoDismissInterval = 0;
    QTimer *m_timer = nullptr;
    // The popups that this one dismisses when it is shown.
    QList<QPointer<PopupState>> m_dismissesWhenShown;
};

} // namespace Quorvel
