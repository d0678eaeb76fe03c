pragma Singleton
import QtQuick 2.15

QtObject {
    readonly property color background: "#101418"
    readonly property color surface: "#1b222a"
    readonly property color raised: "#26303a"
    readonly property color accent: "#2e86de"
    readonly property color accept: "#27ae60"
    readonly property color reject: "#c0392b"
    readonly property color text: "#e8eef3"
    readonly property color dim: "#8a98a6"
    readonly property string font: "DejaVu Sans"
}
