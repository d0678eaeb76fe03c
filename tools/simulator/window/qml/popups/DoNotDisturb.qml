import QtQuick 2.15
import ".."

// "PhoneDndActiveArdel": this key keeps do not disturb on.
PopupFrame {
    title: qsTr("Do not disturb stays on")
    text: qsTr("The key in use does not allow switching it off.")
}
