.pragma library

// Texts the views make from the phone's values.

// Who a call or a message is with: the contact's name, else the number, else nobody known.
function who(name, number) {
    if (name && name.length > 0)
        return name;
    if (number && number.length > 0)
        return number;
    return qsTr("Unknown");
}

// A call's length, "4:05" or "1:02:09".
function duration(seconds) {
    var s = Math.max(0, Math.floor(seconds));
    var h = Math.floor(s / 3600);
    var m = Math.floor(s / 60) % 60;
    var rest = s % 60;
    var mm = h > 0 && m < 10 ? "0" + m : "" + m;
    return (h > 0 ? h + ":" : "") + mm + ":" + (rest < 10 ? "0" : "") + rest;
}

// What a call is doing, as the call list names it.
function callState(state) {
    switch (state) {
    case "incoming": return qsTr("Incoming call");
    case "waiting": return qsTr("Call waiting");
    case "dialing": return qsTr("Dialling");
    case "active": return qsTr("Connected");
    case "held": return qsTr("On hold");
    }
    return "";
}

// The kind of a recent call (1 missed, 2 received, 3 dialled).
function recentCallType(type) {
    switch (type) {
    case 1: return qsTr("Missed");
    case 2: return qsTr("Received");
    case 3: return qsTr("Dialled");
    }
    return "";
}
