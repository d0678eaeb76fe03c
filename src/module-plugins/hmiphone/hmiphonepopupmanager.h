#pragma once

#include <QObject>

namespace Brisken {
class ViewController;
}

namespace HmiPhone {

// The single place through which the phone asks the GUI framework to show or hide one of its
// popups by view identifier. It keeps no record of what is open: showing, queueing, priority and
// auto-dismiss belong to the framework and to the popup states declared for the same views.
// Each slot makes exactly one framework call; show slots always pass empty popup data.
class HmiPhonePopupManager : public QObject
{
    Q_OBJECT
public:
    explicit HmiPhonePopupManager(QObject *parent = nullptr);

    // The process-wide instance, created on first use as a child of the application object.
    static HmiPhonePopupManager *instance();

public slots:
    void showNoCellularSignal();
    void showDialingFailure();
    void hideDialingFailure();
    void showDialing3rdFailure();
    void showIncomingCall();
    void dismissIncomingCall();
    void showWaitingCall();
    void dismissWaitingCall();
    void showCallAcceptanceFailure();
    void showDeviceIssueFixHint();
    void showCallEnded();
    void showMissedCall();
    void showRoamingWarning();
    void showBatteryLow();
    void showPhoneConnectionUnstablePopup();
    void showPhoneConnectionLost();
    void hidePhoneConnectionLost();
    void showUnableToConnect();
    void hideUnableToConnect();
    void showHandsFreeError();
    void showRedial();
    void showTransferToPhone();
    void hideTransferToPhone();
    void showPhoneBookDownloadFailedRetryAvailable();
    void showPhoneBookDownloadFailed();
    void showSmsDownloadFailedRetryAvailable();
    void showSmsDownloadFailed();
    void newTextMessageAlert1Show();
    void newTextMessageAlert2Show();
    void newTextMessageAlert2Hide();
    void showTextMessagingOff();
    void hideTextMessagingOff();
    void showMessageAccessProfileNotSupported();
    void showMessageAccessNotGranted();
    void showMessageWaitingForResponseFromPhone();
    void hideMessageWaitingForResponseFromPhone();
    void showMessagesDownloading();
    void hideMessagesDownloading();
    void showMessagesDownloadFailed();
    void showMessagesRetryDownloadFailed();
    void hideMessagesDownloadFailed();
    void showSendTextMessage();
    void hideSendTextMessage();
    void showSendTextMessageProgress();
    void hideSendTextMessageProgress();
    void showSendTextMessageSuccess();
    void showSendTextMessageNoResponseFromPhone();
    void showSendTextMessageFailure();
    void hideSendTextMessageFailure();
    void showPhoneBookDownloadCompletePopup();
    void hidePhoneBookDownloadCompletePopup();
    void showRetrySendMessageFailure();
    void showSendMessageNetworkFailure();
    void showMultipleTextMessagePopup();
    void hideMultipleTextMessagePopup();
    void showDTMFKeyPressNoResponseErrorPopup();
    void hideDTMFKeyPressNoResponseErrorPopup();
    void showPhoneAudioTransferErrorPopup();
    void hidePhoneAudioTransferErrorPopup();
    void showPhoneCallStandByModePopup();
    void hidePhoneCallStandByModePopup();
    void showUnstableConnectionWithKovaPopup();
    void hideUnstableConnectionWithKovaPopup();
    void showPhoneSiriNoResponseErrorPopup();
    void hidePhoneSiriNoResponseErrorPopup();
    void showPhoneContactsTooLargeErrorPopup();
    void hidePhoneContactsTooLargeErrorPopup();
    void showSiriNotEnabledErrorPopup();
    void hideSiriNotEnabledErrorPopup();
    void showPhoneDndActiveArdel();
    void hidePhoneDndActiveArdel();

private:
    void request(const QString &viewId);
    void dismiss(const QString &viewId);

    Brisken::ViewController *m_viewController = nullptr;
};

} // namespace HmiPhone
