#pragma once

#include <quorvel/hmistate.h>

class QAbstractTransition;

namespace Quorvel {

// A choice point: on entry it emits conditionTest(QEvent*) (a connected slot calls
// setTargetState()), then moves at once to the target state. Without a target it stays.
class HmiConditionalState : public HmiState
{
    Q_OBJECT
public:
    explicit HmiConditionalState(const QString &name, QState *parent = nullptr);
    ~HmiConditionalState() override;

    void setTargetState(QAbstractState *target);
    QAbstractState *targetState() const;

signals:
    void conditionTest(QEvent *event);

protected:
    void onEntry(QEvent *event) override;

private:
    QAbstractTransition *m_transition = nullptr;
};

} // namespace Quorvel
