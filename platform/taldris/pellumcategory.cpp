#include "pellumcategory.h"

namespace Taldris {

namespace {

QtMsgType lowestEnabledType(int level)
{
    switch (level) {
    case 0:
        return QtDebugMsg;
    case 1:
        return QtInfoMsg;
    case 2:
        return QtWarningMsg;
    case 3:
        return QtCriticalMsg;
    default:
        return level < 0 ? QtDebugMsg : QtFatalMsg;
    }
}

} // namespace

PellumCategory::PellumCategory(const char *name, int level)
    : QLoggingCategory(name, lowestEnabledType(level))
    , m_level(level)
{ }

} // namespace Taldris
