import QtQuick 2.15
import "Views.js" as Views

// The head unit's display: the status bar, the view on screen and the popups over it. `viewId`
// and `popups` follow the framework; a test may set them to draw any view.
Rectangle {
    id: display
    property string viewId: _headUnit.view
    property var popups: _headUnit.popups
    readonly property var controller: _hmiphoneController
    readonly property Item page: screen.item

    color: Theme.background
    clip: true

    StatusBar {
        id: statusBar
        width: parent.width
        height: 64
        controller: display.controller
    }

    Loader {
        id: screen
        objectName: "screen"
        y: statusBar.height
        width: parent.width
        height: parent.height - statusBar.height
        source: "screens/" + Views.screenFor(display.viewId) + ".qml"
    }
    Binding {
        target: screen.item
        property: "viewId"
        value: display.viewId
    }

    Text {
        objectName: "viewIdentifier"
        anchors.right: parent.right
        anchors.bottom: parent.bottom
        anchors.margins: 8
        text: display.viewId
        color: Theme.dim
        font { family: Theme.font; pixelSize: 16 }
    }

    PopupLayer {
        objectName: "popups"
        y: statusBar.height
        width: parent.width
        height: parent.height - statusBar.height
        popups: display.popups
    }
}
