import QtQuick 2.15
import ".."
import "../Format.js" as Format

// "RecentCalls": the list of the type asked for (all, missed, received, dialled), newest first,
// as the phone last sent it; a row dials that call again.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property int type: phone.currentRecentCallListType
    readonly property var calls: phone.recentCallList()

    title: qsTr("Recent calls")
    subtitle: phone.recentCallListStatus === 3 ? qsTr("Downloading") : ""

    Row {
        spacing: 16
        Repeater {
            model: [qsTr("All"), qsTr("Missed"), qsTr("Received"), qsTr("Dialled")]
            Button {
                required property string modelData
                required property int index
                text: modelData
                slot: "requestRecentCallsList"
                checked: page.type === index
                onClicked: _hmiphoneController.requestRecentCallsList(index)
            }
        }
    }
    ListView {
        objectName: "recentCalls"
        y: 92
        width: parent.width
        height: parent.height - 92
        clip: true
        model: page.calls
        delegate: Item {
            id: call
            required property int index
            required property string name
            required property string number
            required property int type
            required property string time
            width: ListView.view.width
            height: 64
            ListRow {
                anchors.fill: parent
                text: Format.who(call.name, call.number)
                detail: Format.recentCallType(call.type) + "  " + call.time
                onClicked: _hmiphoneController.dialRecentCall(page.type, call.index)
            }
            Rectangle {
                visible: call.type === 1
                width: 6
                height: parent.height - 16
                y: 8
                color: Theme.reject
            }
        }
    }
    Text {
        visible: page.calls.count === 0
        y: 120
        text: qsTr("No recent calls")
        color: Theme.dim
        font { family: Theme.font; pixelSize: 28 }
    }
}
