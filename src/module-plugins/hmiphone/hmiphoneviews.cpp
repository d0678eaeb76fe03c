#include "hmiphoneviews.h"

#include <brisken/viewmanager.h>

namespace HmiPhone {

const QString ModuleName = QStringLiteral("PHONE");

// Defined in this unit after ModuleName, so that the module name exists when they are made.
#define HMIPHONE_DEFINE_VIEW(name) \
    const QString name = Brisken::ViewManager::viewIdentifier(ModuleName, QStringLiteral(#name));
#define HMIPHONE_DEFINE_TRANSIENT(name) const QString name = QStringLiteral(#name);

namespace Views {
HMIPHONE_VIEW_NAMES(HMIPHONE_DEFINE_VIEW)
} // namespace Views

namespace Transients {
HMIPHONE_TRANSIENT_NAMES(HMIPHONE_DEFINE_TRANSIENT)
} // namespace Transients

} // namespace HmiPhone
