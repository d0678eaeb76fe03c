#include "popuputils.h"

#include <QAbstractState>
#include <QAbstractTransition>

namespace Brisken {

namespace PopupUtils {

void makeExclusive(QAbstractTransition *transition, const QList<QAbstractState *> &popups)
{
    Q_UNUSED(transition)
    Q_UNUSED(popups)
}

} // namespace PopupUtils

} // namespace Brisken
