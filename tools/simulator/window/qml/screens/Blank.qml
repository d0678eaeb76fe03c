import QtQuick 2.15
import ".."

// No view on screen: the HMI has not started, or no view state is active.
Page {
    Text {
        anchors.centerIn: parent
        text: qsTr("No view")
        color: Theme.dim
        font { family: Theme.font; pixelSize: 28 }
    }
}
