#include "phonesms_cmp.h"

namespace HmiPhone {

PhoneSms_Cmp::PhoneSms_Cmp(const QString &name, Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
{ }

void PhoneSms_Cmp::handleViewTextMessageOptions() { }
void PhoneSms_Cmp::handleRefreshMessages() { }
void PhoneSms_Cmp::handleHearTextMessage() { }
void PhoneSms_Cmp::handleHearSelectedTextMessage() { }
void PhoneSms_Cmp::handleTextMessageDetailsReady() { }
void PhoneSms_Cmp::handleHearSelectedReplyMessage() { }
void PhoneSms_Cmp::phnSmsRequestInboxForceTest(QEvent *) { }
void PhoneSms_Cmp::onSmsListEntry() { }

} // namespace HmiPhone
