#pragma once

#include <quorvel/hmilayeredstate.h>

namespace Quorvel {
class GuardedSignalTransition;
class HmiSignalTransition;
class HmiTransition;
class HmiViewState;
} // namespace Quorvel

namespace Mavrosk {
class PhoneSource;
}

namespace HmiPhone {

// The text-message screens: the message list, a single message and the list of reply texts. A
// message is opened in two steps: selecting it asks the phone for its details, and the arrival of
// the details either opens the message view or reads the message aloud, whichever was asked last.
class PhoneSms_Cmp : public Quorvel::HmiLayeredState
{
    Q_OBJECT
public:
    PhoneSms_Cmp(const QString &name, Quorvel::HmiState *parent);

    Quorvel::HmiViewState *smsViewState() const { return m_messageView; }
    Quorvel::HmiViewState *smsReplyViewState() const { return m_replyView; }

signals:
    // Ask for the inbox if it changed since it was last asked for.
    void phnSmsRequestInbox();
    // Ask for the inbox now.
    void phnSmsRequestInboxForce();

private slots:
    void handleViewTextMessageOptions();
    void handleRefreshMessages();
    void handleHearTextMessage();
    void handleHearSelectedTextMessage();
    void handleTextMessageDetailsReady();
    void handleHearSelectedReplyMessage();
    void phnSmsRequestInboxForceTest(QEvent *event);
    void onSmsListEntry();

private:
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    Quorvel::HmiViewState *m_listView = nullptr;
    Quorvel::HmiViewState *m_replyView = nullptr;
    Quorvel::HmiViewState *m_messageView = nullptr;
    Quorvel::HmiTransition *m_messageOptionsTransition = nullptr;
    Quorvel::HmiTransition *m_hearSelectedTransition = nullptr;
    Quorvel::HmiSignalTransition *m_detailsReadyTransition = nullptr;
    Quorvel::GuardedSignalTransition *m_newMessageTransition = nullptr;
    bool m_hearWhenReady = false;
};

} // namespace HmiPhone
