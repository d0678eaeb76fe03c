#include "hmievent.h"

namespace Quorvel {

const QEvent::Type HmiEvent::s_type = static_cast<QEvent::Type>(QEvent::registerEventType());

} // namespace Quorvel
