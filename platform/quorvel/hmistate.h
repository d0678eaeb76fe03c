#pragma once

#include <quorvel/namedstate.h>

namespace Quorvel {

// The module's compound state. A state created with a layered state as parent joins that
// state's exclusive region (see HmiLayeredState).
class HmiState : public NamedState
{
    Q_OBJECT
public:
    explicit HmiState(const QString &name, QState *parent = nullptr);
    ~HmiState() override;

    virtual void setInitialHmiState(QAbstractState *state);
    virtual QAbstractState *initialHmiState() const;

protected:
    HmiState(const QString &name, QState::ChildMode childMode, QState *parent);

    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

    // The parent that a state created under `parent` really gets (a layered state's exclusive
    // region for a layered state).
    static QState *effectiveParent(QState *parent);
};

} // namespace Quorvel
