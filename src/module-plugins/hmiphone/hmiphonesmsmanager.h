#pragma once

#include <QObject>
#include <QPointer>

namespace Quorvel {
class HmiTransition;
class HmiViewState;
class IntSignalTransition;
class PopupState;
} // namespace Quorvel

namespace Mavrosk {
class PhoneSource;
}

namespace HmiPhone {

class HmiPhoneController;
class HmiPhonePopupManager;
class Phone_Cmp;
class PhoneSms_Cmp;

// Builds the text-message part of the phone screens (the text-message component and its access
// and download popups) and wires the message download: it follows the download while the
// downloading popup is shown, counts the user's retries, and asks the phone for the inbox only
// when it changed.
class HmiPhoneSmsManager : public QObject
{
    Q_OBJECT
public:
    HmiPhoneSmsManager(HmiPhoneController *controller, QObject *parent);

    // Builds the text-message states under the phone root component; called once.
    void createSmsStates(Phone_Cmp *phone);

    PhoneSms_Cmp *phoneSmsCompositeState() const { return m_phoneSmsCmp; }
    Quorvel::HmiViewState *phoneSmsViewState() const;
    Quorvel::HmiViewState *phoneSmsReplyViewState() const;

private slots:
    void handleMessageDownloadFailure();
    void handleMessagesRetryDownloadFailed();
    void handleMessageProfileAccessRetryRequest();
    void handlePhnSmsRequestInbox();
    void smsHandlePhoneDeclinedAccess();
    void onSmsInboxChanged();

private:
    PhoneSms_Cmp *m_phoneSmsCmp = nullptr;
    Quorvel::PopupState *m_downloadingPopup = nullptr;
    Quorvel::PopupState *m_downloadFailedPopup = nullptr;
    Quorvel::IntSignalTransition *m_downloadDoneTransition = nullptr;
    Quorvel::IntSignalTransition *m_downloadFailedTransition = nullptr;
    HmiPhonePopupManager *m_popupManager = nullptr;
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    QPointer<HmiPhoneController> m_controller; // QML can delete it (deleteLater())
    Quorvel::HmiTransition *m_retryTransition = nullptr;
    Quorvel::HmiTransition *m_cancelTransition = nullptr;
    int m_retryCount = 0;
    bool m_inboxChanged = true;
};

} // namespace HmiPhone
