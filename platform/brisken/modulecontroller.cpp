#include "modulecontroller.h"

#include "briskenlog.h"

#include <quorvel/statemachine.h>

namespace Brisken {

ModuleController::ModuleController(QObject *parent)
    : QObject(parent)
    , m_viewController(ViewController::instance())
{ }

ModuleController::~ModuleController() = default;

void ModuleController::postEvent(QEvent *event)
{
    if (!event) {
        qCWarning(briskenLog, "ModuleController: cannot post a null event");
        return;
    }
    // The machine journals the event and holds it until it runs.
    Quorvel::StateMachine::instance()->postEvent(event);
}

ViewController *ModuleController::viewController() const
{
    return m_viewController;
}

void ModuleController::setViewController(ViewController *viewController)
{
    m_viewController = viewController;
}

} // namespace Brisken
