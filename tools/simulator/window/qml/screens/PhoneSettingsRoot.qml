import QtQuick 2.15
import ".."

// "PhoneSettingsRoot": the phone's settings on their way; the phone decides on entry whether it
// shows its settings or what is missing for them.
Page {
    title: qsTr("Phone settings")
    Text {
        text: qsTr("Looking for the phone\u2026")
        color: Theme.dim
        font { family: Theme.font; pixelSize: 28 }
    }
}
