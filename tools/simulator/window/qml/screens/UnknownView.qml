import QtQuick 2.15
import ".."

// A view of the phone that has no screen of its own here: its identifier, so that it shows.
Page {
    id: page
    title: qsTr("Phone")
    Text {
        text: page.viewId
        color: Theme.dim
        font { family: Theme.font; pixelSize: 24 }
    }
}
