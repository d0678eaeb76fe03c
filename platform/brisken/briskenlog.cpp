#include "briskenlog.h"

namespace Brisken {
Q_LOGGING_CATEGORY(briskenLog, "orvane.brisken", QtInfoMsg)
} // namespace Brisken
