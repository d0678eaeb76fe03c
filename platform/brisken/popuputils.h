#pragma once

#include <QList>

class QAbstractState;
class QAbstractTransition;

namespace Brisken {

namespace PopupUtils {

// Makes `transition` close the listed popups each time it fires.
void makeExclusive(QAbstractTransition *transition, const QList<QAbstractState *> &popups);

template<typename PopupStateType>
void makeExclusive(QAbstractTransition *transition, const QList<PopupStateType *> &popups)
{
    QList<QAbstractState *> states;
    for (PopupStateType *popup : popups)
        states.append(popup);
    makeExclusive(transition, states);
}

} // namespace PopupUtils

} // namespace Brisken
