import QtQuick 2.15

// Below: play, pause and step through a scenario, the virtual time, and the trace.
Rectangle {
    id: bar
    color: "#0b0e12"

    Column {
        x: 20
        y: 16
        width: 440
        spacing: 12
        Row {
            spacing: 10
            Button {
                objectName: "scenario:play"
                width: 140
                height: 56
                fontSize: 20
                enabled: _scenario.next < _scenario.count
                text: _scenario.playing ? qsTr("Pause") : qsTr("Play")
                onClicked: _scenario.playing ? _scenario.pause() : _scenario.play()
            }
            Button {
                objectName: "scenario:step"
                width: 140
                height: 56
                fontSize: 20
                enabled: _scenario.next < _scenario.count && !_scenario.waiting
                text: qsTr("Step")
                onClicked: _scenario.step()
            }
        }
        Text {
            width: parent.width
            text: _scenario.count === 0 ? qsTr("No scenario")
                  : (_scenario.waiting ? qsTr("Line %1 of %2 (waiting)") : qsTr("Line %1 of %2"))
                    .arg(Math.min(_scenario.next + 1, _scenario.count)).arg(_scenario.count)
            color: Theme.dim
            font.family: Theme.font
            font.pixelSize: 20
        }
        Text {
            width: parent.width
            wrapMode: Text.WrapAnywhere
            maximumLineCount: 4
            elide: Text.ElideRight
            text: _scenario.nextText
            color: Theme.text
            font.family: "DejaVu Sans Mono"
            font.pixelSize: 18
        }
        Text {
            text: "t = " + (_headUnit.time / 1000).toFixed(3) + " s"
            color: Theme.dim
            font.family: "DejaVu Sans Mono"
            font.pixelSize: 20
        }
    }

    ListView {
        id: trace
        objectName: "trace"
        x: 480
        y: 8
        width: parent.width - 490
        height: parent.height - 16
        clip: true
        model: _trace
        onCountChanged: positionViewAtEnd()
        delegate: Text {
            width: trace.width
            elide: Text.ElideRight
            text: display
            color: display.indexOf(" check ") >= 0 ? Theme.reject
                   : display.indexOf(" > ") >= 0 ? Theme.accent : Theme.text
            font.family: "DejaVu Sans Mono"
            font.pixelSize: 17
        }
    }
}
