#pragma once

#include <quorvel/hmiviewstate.h>

namespace Mavrosk {
class PhoneSource;
}

namespace Quorvel {
class HmiTransition;
}

namespace HmiPhone {

// The dial keypad. The number being typed lives in the phone source, not here: the keypad
// appends typed keys, deletes the last character, clears the number on a long press of
// backspace, and starts every visit with an empty number.
class DialKeypadState : public Quorvel::HmiViewState
{
    Q_OBJECT
public:
    DialKeypadState(const QString &viewId, const QString &name, Quorvel::HmiState *parent);

protected:
    void onEntry(QEvent *event) override;

private slots:
    void keyPressed();
    void backspacePressed();
    void backspaceLongPressed();

private:
    Quorvel::HmiTransition *m_keyTransition = nullptr;
    Quorvel::HmiTransition *m_backspaceTransition = nullptr;
    Quorvel::HmiTransition *m_backspaceLongPressTransition = nullptr;
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
};

} // namespace HmiPhone
