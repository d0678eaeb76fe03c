#pragma once

#include <brisken/viewcontroller.h>

#include <QObject>
#include <QPointer>

class QEvent;

namespace Brisken {

// Base of a module's controller: posts the module's events to the HMI state machine and holds
// the view controller through which the module may request views directly.
class ModuleController : public QObject
{
    Q_OBJECT
public:
    // Holds the framework's view controller from the start; the host may replace or clear it.
    explicit ModuleController(QObject *parent = nullptr);
    ~ModuleController() override;

    // Posts `event` to the HMI state machine, which takes ownership and handles it later, never
    // inside this call. An event posted while the machine is not running is kept and posted
    // when it starts.
    void postEvent(QEvent *event);

    ViewController *viewController() const;
    void setViewController(ViewController *viewController);

private:
    QPointer<ViewController> m_viewController;
};

} // namespace Brisken
