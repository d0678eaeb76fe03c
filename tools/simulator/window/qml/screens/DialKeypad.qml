import QtQuick 2.15
import ".."

// "DialKeypad": the number being entered (the phone source keeps it), the keys, delete, and the
// call. A full number takes no more keys; "0" held gives "+".
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("Keypad")
    subtitle: _hmiphoneController.isMaximumSizeOfNumber
              ? qsTr("%n digits at most", "", _hmiphoneController.maximumSizeOfNumber) : ""

    Text {
        objectName: "number"
        width: 540
        horizontalAlignment: Text.AlignHCenter
        elide: Text.ElideLeft
        text: page.phone.callNumberEntered.length > 0 ? page.phone.callNumberEntered
                                                      : qsTr("Enter a number")
        color: page.phone.callNumberEntered.length > 0 ? Theme.text : Theme.dim
        font { family: Theme.font; pixelSize: 44 }
    }
    Keypad {
        y: 72
        keysEnabled: !_hmiphoneController.isMaximumSizeOfNumber
        onPressed: _hmiphoneController.dialPadButtonPressed(key)
        onHeld: if (key === "0") _hmiphoneController.dialPadButtonPressed("+")
    }
    Column {
        x: 620
        y: 72
        spacing: 14
        Button {
            width: 300
            text: qsTr("Delete")
            slot: "dialPadBackSpacePressed"
            enabled: !_hmiphoneController.isEmptyNumber
            onClicked: _hmiphoneController.dialPadBackSpacePressed()
            onPressAndHold: _hmiphoneController.dialPadBackSpaceLongPress()
        }
        Button {
            width: 300
            text: qsTr("Call")
            slot: "makeCall"
            tint: Theme.accept
            enabled: !_hmiphoneController.isEmptyNumber
            onClicked: _hmiphoneController.makeCall()
        }
        Button {
            width: 300
            text: qsTr("Read it out")
            slot: "dialPadSpeakItPressed"
            enabled: !_hmiphoneController.isEmptyNumber
            onClicked: _hmiphoneController.dialPadSpeakItPressed()
        }
    }
}
