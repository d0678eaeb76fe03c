import QtQuick 2.15
import ".."

// "BatteryLow": the phone's battery, as the phone reports its level (0 to 5).
PopupFrame {
    readonly property int level: _hmiphoneController.phoneSource.deviceBatteryLevel
    title: qsTr("Phone battery low")
    text: qsTr("Battery level %1 of 5: charge the phone soon.").arg(Math.max(0, level))
}
