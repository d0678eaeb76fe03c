import QtQuick 2.15
import ".."

// The recent calls: the list types, and the list the phone last sent, dialled by type and row.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property int type: phone.currentRecentCallListType

    Row {
        spacing: 16
        Repeater {
            model: ["All", "Missed", "Received", "Dialled"]
            Button {
                text: modelData
                slot: "requestRecentCallsList"
                checked: page.type === index
                onClicked: _hmiphoneController.requestRecentCallsList(index)
            }
        }
    }
    ListView {
        objectName: "recentCalls"
        y: 96
        width: parent.width
        height: parent.height - 96
        clip: true
        model: phone.recentCallList()
        delegate: ListRow {
            width: ListView.view.width
            text: model.name || model.number
            detail: model.time
            onClicked: _hmiphoneController.dialRecentCall(page.type, index)
        }
    }
}
