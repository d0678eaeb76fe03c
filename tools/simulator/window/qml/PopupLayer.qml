import QtQuick 2.15
import "Views.js" as Views

// The popups over the screen, stacked as the framework holds them: the top one of each region
// in front with its buttons, the ones it covers behind it, dimmed.
Item {
    id: popupLayer
    property var popups: []
    property var controller

    Rectangle {
        anchors.fill: parent
        color: "#000000"
        opacity: popupLayer.popups.length > 0 ? 0.55 : 0
    }

    Repeater {
        model: popupLayer.popups
        Rectangle {
            id: card
            // A popup without buttons of its own gets a plain close button.
            readonly property var popupActions: {
                var actions = Views.actionsFor(modelData.name);
                return actions.length > 0 ? actions : [["OK"]];
            }
            readonly property int stackDepth: popupLayer.popups.length - 1 - index
            objectName: "popup:" + modelData.name
            property string viewId: modelData.id
            property bool isTop: modelData.top

            width: 760
            height: 340
            x: (popupLayer.width - width) / 2 - stackDepth * 36
            y: (popupLayer.height - height) / 2 - stackDepth * 36
            radius: 16
            color: Theme.surface
            border.color: isTop ? Theme.accent : "#3a4754"
            border.width: 2
            opacity: isTop ? 1 : 0.6

            // A covered popup keeps its title in the strip that shows above the one over it.
            Text {
                anchors.horizontalCenter: parent.horizontalCenter
                y: card.isTop ? 56 : 4
                width: parent.width - 64
                horizontalAlignment: card.isTop ? Text.AlignHCenter : Text.AlignLeft
                wrapMode: Text.Wrap
                text: Views.title(modelData.name)
                color: Theme.text
                font.family: Theme.font
                font.pixelSize: card.isTop ? 38 : 24
            }
            Text {
                anchors.right: parent.right
                anchors.bottom: parent.bottom
                anchors.margins: 10
                text: modelData.id + (card.isTop ? "" : "  (covered)")
                color: Theme.dim
                font.family: Theme.font
                font.pixelSize: 16
            }
            Row {
                anchors.horizontalCenter: parent.horizontalCenter
                anchors.bottom: parent.bottom
                anchors.bottomMargin: 48
                spacing: 16
                enabled: card.isTop
                Repeater {
                    model: card.popupActions
                    Button {
                        width: Math.min(implicitWidth, (card.width - 48) / card.popupActions.length - 16)
                        text: modelData[0]
                        slot: modelData[1] || "close"
                        tint: slot.indexOf("accept") === 0 ? Theme.accept
                              : slot.indexOf("reject") === 0 ? Theme.reject : Theme.raised
                        // The driver's answer, played as a step so that the trace shows it; after
                        // this handler, since the answer may close the popup and this button.
                        onClicked: Qt.callLater(_scenario.input,
                                                JSON.stringify(Views.answer(card.viewId, modelData)))
                    }
                }
            }
        }
    }
}
