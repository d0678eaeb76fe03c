import QtQuick 2.15

// A row of a settings page: its label and, on the right, its value ("On"/"Off" for a switch, a
// tick for the chosen entry of a list, an arrow for a way to another page). `slot` names the
// controller call it makes (its object name is then "action:<slot>").
ListRow {
    property string slot: ""
    property string kind: "page" // "switch", "choice" or "page"
    property bool on: false

    objectName: slot.length > 0 ? "action:" + slot : ""
    height: 76
    detail: kind === "switch" ? (on ? qsTr("On") : qsTr("Off"))
            : kind === "choice" ? (on ? "\u2713" : "") : "\u203A"
}
