#include "hmiintentmanager.h"

#include "hmiintenthandler.h"

#include <journal/journal.h>

namespace Taldris {

HmiIntentManager::HmiIntentManager(QObject *parent)
    : QObject(parent)
{ }

HmiIntentManager *HmiIntentManager::instance()
{
    static HmiIntentManager manager;
    return &manager;
}

void HmiIntentManager::registerIntentHandler(HmiIntentHandler *handler)
{
    if (!handler || m_handlers.contains(handler))
        return;
    m_handlers.append(handler);
    connect(handler, &HmiIntentHandler::actionStatusChanged, this,
            &HmiIntentManager::actionStatusChanged);
}

void HmiIntentManager::unregisterIntentHandler(HmiIntentHandler *handler)
{
    if (!handler)
        return;
    m_handlers.removeAll(handler);
    disconnect(handler, nullptr, this, nullptr);
}

HmiIntentHandler *HmiIntentManager::handlerFor(int action) const
{
    // The handler registered first keeps an action that a later one offers as well.
    for (const QPointer<HmiIntentHandler> &handler : m_handlers) {
        if (handler && handler->handlesAction(action))
            return handler;
    }
    return nullptr;
}

bool HmiIntentManager::requestAction(int action, const QVariantList &arguments, bool flag,
                                     bool fromVoice, const QVariant &extra)
{
    m_handlers.removeAll(nullptr);
    Platform::Journal::instance()->append(QStringLiteral("intent"),
                                          {{QStringLiteral("action"), action},
                                           {QStringLiteral("args"), arguments},
                                           {QStringLiteral("flag"), flag},
                                           {QStringLiteral("fromVoice"), fromVoice},
                                           {QStringLiteral("extra"), extra}});
    HmiIntentHandler *handler = handlerFor(action);
    return handler && handler->performAction(action, arguments, flag, extra);
}

bool HmiIntentManager::isActionEnabled(int action) const
{
    HmiIntentHandler *handler = handlerFor(action);
    return handler && handler->isActionEnabled(action);
}

} // namespace Taldris
