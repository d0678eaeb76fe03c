#include "popuputils.h"

#include "viewcontroller.h"

#include <quorvel/popupstate.h>

#include <QAbstractState>
#include <QAbstractTransition>
#include <QPointer>

namespace Brisken {

namespace PopupUtils {

void makeExclusive(QAbstractTransition *transition, const QList<QAbstractState *> &popups)
{
    if (!transition)
        return;
    QList<QPointer<QAbstractState>> closed;
    for (QAbstractState *popup : popups) {
        // A popup state closes at once when the transition fires, so that a popup requested by
        // another transition of the same notification (taking effect after all of them) stays.
        if (auto *popupState = qobject_cast<Quorvel::PopupState *>(popup))
            popupState->registerDismissingTransition(transition);
        else if (popup)
            closed.append(popup);
    }
    if (closed.isEmpty())
        return;
    // Any other state is closed by name: a popup state is named by its view identifier.
    QObject::connect(transition, &QAbstractTransition::triggered, transition, [closed] {
        for (const QPointer<QAbstractState> &popup : closed) {
            if (popup)
                ViewController::instance()->dismissPopup(popup->objectName());
        }
    });
}

} // namespace PopupUtils

} // namespace Brisken
