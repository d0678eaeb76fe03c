#include "hmiintenthandler.h"

namespace Taldris {

HmiIntentHandler::HmiIntentHandler(QObject *parent)
    : QObject(parent)
{ }

HmiIntentHandler::~HmiIntentHandler() = default;

bool HmiIntentHandler::isActionEnabled(int action) const
{
    return handlesAction(action);
}

QString HmiIntentHandler::lastError() const
{
    return QString();
}

void HmiIntentHandler::addAction(int action)
{
    if (!m_actions.contains(action))
        m_actions.append(action);
}

} // namespace Taldris
