#include "modulecontroller.h"

#include "briskenlog.h"

#include <journal/journal.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

#include <QPointer>

#include <memory>
#include <vector>

namespace Brisken {

namespace {

// Events posted while the machine is not running. Qt's machine drops (and leaks) them; here
// they wait for the machine to start, in the order they were posted.
struct PendingEvents
{
    std::vector<std::unique_ptr<QEvent>> events;
    QPointer<Quorvel::StateMachine> watched;

    void hold(Quorvel::StateMachine *machine, QEvent *event)
    {
        const bool newMachine = watched != machine;
        if (newMachine) {
            // Those held so far were for a machine that is gone without starting.
            events.clear();
            watched = machine;
        }
        events.emplace_back(event);
        if (!newMachine)
            return;
        QObject::connect(machine, &QStateMachine::started, machine, [this, machine] {
            std::vector<std::unique_ptr<QEvent>> held;
            held.swap(events);
            for (std::unique_ptr<QEvent> &event : held)
                machine->postEvent(event.release());
        });
    }
};

PendingEvents &pendingEvents()
{
    static PendingEvents pending;
    return pending;
}

} // namespace

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
    if (event->type() == Quorvel::HmiEvent::eventType()) {
        const auto *hmiEvent = static_cast<const Quorvel::HmiEvent *>(event);
        Platform::Journal::instance()->append(QStringLiteral("event"),
                                              {{QStringLiteral("name"), hmiEvent->name()},
                                               {QStringLiteral("value"), hmiEvent->value()}});
    }
    Quorvel::StateMachine *machine = Quorvel::StateMachine::instance();
    if (machine->isRunning())
        machine->postEvent(event);
    else
        pendingEvents().hold(machine, event);
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
