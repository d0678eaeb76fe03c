import QtQuick 2.15
import ".."

// The twelve keys of a phone keypad; `pressed` names the key, `held` a long press.
Grid {
    id: keypad
    signal pressed(string key)
    signal held(string key)
    property bool keysEnabled: true

    columns: 3
    spacing: 14
    Repeater {
        model: ["1", "2", "3", "4", "5", "6", "7", "8", "9", "*", "0", "#"]
        Button {
            required property string modelData
            objectName: "key:" + modelData
            width: 170
            height: 76
            text: modelData
            fontSize: 36
            enabled: keypad.keysEnabled
            onClicked: keypad.pressed(modelData)
            onPressAndHold: keypad.held(modelData)
        }
    }
}
