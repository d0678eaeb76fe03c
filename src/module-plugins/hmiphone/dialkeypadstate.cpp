#include "dialkeypadstate.h"

#include "hmiphoneevents.h"

#include <mavrosk/phonesource.h>
#include <quorvel/hmitransition.h>

namespace HmiPhone {

DialKeypadState::DialKeypadState(const QString &viewId, const QString &name,
                                 Quorvel::HmiState *parent)
    : Quorvel::HmiViewState(viewId, name, parent)
{
    // Targetless: the keypad stays shown, only the number changes.
    m_keyTransition = new Quorvel::HmiTransition(Events::HmiPhone_DialPadKeyPressed, this);
    m_backspaceTransition = new Quorvel::HmiTransition(Events::HmiPhone_DialPadBackSpace, this);
    m_backspaceLongPressTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_DialPadBackSpaceLongPress, this);
    m_phoneSource = Mavrosk::PhoneSource::instance();

    connect(m_keyTransition, &QAbstractTransition::triggered, this, &DialKeypadState::keyPressed);
    connect(m_backspaceTransition, &QAbstractTransition::triggered, this,
            &DialKeypadState::backspacePressed);
    connect(m_backspaceLongPressTransition, &QAbstractTransition::triggered, this,
            &DialKeypadState::backspaceLongPressed);
}

void DialKeypadState::onEntry(QEvent *event)
{
    // Every visit starts with an empty number, whatever was typed before.
    if (m_phoneSource)
        m_phoneSource->setCallNumberEntered(QString());
    Quorvel::HmiViewState::onEntry(event);
}

void DialKeypadState::keyPressed()
{
    if (!m_phoneSource)
        return;
    const QVariant key = m_keyTransition->transitionData();
    if (!key.isValid() || !key.canConvert<QString>())
        return;
    m_phoneSource->setCallNumberEntered(m_phoneSource->callNumberEntered() + key.toString());
}

void DialKeypadState::backspacePressed()
{
    if (!m_phoneSource)
        return;
    const QString number = m_phoneSource->callNumberEntered();
    if (!number.isEmpty())
        m_phoneSource->setCallNumberEntered(number.left(number.size() - 1));
}

void DialKeypadState::backspaceLongPressed()
{
    if (m_phoneSource && !m_phoneSource->callNumberEntered().isEmpty())
        m_phoneSource->setCallNumberEntered(QString());
}

} // namespace HmiPhone
