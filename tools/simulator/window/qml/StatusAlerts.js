.pragma library

// The phone's status alerts as the driver reads them, by alert id (1001 to 1010), and how each is
// fixed: "contacts" downloads the contacts again, "messages" the messages, "support" calls the
// support number the alert carries.

function title(alertId) {
    switch (alertId) {
    case 1001: return qsTr("Contacts could not be downloaded");
    case 1002: return qsTr("Messages could not be downloaded");
    case 1003: return qsTr("Hands-free audio problem");
    case 1004: return qsTr("Phone connection unstable");
    case 1005: return qsTr("Phone software out of date");
    case 1006: return qsTr("Phone storage full");
    case 1007: return qsTr("Voice assistant not set up");
    case 1008: return qsTr("Too many contacts");
    case 1009: return qsTr("Phone not responding");
    case 1010: return qsTr("Pairing needs renewing");
    }
    return qsTr("Phone alert %1").arg(alertId);
}

function fix(alertId) {
    switch (alertId) {
    case 1001: return "contacts";
    case 1002: return "messages";
    }
    return "support";
}
