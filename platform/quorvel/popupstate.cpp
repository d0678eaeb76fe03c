#include "popupstate.h"
#include "statemachine_p.h"

#include "hmilayeredstate.h"

#include <QAbstractTransition>
#include <QTimer>

namespace Quorvel {

PopupState::PopupState(const QString &viewId, int priority)
    : PopupState(viewId, nullptr, priority)
{ }

PopupState::PopupState(const QString &viewId, HmiLayeredState *layer, int priority)
    : HmiState(viewId, StateMachinePrivate::get()->homeParent(layer))
    , m_priority(priority)
    , m_layer(layer)
{
    StateMachinePrivate::get()->registerPopup(this);
}

PopupState::~PopupState()
{
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->forgetPopup(this);
}

QString PopupState::viewId() const
{
    return objectName();
}

int PopupState::priority() const
{
    return m_priority;
}

HmiLayeredState *PopupState::layer() const
{
    return m_layer;
}

QVariant PopupState::popupData() const
{
    return m_data;
}

void PopupState::setAutoDismissTimeoutActive(bool active)
{
    m_autoDismiss = active;
    if (!active && m_timer)
        m_timer->stop();
}

bool PopupState::autoDismissTimeoutActive() const
{
    return m_autoDismiss;
}

void PopupState::setAutoDismissTimeoutInterval(int milliseconds)
{
    m_autoDismissInterval = milliseconds;
    if (m_timer)
        m_timer->setInterval(milliseconds);
}

int PopupState::autoDismissTimeoutInterval() const
{
    return m_autoDismissInterval;
}

void PopupState::restartAutoDismissTimer()
{
    if (m_autoDismiss && m_autoDismissInterval > 0 && isActive())
        autoDismissTimer()->start();
}

// Made when the popup first shows with auto-dismiss: most popups never do.
QTimer *PopupState::autoDismissTimer()
{
    if (!m_timer) {
        m_timer = new QTimer(this);
        m_timer->setSingleShot(true);
        m_timer->setInterval(m_autoDismissInterval);
        connect(m_timer, &QTimer::timeout, this, [this] {
            if (StateMachinePrivate *d = StateMachinePrivate::existing())
                d->dismissPopupNow(this);
        });
    }
    return m_timer;
}

void PopupState::registerDismissingTransition(QAbstractTransition *transition)
{
    if (!transition)
        return;
    connect(transition, &QAbstractTransition::triggered, this, [this] {
        if (StateMachinePrivate *d = StateMachinePrivate::existing())
            d->dismissPopupNow(this);
    });
}

void PopupState::registerDismissingPopup(PopupState *popup)
{
    if (popup && popup != this)
        popup->m_dismissesWhenShown.append(this);
}

void PopupState::onEntry(QEvent *event)
{
    HmiState::onEntry(event);
    if (m_autoDismiss && m_autoDismissInterval > 0)
        autoDismissTimer()->start();
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->popupEntered(this);
}

void PopupState::onExit(QEvent *event)
{
    HmiState::onExit(event);
    if (m_timer)
        m_timer->stop();
    if (StateMachinePrivate *d = StateMachinePrivate::existing())
        d->popupExited(this);
}

} // namespace Quorvel
