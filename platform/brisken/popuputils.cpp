#include "popuputils.h"

#include "viewcontroller.h"

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
        if (popup)
            closed.append(popup);
    }
    // A popup state is named by its view identifier.
    QObject::connect(transition, &QAbstractTransition::triggered, transition, [closed] {
        for (const QPointer<QAbstractState> &popup : closed) {
            if (popup)
                ViewController::instance()->dismissPopup(popup->objectName());
        }
    });
}

} // namespace PopupUtils

} // namespace Brisken
