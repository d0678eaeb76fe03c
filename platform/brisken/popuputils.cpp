#include "popuputils.h"

#include <quorvel/popupstate.h>

#include <QAbstractState>
#include <QAbstractTransition>

namespace Brisken {

namespace PopupUtils {

void makeExclusive(QAbstractTransition *transition, const QList<QAbstractState *> &popups)
{
    if (!transition)
        return;
    // The popups close as part of the transition's firing, not as a dismissal request: requests
    // made by the other transitions of the same notification take effect after it.
    for (QAbstractState *popup : popups) {
        if (auto *popupState = qobject_cast<Quorvel::PopupState *>(popup))
            popupState->registerDismissingTransition(transition);
    }
}

} // namespace PopupUtils

} // namespace Brisken
