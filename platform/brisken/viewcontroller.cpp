#include "viewcontroller.h"

#include <journal/journal.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>

#include <QLoggingCategory>

namespace Brisken {

namespace {
Q_LOGGING_CATEGORY(viewControllerLog, "orvane.brisken.viewcontroller")

ViewController *s_instance = nullptr;

void record(const QString &kind, const QString &field, const QVariant &value)
{
    Platform::Journal::instance()->append(kind, {{field, value}});
}
} // namespace

ViewController::ViewController(QObject *parent)
    : QObject(parent)
{
    setObjectName(QStringLiteral("ViewController"));
}

ViewController *ViewController::instance()
{
    if (!s_instance)
        s_instance = new ViewController();
    return s_instance;
}

void ViewController::requestPopup(const QString &viewId, const QVariant &data)
{
    record(QStringLiteral("popup-request"), QStringLiteral("id"), viewId);
    Quorvel::StateMachine::instance()->requestPopup(viewId, data);
}

void ViewController::dismissPopup(const QString &viewId)
{
    record(QStringLiteral("popup-dismiss"), QStringLiteral("id"), viewId);
    Quorvel::StateMachine::instance()->dismissPopup(viewId);
}

void ViewController::popupAnswered(const QString &viewId)
{
    Quorvel::StateMachine::instance()->popupAnswered(viewId);
}

void ViewController::showView(const QVariant &viewId, const QVariant &data, bool flag,
                              const QVariant &extra)
{
    Q_UNUSED(data)
    Q_UNUSED(flag)
    Q_UNUSED(extra)
    const QString id = viewId.toString();
    record(QStringLiteral("view-request"), QStringLiteral("id"), id);
    Quorvel::StateMachine *machine = Quorvel::StateMachine::instance();
    QAbstractState *target = machine->findViewTarget(id);
    if (!target) {
        qCDebug(viewControllerLog) << "showView: no state shows" << id;
        return;
    }
    machine->goToState(target);
}

void ViewController::back(int steps)
{
    record(QStringLiteral("back"), QStringLiteral("steps"), steps);
    if (!Quorvel::StateMachine::instance()->back(steps))
        qCDebug(viewControllerLog) << "back: nothing to go back to";
}

QString ViewController::activeView() const
{
    Quorvel::HmiViewState *view = Quorvel::HmiViewState::activeViewState();
    return view ? view->targetView() : QString();
}

QStringList ViewController::shownPopups() const
{
    return Quorvel::StateMachine::instance()->shownPopups();
}

QStringList ViewController::openPopups() const
{
    return Quorvel::StateMachine::instance()->openPopups();
}

QStringList ViewController::backStack() const
{
    return Quorvel::StateMachine::instance()->backStack();
}

} // namespace Brisken
