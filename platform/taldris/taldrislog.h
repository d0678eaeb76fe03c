#pragma once

#include <QLoggingCategory>

namespace Taldris {
// The module framework's own logging category, "orvane.taldris".
Q_DECLARE_LOGGING_CATEGORY(taldrisLog)
} // namespace Taldris
