#pragma once

#include <QLoggingCategory>

namespace Taldris {

// A logging category of the head unit's logging system. `level` is the lowest severity that is
// written by default: 0 debug, 1 info, 2 warning, 3 critical (higher values write nothing but
// fatal messages). Logging rules (QT_LOGGING_RULES) still enable or disable any severity.
// `name` must outlive the category; pass a string literal.
class PellumCategory : public QLoggingCategory
{
public:
    PellumCategory(const char *name, int level);

    int level() const { return m_level; }

private:
    int m_level;
};

} // namespace Taldris
