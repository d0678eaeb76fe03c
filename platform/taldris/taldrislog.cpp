#include "taldrislog.h"

namespace Taldris {
Q_LOGGING_CATEGORY(taldrisLog, "orvane.taldris", QtInfoMsg)
} // namespace Taldris
