import QtQuick 2.15
import "Views.js" as Views

// The popups over the screen, stacked as the framework holds them: the top one of each region
// in front, the ones it covers behind it, dimmed. Each card draws its popup with the popup file
// of its kind.
Item {
    id: popupLayer
    property var popups: []

    Rectangle {
        anchors.fill: parent
        color: "#000000"
        opacity: popupLayer.popups.length > 0 ? 0.55 : 0
    }

    Repeater {
        model: popupLayer.popups
        Rectangle {
            id: card
            required property var modelData
            required property int index
            readonly property int stackDepth: popupLayer.popups.length - 1 - index
            property string viewId: modelData.id
            property bool isTop: modelData.top
            objectName: "popup:" + modelData.name

            width: 860
            height: 380
            x: (popupLayer.width - width) / 2 - stackDepth * 36
            y: (popupLayer.height - height) / 2 - stackDepth * 36
            radius: 16
            color: Theme.surface
            border.color: isTop ? Theme.accent : "#3a4754"
            border.width: 2
            opacity: isTop ? 1 : 0.6

            // A card lives as long as its popup keeps its place in the stack: the popup file is
            // made for it once, knowing which popup it draws.
            Loader {
                id: content
                anchors.fill: parent
                Component.onCompleted: setSource("popups/" + Views.popupFor(card.viewId) + ".qml",
                                                 { "viewId": card.viewId, "isTop": card.isTop })
            }
            Text {
                anchors.right: parent.right
                anchors.bottom: parent.bottom
                anchors.margins: 8
                text: card.viewId
                color: Theme.dim
                font { family: Theme.font; pixelSize: 14 }
            }
        }
    }
}
