#pragma once

#include <quorvel/hmistate.h>

namespace Quorvel {

// A parallel pair: the exclusive region holds the ordinary children (states created with the
// layered state as parent go there, and setInitialHmiState() names its initial state), and the
// layer region holds the popup states created with this state as their layer. The layer's
// popups can be shown only while the layered state is active, and they close when it is left.
class HmiLayeredState : public HmiState
{
    Q_OBJECT
public:
    explicit HmiLayeredState(const QString &name, QState *parent = nullptr);
    ~HmiLayeredState() override;

    HmiState *exclusiveState() const;
    // The region of the popups whose layer this state is.
    QState *layerState() const;

    void setInitialHmiState(QAbstractState *state) override;
    QAbstractState *initialHmiState() const override;

private:
    HmiState *m_exclusive = nullptr;
    QState *m_layer = nullptr;
};

} // namespace Quorvel
