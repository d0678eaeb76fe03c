import QtQuick 2.15
import ".."

// A view of another module of the head unit (the home screen, settings, ...).
Page {
    Text {
        anchors.centerIn: parent
        horizontalAlignment: Text.AlignHCenter
        text: "A view of another module"
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 28
    }
}
