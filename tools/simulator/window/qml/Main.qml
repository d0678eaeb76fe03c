import QtQuick 2.15

// The window: the head unit's display, and beside it the car's keys, the phone's side, the
// scenario controls and the trace. Drawn on a 1920 x 1080 canvas scaled to the window; off
// screen only the display is drawn, at 1280 x 720.
Item {
    id: root
    property bool displayOnly: false
    width: 1280
    height: 720

    Rectangle {
        anchors.fill: parent
        color: "#05070a"
    }

    Item {
        id: canvas
        width: root.displayOnly ? 1280 : 1920
        height: root.displayOnly ? 720 : 1080
        scale: Math.min(root.width / width, root.height / height)
        transformOrigin: Item.TopLeft

        Display {
            id: display
            objectName: "display"
            width: 1280
            height: 720
        }

        Panels {
            visible: !root.displayOnly
            x: 1280
            width: 640
            height: 720
        }

        ScenarioBar {
            visible: !root.displayOnly
            y: 720
            width: 1920
            height: 360
        }
    }
}
