import QtQuick 2.15

// The inside of a popup card: its title, its text, what it shows of the phone's data (the
// content), and its buttons. Each button is the driver's answer to the popup: an `answer` step of
// the scenario, so that the trace shows it and the framework closes the popup the module leaves
// to it. An action is {text, call, args, tint}; one without `call` is the popup's plain close.
Item {
    id: frame
    property string viewId: ""
    readonly property string name: viewId.substring(viewId.lastIndexOf(".") + 1)
    property bool isTop: true
    property string title: ""
    property string text: ""
    property var actions: [{ "text": qsTr("OK") }]
    default property alias content: body.data

    function answer(action) {
        var step = { "answer": frame.viewId };
        if (action.call) {
            step.call = action.call;
            step.args = action.args || [];
        }
        return JSON.stringify(step);
    }

    // A covered popup keeps its title in the strip that shows above the one over it.
    Text {
        objectName: "title"
        anchors.horizontalCenter: parent.horizontalCenter
        y: frame.isTop ? 28 : 4
        width: parent.width - 64
        horizontalAlignment: frame.isTop ? Text.AlignHCenter : Text.AlignLeft
        elide: Text.ElideRight
        text: frame.title
        color: Theme.text
        font { family: Theme.font; pixelSize: frame.isTop ? 36 : 24 }
    }
    Text {
        objectName: "text"
        visible: frame.isTop
        anchors.horizontalCenter: parent.horizontalCenter
        y: 84
        width: parent.width - 80
        horizontalAlignment: Text.AlignHCenter
        wrapMode: Text.Wrap
        maximumLineCount: 2
        elide: Text.ElideRight
        text: frame.text
        color: Theme.dim
        font { family: Theme.font; pixelSize: 26 }
    }
    Item {
        id: body
        visible: frame.isTop
        x: 40
        y: 84
        width: parent.width - 80
        height: parent.height - 84 - 112
    }
    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        anchors.bottom: parent.bottom
        anchors.bottomMargin: 24
        spacing: 16
        enabled: frame.isTop
        Repeater {
            model: frame.actions
            Button {
                required property var modelData
                width: Math.min(implicitWidth, (frame.width - 48) / frame.actions.length - 16)
                fontSize: frame.actions.length > 4 ? 22 : 26
                text: modelData.text
                slot: modelData.call || "close"
                tint: modelData.tint === "accept" ? Theme.accept
                      : modelData.tint === "reject" ? Theme.reject : Theme.raised
                // After this handler: the answer may close the popup and this button with it.
                onClicked: Qt.callLater(_scenario.input, frame.answer(modelData))
            }
        }
    }
}
