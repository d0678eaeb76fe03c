#include "modulecontroller.h"

#include <QEvent>

namespace Brisken {

ModuleController::ModuleController(QObject *parent)
    : QObject(parent)
{ }

ModuleController::~ModuleController() = default;

void ModuleController::postEvent(QEvent *event)
{
    delete event;
}

ViewController *ModuleController::viewController() const
{
    return nullptr;
}

void ModuleController::setViewController(ViewController *viewController)
{
    Q_UNUSED(viewController)
}

} // namespace Brisken
