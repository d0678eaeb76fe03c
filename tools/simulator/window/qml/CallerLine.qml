import QtQuick 2.15
import "Format.js" as Format

// One call of the phone's call list: who, the number under the name, what the call is doing and
// how long it has been connected.
Item {
    id: line
    required property string name
    required property string number
    required property string callState
    required property int duration
    property int fontSize: 40

    implicitWidth: 600
    implicitHeight: who.height + details.height + 8

    Text {
        id: who
        objectName: "caller"
        width: parent.width
        elide: Text.ElideRight
        text: Format.who(line.name, line.number)
        color: Theme.text
        font { family: Theme.font; pixelSize: line.fontSize }
    }
    Text {
        id: details
        objectName: "callDetails"
        anchors.top: who.bottom
        anchors.topMargin: 8
        width: parent.width
        elide: Text.ElideRight
        // The number only when the name stands above it.
        text: [line.name.length > 0 ? line.number : "", Format.callState(line.callState),
               line.callState === "active" || line.callState === "held"
               ? Format.duration(line.duration) : ""].filter(function (part) {
                   return part.length > 0; }).join("  \u00B7  ")
        color: Theme.dim
        font { family: Theme.font; pixelSize: Math.round(line.fontSize * 0.65) }
    }
}
