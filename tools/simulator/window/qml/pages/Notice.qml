import QtQuick 2.15
import ".."
import "../Views.js" as Views

// Every other screen of the phone: a download, a failure, an alert, a contact. Its title comes
// from the view's name and its buttons from the same table as the popups'.
Page {
    id: page
    Text {
        width: parent.width
        wrapMode: Text.Wrap
        text: page.viewId
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 24
    }
    Row {
        y: 160
        spacing: 20
        Repeater {
            model: Views.actionsFor(page.name)
            Button {
                text: modelData[0]
                slot: modelData[1]
                onClicked: Views.invoke(_hmiphoneController, modelData)
            }
        }
    }
}
