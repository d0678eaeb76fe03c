#pragma once

// The numbers the module compares or sends, by name: the phone's call status, the intent actions,
// the view manager's display contexts, the projection modes, and the hard-key codes and press
// kinds. The values are the platform's and the phone's; only the names are the module's.

namespace HmiPhone {

// The call status of the phone source (PhoneSource::status()). 0 to 2 count as no call in
// progress, 3 to 5 as a call in progress. An outgoing set-up passes to its connected value:
// 3 to 7, 4 to 9, 5 to 10, 6 to 11.
namespace CallStatus {
inline constexpr int NoCall = 0;
inline constexpr int SetUpOrFailure = 1;
inline constexpr int LastWithoutCall = 2;
inline constexpr int OutgoingSetUp = 3;
inline constexpr int OutgoingSetUpBesideCall = 4;
inline constexpr int OutgoingSetUpBesideTwoCalls = 5;
inline constexpr int OutgoingSetUpRefusing = 6;
inline constexpr int LastCallInProgress = 5;
inline constexpr int OneCallConnected = 7;
inline constexpr int SwappableCallsConnected = 9; // two calls the driver can swap
inline constexpr int TwoCallsConnected = 10;
inline constexpr int FurtherCallRefused = 11; // a further incoming call is refused
inline constexpr int Standby = 12; // the call is transferred to the handset
} // namespace CallStatus

// Intent actions, in the platform's numbering: those the phone handles and those it asks of
// other modules (some are both).
namespace IntentAction {
inline constexpr int CallNumber = 1;
inline constexpr int PhoneSettings = 7;
inline constexpr int BluetoothModuleOff = 13;
inline constexpr int PairPhone = 14;
inline constexpr int BluetoothDevices = 15;
inline constexpr int NavigationPoiByAddress = 20;
inline constexpr int AddPhone = 28;
inline constexpr int StatusBarAlerts = 32;
inline constexpr int SiriNotEnabled = 47;
inline constexpr int ConnectedDeviceSettings = 51;
inline constexpr int PhoneConnectSuccess = 53;
inline constexpr int PhoneRoot = 56;
inline constexpr int PhoneAttemptingReconnect = 61;
inline constexpr int PhoneBookStatusCheck = 67;
inline constexpr int ManageContactsSettings = 68;
inline constexpr int NoPhoneConnected = 70;
} // namespace IntentAction

// The view manager's display contexts (ViewManager::displayContext()) the module tells apart,
// named by what the module does in them.
namespace DisplayContext {
inline constexpr int Default = 0;
inline constexpr int WithoutCallScreens = 1;
inline constexpr int DownloadCompletePopup = 2;
inline constexpr int CallScreensWithoutRoute = 5;
inline constexpr int DownloadCompletePopupToo = 6;
} // namespace DisplayContext

// The projection source's modes (ProjectionSource::projectionMode()).
namespace ProjectionMode {
inline constexpr int None = 0;
inline constexpr int PhoneProjection = 1; // a projected phone that may own the calls
} // namespace ProjectionMode

// Hard-key codes of the key source (KeySource::keyEvent(key, kind)).
namespace Key {
inline constexpr int Phone = 12;
inline constexpr int SendAccept = 49;
inline constexpr int EndReject = 50;
inline constexpr int AcceptOrSeekLeft = 77;
inline constexpr int RejectOrSeekRight = 78;
inline constexpr int SendAccept2 = 79;
inline constexpr int EndReject2 = 80;
inline constexpr int SteeringWheelSeekDown = 90; // accepts a call, or seeks down
inline constexpr int SteeringWheelSeekUp = 91; // rejects a call, or seeks up
} // namespace Key

// Press kinds of the key source.
namespace KeyPress {
inline constexpr int Press = 1;
inline constexpr int ShortPress = 2;
inline constexpr int LongPress = 3;
inline constexpr int LongPressRelease = 4;
} // namespace KeyPress

// The text-message alert on screen (the global handler's alert state).
namespace TextMessageAlert {
inline constexpr int None = 0;
inline constexpr int Single = 1; // "NewTextMessageAlert2"
inline constexpr int Multiple = 2; // "MultipleTextMessagesReceived"
} // namespace TextMessageAlert

// The phone's text-message download (PhoneSource::messagesDownloadingStatus()): 0 to 3 have not
// failed.
namespace MessagesDownload {
inline constexpr int NotStarted = 0;
inline constexpr int Running = 2;
inline constexpr int Finished = 3;
inline constexpr int Failed = 4;
} // namespace MessagesDownload

// The outcome of sending a text message (PhoneSource::sendMessageStatusChanged(int)).
namespace SendMessageStatus {
inline constexpr int NotSent = 0;
inline constexpr int Failed = 1;
inline constexpr int Sent = 2;
inline constexpr int NetworkFailure = 3;
} // namespace SendMessageStatus

} // namespace HmiPhone
