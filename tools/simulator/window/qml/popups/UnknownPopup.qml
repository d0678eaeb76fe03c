import QtQuick 2.15
import ".."

// A popup of the phone with no file of its own here: its identifier, so that it shows.
PopupFrame {
    title: qsTr("Phone")
    text: viewId
}
