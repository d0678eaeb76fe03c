#include "hmiphoneevents.h"

#define HMIPHONE_DEFINE_EVENT(name) const QString name = QStringLiteral(#name);

namespace HmiPhone {
namespace Events {
HMIPHONE_EVENT_NAMES(HMIPHONE_DEFINE_EVENT)
} // namespace Events
} // namespace HmiPhone
