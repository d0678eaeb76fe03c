#pragma once

#include <quorvel/hmiviewstate.h>

namespace Mavrosk {
class PhoneSource;
}

namespace HmiPhone {

// The call-in-progress view. On each entry it tells the driver, through a status-bar transient,
// that a call is being dialled or that the call just accepted is now connected.
class CallConnectedViewState : public Quorvel::HmiViewState
{
    Q_OBJECT
public:
    CallConnectedViewState(const QString &viewId, const QString &name, Quorvel::HmiState *parent);

protected:
    void onEntry(QEvent *event) override;

private:
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
};

} // namespace HmiPhone
