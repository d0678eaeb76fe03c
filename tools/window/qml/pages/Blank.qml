import QtQuick 2.15
import ".."

// Nothing on screen yet: the HMI has not started.
Page {
    title: ""
    Text {
        anchors.centerIn: parent
        text: "Starting\u2026"
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 28
    }
}
