#include "hmiconditionalstate.h"

#include <QAbstractTransition>
#include <QEvent>

namespace Quorvel {

namespace {

// Leaves the conditional state for its target as soon as it is entered (an eventless
// transition), and never while it has no target.
class ConditionalTransition : public QAbstractTransition
{
public:
    explicit ConditionalTransition(QState *source)
        : QAbstractTransition(source)
    {
        setObjectName(source->objectName() + QStringLiteral("->target"));
    }

protected:
    bool eventTest(QEvent *event) override
    {
        return event && event->type() == QEvent::None && targetState()
                && targetState() != sourceState();
    }
    void onTransition(QEvent *) override { }
};

} // namespace

HmiConditionalState::HmiConditionalState(const QString &name, QState *parent)
    : HmiState(name, parent)
    , m_transition(new ConditionalTransition(this))
{ }

HmiConditionalState::~HmiConditionalState() = default;

void HmiConditionalState::setTargetState(QAbstractState *target)
{
    m_transition->setTargetState(target);
}

QAbstractState *HmiConditionalState::targetState() const
{
    return m_transition->targetState();
}

void HmiConditionalState::onEntry(QEvent *event)
{
    HmiState::onEntry(event);
    emit conditionTest(event);
}

} // namespace Quorvel
