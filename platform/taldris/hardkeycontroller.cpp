#include "hardkeycontroller.h"

#include <journal/journal.h>

namespace Taldris {

HardKeyController::HardKeyController(QObject *parent)
    : QObject(parent)
{ }

HardKeyController *HardKeyController::instance()
{
    static HardKeyController controller;
    return &controller;
}

void HardKeyController::fallBack(const QString &call)
{
    Platform::Journal::instance()->append(QStringLiteral("hardkey"),
                                          {{QStringLiteral("call"), call}});
    emit fallBackRequested(call);
}

void HardKeyController::processCombinedSeekLeftKey()
{
    fallBack(QStringLiteral("processCombinedSeekLeftKey"));
}

void HardKeyController::processCombinedSeekRightKey()
{
    fallBack(QStringLiteral("processCombinedSeekRightKey"));
}

void HardKeyController::processSWCSeekDownShortPress()
{
    fallBack(QStringLiteral("processSWCSeekDownShortPress"));
}

void HardKeyController::processSWCSeekUpShortPress()
{
    fallBack(QStringLiteral("processSWCSeekUpShortPress"));
}

void HardKeyController::processSWCSeekDownLongPress()
{
    fallBack(QStringLiteral("processSWCSeekDownLongPress"));
}

void HardKeyController::processSWCSeekDownLongRelease()
{
    fallBack(QStringLiteral("processSWCSeekDownLongRelease"));
}

void HardKeyController::processSWCSeekUpLongPress()
{
    fallBack(QStringLiteral("processSWCSeekUpLongPress"));
}

void HardKeyController::processSWCSeekUpLongRelease()
{
    fallBack(QStringLiteral("processSWCSeekUpLongRelease"));
}

} // namespace Taldris
