#pragma once

#include <QLoggingCategory>

namespace Brisken {
// The GUI framework's own logging category, "orvane.brisken".
Q_DECLARE_LOGGING_CATEGORY(briskenLog)
} // namespace Brisken
