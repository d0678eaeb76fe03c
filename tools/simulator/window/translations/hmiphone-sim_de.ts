<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>BatteryLow</name>
    <message>
        <source>Phone battery low</source>
        <translation>Akku des Telefons schwach</translation>
    </message>
    <message>
        <source>Battery level %1 of 5: charge the phone soon.</source>
        <translation>Akkustand %1 von 5: Telefon bald aufladen.</translation>
    </message>
</context>
<context>
    <name>Blank</name>
    <message>
        <source>No view</source>
        <translation>Keine Ansicht</translation>
    </message>
</context>
<context>
    <name>CallEnded</name>
    <message>
        <source>Call ended</source>
        <translation>Anruf beendet</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>CallInProgress</name>
    <message>
        <source>Two calls</source>
        <translation>Zwei Anrufe</translation>
    </message>
    <message>
        <source>Muted</source>
        <translation>Stumm an</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Stumm</translation>
    </message>
    <message>
        <source>Handset</source>
        <translation>Am Telefon</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>Tastatur</translation>
    </message>
    <message>
        <source>Swap</source>
        <translation>Wechseln</translation>
    </message>
    <message>
        <source>Join</source>
        <translation>Konferenz</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>Auflegen</translation>
    </message>
    <message>
        <source>Unknown</source>
        <translation>Unbekannt</translation>
    </message>
    <message>
        <source>Call</source>
        <comment>screen</comment>
        <extracomment>The title of the screen of a call in progress.</extracomment>
        <translation>Anruf</translation>
    </message>
</context>
<context>
    <name>CallProblem</name>
    <message>
        <source>Call failed</source>
        <translation>Anruf fehlgeschlagen</translation>
    </message>
    <message>
        <source>%1 could not be called.</source>
        <translation>%1 konnte nicht angerufen werden.</translation>
    </message>
    <message>
        <source>Call failed again</source>
        <translation>Anruf erneut fehlgeschlagen</translation>
    </message>
    <message>
        <source>Please check the number and the phone&apos;s signal.</source>
        <translation>Bitte Nummer und Empfang des Telefons prüfen.</translation>
    </message>
    <message>
        <source>No signal</source>
        <translation>Kein Empfang</translation>
    </message>
    <message>
        <source>The phone has no mobile network.</source>
        <translation>Das Telefon hat kein Mobilfunknetz.</translation>
    </message>
    <message>
        <source>The phone does not answer</source>
        <translation>Das Telefon antwortet nicht</translation>
    </message>
    <message>
        <source>The call could not be answered.</source>
        <translation>Der Anruf konnte nicht angenommen werden.</translation>
    </message>
    <message>
        <source>Phone on stand-by</source>
        <translation>Telefon im Ruhezustand</translation>
    </message>
    <message>
        <source>Calls wait until the phone is back.</source>
        <translation>Anrufe warten, bis das Telefon zurück ist.</translation>
    </message>
    <message>
        <source>Tone not sent</source>
        <translation>Ton nicht gesendet</translation>
    </message>
    <message>
        <source>The phone did not send the tone.</source>
        <translation>Das Telefon hat den Ton nicht gesendet.</translation>
    </message>
    <message>
        <source>Audio problem</source>
        <translation>Tonproblem</translation>
    </message>
    <message>
        <source>The call&apos;s audio could not be moved.</source>
        <translation>Der Ton des Anrufs konnte nicht umgeleitet werden.</translation>
    </message>
    <message>
        <source>Hands-free problem</source>
        <translation>Problem mit der Freisprechanlage</translation>
    </message>
    <message>
        <source>Use the phone itself for this call.</source>
        <translation>Diesen Anruf bitte am Telefon selbst führen.</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Beenden</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>CarKeys</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>Send</source>
        <translation>Senden</translation>
    </message>
    <message>
        <source>End</source>
        <translation>Ende</translation>
    </message>
    <message>
        <source>Accept/◀</source>
        <translation>Annehmen/◀</translation>
    </message>
    <message>
        <source>Reject/▶</source>
        <translation>Ablehnen/▶</translation>
    </message>
    <message>
        <source>Send 2</source>
        <translation>Senden 2</translation>
    </message>
    <message>
        <source>End 2</source>
        <translation>Ende 2</translation>
    </message>
    <message>
        <source>Wheel ▼</source>
        <translation>Rad ▼</translation>
    </message>
    <message>
        <source>Wheel ▲</source>
        <translation>Rad ▲</translation>
    </message>
</context>
<context>
    <name>Connection</name>
    <message>
        <source>Phone disconnected</source>
        <translation>Telefon getrennt</translation>
    </message>
    <message>
        <source>The connection to the phone was lost.</source>
        <translation>Die Verbindung zum Telefon ist abgebrochen.</translation>
    </message>
    <message>
        <source>Connection unstable</source>
        <translation>Verbindung instabil</translation>
    </message>
    <message>
        <source>The connection to the phone keeps dropping.</source>
        <translation>Die Verbindung zum Telefon bricht immer wieder ab.</translation>
    </message>
    <message>
        <source>Cannot connect</source>
        <translation>Keine Verbindung möglich</translation>
    </message>
    <message>
        <source>The phone could not be connected.</source>
        <translation>Das Telefon konnte nicht verbunden werden.</translation>
    </message>
    <message>
        <source>Customer support can help with this phone.</source>
        <translation>Der Kundendienst hilft bei diesem Telefon.</translation>
    </message>
    <message>
        <source>Phone problem</source>
        <translation>Problem mit dem Telefon</translation>
    </message>
    <message>
        <source>A few steps may fix the phone.</source>
        <translation>Ein paar Schritte können das Telefon wieder in Ordnung bringen.</translation>
    </message>
    <message>
        <source>Pairing failed</source>
        <translation>Kopplung fehlgeschlagen</translation>
    </message>
    <message>
        <source>The phone could not be paired.</source>
        <translation>Das Telefon konnte nicht gekoppelt werden.</translation>
    </message>
    <message>
        <source>Fix</source>
        <translation>Beheben</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Call support</source>
        <translation>Kundendienst anrufen</translation>
    </message>
    <message>
        <source>Connect</source>
        <translation>Verbinden</translation>
    </message>
</context>
<context>
    <name>ContactDetails</name>
    <message>
        <source>Contact</source>
        <translation>Kontakt</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
    <message>
        <source>Read name</source>
        <translation>Name vorlesen</translation>
    </message>
    <message>
        <source>All contacts</source>
        <translation>Alle Kontakte</translation>
    </message>
</context>
<context>
    <name>ContactsDownload</name>
    <message>
        <source>Downloading contacts</source>
        <translation>Kontakte werden geladen</translation>
    </message>
    <message>
        <source>This may take a moment.</source>
        <translation>Das kann einen Moment dauern.</translation>
    </message>
    <message>
        <source>Waiting for the phone</source>
        <translation>Warten auf das Telefon</translation>
    </message>
    <message>
        <source>Allow access to contacts on the phone.</source>
        <translation>Zugriff auf die Kontakte am Telefon erlauben.</translation>
    </message>
    <message>
        <source>No access to contacts</source>
        <translation>Kein Zugriff auf Kontakte</translation>
    </message>
    <message>
        <source>Contacts not downloaded</source>
        <translation>Kontakte nicht geladen</translation>
    </message>
    <message>
        <source>The contacts could not be downloaded.</source>
        <translation>Die Kontakte konnten nicht geladen werden.</translation>
    </message>
    <message>
        <source>The download failed again.</source>
        <translation>Das Laden ist erneut fehlgeschlagen.</translation>
    </message>
    <message>
        <source>Download contacts?</source>
        <translation>Kontakte laden?</translation>
    </message>
    <message>
        <source>The contacts of this phone can be downloaded every time it connects.</source>
        <translation>Die Kontakte dieses Telefons können bei jeder Verbindung geladen werden.</translation>
    </message>
    <message>
        <source>Try again?</source>
        <translation>Erneut versuchen?</translation>
    </message>
    <message>
        <source>Too many contacts</source>
        <translation>Zu viele Kontakte</translation>
    </message>
    <message>
        <source>Only part of the contacts could be downloaded.</source>
        <translation>Nur ein Teil der Kontakte konnte geladen werden.</translation>
    </message>
    <message>
        <source>Contacts downloaded</source>
        <translation>Kontakte geladen</translation>
    </message>
    <message numerus="yes">
        <source>%n contacts</source>
        <translation>
            <numerusform>%n Kontakt</numerusform>
            <numerusform>%n Kontakte</numerusform>
        </translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Ja</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Nein</translation>
    </message>
    <message>
        <source>Try again</source>
        <translation>Erneut versuchen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeleteAllContacts</name>
    <message>
        <source>Delete all contacts?</source>
        <translation>Alle Kontakte löschen?</translation>
    </message>
    <message numerus="yes">
        <source>%n contacts will be deleted from the car. The phone keeps its own.</source>
        <translation>
            <numerusform>%n Kontakt wird aus dem Auto gelöscht. Das Telefon behält seine eigenen.</numerusform>
            <numerusform>%n Kontakte werden aus dem Auto gelöscht. Das Telefon behält seine eigenen.</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>DialKeypad</name>
    <message>
        <source>Keypad</source>
        <translation>Tastatur</translation>
    </message>
    <message numerus="yes">
        <source>%n digits at most</source>
        <translation>
            <numerusform>Höchstens %n Ziffer</numerusform>
            <numerusform>Höchstens %n Ziffern</numerusform>
        </translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>Nummer eingeben</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
    <message>
        <source>Read it out</source>
        <translation>Vorlesen</translation>
    </message>
</context>
<context>
    <name>DoNotDisturb</name>
    <message>
        <source>Do not disturb stays on</source>
        <translation>Nicht stören bleibt an</translation>
    </message>
    <message>
        <source>The key in use does not allow switching it off.</source>
        <translation>Der verwendete Schlüssel erlaubt das Ausschalten nicht.</translation>
    </message>
</context>
<context>
    <name>Format</name>
    <message>
        <source>Unknown</source>
        <translation>Unbekannt</translation>
    </message>
    <message>
        <source>Incoming call</source>
        <translation>Eingehender Anruf</translation>
    </message>
    <message>
        <source>Call waiting</source>
        <translation>Anruf wartet</translation>
    </message>
    <message>
        <source>Dialling</source>
        <translation>Wählt</translation>
    </message>
    <message>
        <source>Connected</source>
        <translation>Verbunden</translation>
    </message>
    <message>
        <source>On hold</source>
        <translation>Gehalten</translation>
    </message>
    <message>
        <source>Missed</source>
        <translation>Verpasst</translation>
    </message>
    <message>
        <source>Received</source>
        <translation>Angenommen</translation>
    </message>
    <message>
        <source>Dialled</source>
        <translation>Gewählt</translation>
    </message>
</context>
<context>
    <name>IncomingCall</name>
    <message>
        <source>Incoming call</source>
        <translation>Eingehender Anruf</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>Annehmen</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>Ablehnen</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Unbekannter Anrufer</translation>
    </message>
</context>
<context>
    <name>KeypadInCall</name>
    <message>
        <source>Tones</source>
        <translation>Töne</translation>
    </message>
    <message>
        <source>Hide keypad</source>
        <translation>Tastatur ausblenden</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>Auflegen</translation>
    </message>
</context>
<context>
    <name>MissedCall</name>
    <message>
        <source>Missed call</source>
        <translation>Verpasster Anruf</translation>
    </message>
    <message>
        <source>See the recent calls for who called.</source>
        <translation>Wer angerufen hat, steht in den letzten Anrufen.</translation>
    </message>
    <message>
        <source>Recent calls</source>
        <translation>Letzte Anrufe</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>MultipleTextMessages</name>
    <message>
        <source>New messages</source>
        <translation>Neue Nachrichten</translation>
    </message>
    <message numerus="yes">
        <source>%n new messages</source>
        <translation>
            <numerusform>%n neue Nachricht</numerusform>
            <numerusform>%n neue Nachrichten</numerusform>
        </translation>
    </message>
    <message>
        <source>View</source>
        <translation>Anzeigen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>NewTextMessage</name>
    <message>
        <source>New message from %1</source>
        <translation>Neue Nachricht von %1</translation>
    </message>
    <message>
        <source>Hear</source>
        <translation>Anhören</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Anzeigen</translation>
    </message>
    <message>
        <source>Reply</source>
        <translation>Antworten</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>OtherModule</name>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>Start</translation>
    </message>
    <message>
        <source>Another part of the head unit</source>
        <translation>Ein anderer Teil des Infotainments</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
</context>
<context>
    <name>Panels</name>
    <message>
        <source>long</source>
        <translation>lang</translation>
    </message>
    <message>
        <source>Car keys</source>
        <translation>Tasten im Auto</translation>
    </message>
    <message>
        <source>Menu bar</source>
        <translation>Menüleiste</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>Start</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>The phone</source>
        <translation>Das Telefon</translation>
    </message>
    <message>
        <source>Ring</source>
        <translation>Klingeln</translation>
    </message>
    <message>
        <source>Caller hangs up</source>
        <translation>Anrufer legt auf</translation>
    </message>
    <message>
        <source>Text message</source>
        <translation>SMS</translation>
    </message>
    <message>
        <source>Connect</source>
        <translation>Verbinden</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>Trennen</translation>
    </message>
    <message>
        <source>Link loss</source>
        <translation>Verbindungsabbruch</translation>
    </message>
    <message>
        <source>Battery −</source>
        <translation>Akku −</translation>
    </message>
    <message>
        <source>Battery +</source>
        <translation>Akku +</translation>
    </message>
</context>
<context>
    <name>PhoneBookEmpty</name>
    <message>
        <source>Contacts</source>
        <translation>Kontakte</translation>
    </message>
    <message>
        <source>The contacts are being downloaded from the phone.</source>
        <translation>Die Kontakte werden vom Telefon geladen.</translation>
    </message>
    <message>
        <source>The phone has no contacts.</source>
        <translation>Das Telefon hat keine Kontakte.</translation>
    </message>
    <message>
        <source>The phone did not allow access to its contacts.</source>
        <translation>Das Telefon hat den Zugriff auf seine Kontakte nicht erlaubt.</translation>
    </message>
    <message>
        <source>The contacts could not be downloaded.</source>
        <translation>Die Kontakte konnten nicht geladen werden.</translation>
    </message>
    <message>
        <source>No contacts yet.</source>
        <translation>Noch keine Kontakte.</translation>
    </message>
    <message>
        <source>Contacts are not downloaded automatically.</source>
        <translation>Kontakte werden nicht automatisch geladen.</translation>
    </message>
    <message>
        <source>Download contacts</source>
        <translation>Kontakte laden</translation>
    </message>
</context>
<context>
    <name>PhoneBookList</name>
    <message>
        <source>Contacts</source>
        <translation>Kontakte</translation>
    </message>
    <message numerus="yes">
        <source>%1 to %2 of %n</source>
        <translation>
            <numerusform>%1 bis %2 von %n</numerusform>
            <numerusform>%1 bis %2 von %n</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n contacts</source>
        <translation>
            <numerusform>%n Kontakt</numerusform>
            <numerusform>%n Kontakte</numerusform>
        </translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
</context>
<context>
    <name>PhoneBookSearch</name>
    <message>
        <source>Search contacts</source>
        <translation>Kontakte suchen</translation>
    </message>
    <message numerus="yes">
        <source>%n contacts</source>
        <translation>
            <numerusform>%n Kontakt</numerusform>
            <numerusform>%n Kontakte</numerusform>
        </translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
</context>
<context>
    <name>PhoneManageContactsSettings</name>
    <message>
        <source>Manage contacts</source>
        <translation>Kontakte verwalten</translation>
    </message>
    <message numerus="yes">
        <source>%n contacts</source>
        <translation>
            <numerusform>%n Kontakt</numerusform>
            <numerusform>%n Kontakte</numerusform>
        </translation>
    </message>
    <message>
        <source>Download contacts automatically</source>
        <translation>Kontakte automatisch laden</translation>
    </message>
    <message>
        <source>Sort by first name</source>
        <translation>Nach Vornamen sortieren</translation>
    </message>
    <message>
        <source>Sort by last name</source>
        <translation>Nach Nachnamen sortieren</translation>
    </message>
    <message>
        <source>Download contacts again</source>
        <translation>Kontakte neu laden</translation>
    </message>
    <message>
        <source>Delete all contacts</source>
        <translation>Alle Kontakte löschen</translation>
    </message>
</context>
<context>
    <name>PhoneMenu</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>Roaming</source>
        <translation>Roaming</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>Tastatur</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>Kontakte</translation>
    </message>
    <message>
        <source>Recent calls</source>
        <translation>Letzte Anrufe</translation>
    </message>
    <message>
        <source>Messages</source>
        <translation>Nachrichten</translation>
    </message>
    <message>
        <source>Assistant on</source>
        <translation>Assistent an</translation>
    </message>
    <message>
        <source>Voice assistant</source>
        <translation>Sprachassistent</translation>
    </message>
    <message>
        <source>Status alerts</source>
        <translation>Statusmeldungen</translation>
    </message>
    <message>
        <source>Do not disturb</source>
        <translation>Nicht stören</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
</context>
<context>
    <name>PhoneRingtoneAboutSettings</name>
    <message>
        <source>Ringtone</source>
        <translation>Klingelton</translation>
    </message>
    <message>
        <source>The phone&apos;s own</source>
        <translation>Der des Telefons</translation>
    </message>
    <message>
        <source>Classic</source>
        <translation>Klassisch</translation>
    </message>
    <message>
        <source>Chimes</source>
        <translation>Glockenspiel</translation>
    </message>
    <message>
        <source>Marimba</source>
        <translation>Marimba</translation>
    </message>
    <message>
        <source>Pulse</source>
        <translation>Puls</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone settings</source>
        <translation>Telefoneinstellungen</translation>
    </message>
    <message>
        <source>Manage contacts</source>
        <translation>Kontakte verwalten</translation>
    </message>
    <message>
        <source>Ringtone</source>
        <translation>Klingelton</translation>
    </message>
    <message>
        <source>Text message notification</source>
        <translation>Hinweis auf SMS</translation>
    </message>
    <message>
        <source>Warn before calls while roaming</source>
        <translation>Vor Anrufen im Ausland warnen</translation>
    </message>
    <message>
        <source>Low battery notification</source>
        <translation>Hinweis bei schwachem Akku</translation>
    </message>
    <message>
        <source>Mute audio on the handset</source>
        <translation>Ton am Telefon stummschalten</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsRoot</name>
    <message>
        <source>Phone settings</source>
        <translation>Telefoneinstellungen</translation>
    </message>
    <message>
        <source>Looking for the phone…</source>
        <translation>Telefon wird gesucht…</translation>
    </message>
</context>
<context>
    <name>PhoneSmsList</name>
    <message>
        <source>Messages</source>
        <translation>Nachrichten</translation>
    </message>
    <message numerus="yes">
        <source>%n unread</source>
        <translation>
            <numerusform>%n ungelesen</numerusform>
            <numerusform>%n ungelesen</numerusform>
        </translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Aktualisieren</translation>
    </message>
    <message>
        <source>Hear</source>
        <translation>Anhören</translation>
    </message>
    <message>
        <source>Downloading messages</source>
        <translation>Nachrichten werden geladen</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>Keine Nachrichten</translation>
    </message>
</context>
<context>
    <name>PhoneSmsReplyView</name>
    <message>
        <source>to %1</source>
        <translation>an %1</translation>
    </message>
    <message>
        <source>Hear</source>
        <translation>Anhören</translation>
    </message>
    <message>
        <source>Send</source>
        <translation>Senden</translation>
    </message>
    <message>
        <source>Reply</source>
        <comment>screen</comment>
        <extracomment>The title of the screen of the replies to choose from.</extracomment>
        <translation>Antwort</translation>
    </message>
</context>
<context>
    <name>PhoneSmsView</name>
    <message>
        <source>Hear</source>
        <translation>Anhören</translation>
    </message>
    <message>
        <source>Reply</source>
        <translation>Antworten</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
</context>
<context>
    <name>PhoneStatusAlerts</name>
    <message>
        <source>Status alerts</source>
        <translation>Statusmeldungen</translation>
    </message>
    <message numerus="yes">
        <source>%n alerts</source>
        <translation>
            <numerusform>%n Meldung</numerusform>
            <numerusform>%n Meldungen</numerusform>
        </translation>
    </message>
    <message>
        <source>Support: %1</source>
        <translation>Kundendienst: %1</translation>
    </message>
    <message>
        <source>Fix</source>
        <translation>Beheben</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>No alerts</source>
        <translation>Keine Meldungen</translation>
    </message>
</context>
<context>
    <name>PhoneTextMessageNotificationSettings</name>
    <message>
        <source>Text message notification</source>
        <translation>Hinweis auf SMS</translation>
    </message>
    <message>
        <source>Announce new messages</source>
        <translation>Neue Nachrichten melden</translation>
    </message>
    <message>
        <source>No tone</source>
        <translation>Kein Ton</translation>
    </message>
    <message>
        <source>Ding</source>
        <translation>Ding</translation>
    </message>
    <message>
        <source>Chirp</source>
        <translation>Zwitschern</translation>
    </message>
    <message>
        <source>Bell</source>
        <translation>Glocke</translation>
    </message>
</context>
<context>
    <name>PopupFrame</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>RecentCalls</name>
    <message>
        <source>Recent calls</source>
        <translation>Letzte Anrufe</translation>
    </message>
    <message>
        <source>Downloading</source>
        <translation>Wird geladen</translation>
    </message>
    <message>
        <source>All</source>
        <translation>Alle</translation>
    </message>
    <message>
        <source>Missed</source>
        <translation>Verpasst</translation>
    </message>
    <message>
        <source>Received</source>
        <translation>Angenommen</translation>
    </message>
    <message>
        <source>Dialled</source>
        <translation>Gewählt</translation>
    </message>
    <message>
        <source>No recent calls</source>
        <translation>Keine letzten Anrufe</translation>
    </message>
</context>
<context>
    <name>RecentCallsDownload</name>
    <message>
        <source>Downloading recent calls</source>
        <translation>Letzte Anrufe werden geladen</translation>
    </message>
    <message>
        <source>Recent calls not downloaded</source>
        <translation>Letzte Anrufe nicht geladen</translation>
    </message>
    <message>
        <source>The recent calls could not be downloaded.</source>
        <translation>Die letzten Anrufe konnten nicht geladen werden.</translation>
    </message>
    <message>
        <source>The download failed again.</source>
        <translation>Das Laden ist erneut fehlgeschlagen.</translation>
    </message>
    <message>
        <source>Customer support can help with this phone.</source>
        <translation>Der Kundendienst hilft bei diesem Telefon.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Call support</source>
        <translation>Kundendienst anrufen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Try again</source>
        <translation>Erneut versuchen</translation>
    </message>
</context>
<context>
    <name>Redial</name>
    <message>
        <source>Call failed</source>
        <translation>Anruf fehlgeschlagen</translation>
    </message>
    <message>
        <source>Call %1 again?</source>
        <translation>%1 erneut anrufen?</translation>
    </message>
    <message>
        <source>Call again?</source>
        <translation>Erneut anrufen?</translation>
    </message>
    <message>
        <source>Redial</source>
        <translation>Wahlwiederholung</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>RoamingWarning</name>
    <message>
        <source>Roaming</source>
        <translation>Roaming</translation>
    </message>
    <message>
        <source>Your phone is roaming: calling %1 may cost more.</source>
        <translation>Ihr Telefon ist im Ausland: ein Anruf bei %1 kann mehr kosten.</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>ScenarioBar</name>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Abspielen</translation>
    </message>
    <message>
        <source>Step</source>
        <translation>Schritt</translation>
    </message>
    <message>
        <source>No scenario</source>
        <translation>Kein Szenario</translation>
    </message>
    <message>
        <source>Line %1 of %2 (waiting)</source>
        <translation>Zeile %1 von %2 (wartet)</translation>
    </message>
    <message>
        <source>Line %1 of %2</source>
        <translation>Zeile %1 von %2</translation>
    </message>
</context>
<context>
    <name>SendTextMessage</name>
    <message>
        <source>Send to %1?</source>
        <translation>An %1 senden?</translation>
    </message>
    <message>
        <source>Sending</source>
        <translation>Wird gesendet</translation>
    </message>
    <message>
        <source>To %1</source>
        <translation>An %1</translation>
    </message>
    <message>
        <source>Message sent</source>
        <translation>Nachricht gesendet</translation>
    </message>
    <message>
        <source>Not sent</source>
        <translation>Nicht gesendet</translation>
    </message>
    <message>
        <source>The phone did not answer.</source>
        <translation>Das Telefon hat nicht geantwortet.</translation>
    </message>
    <message>
        <source>The phone has no network.</source>
        <translation>Das Telefon hat kein Netz.</translation>
    </message>
    <message>
        <source>The message to %1 could not be sent.</source>
        <translation>Die Nachricht an %1 konnte nicht gesendet werden.</translation>
    </message>
    <message>
        <source>Not sent again</source>
        <translation>Erneut nicht gesendet</translation>
    </message>
    <message>
        <source>Send</source>
        <translation>Senden</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Try again</source>
        <translation>Erneut versuchen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SettingRow</name>
    <message>
        <source>On</source>
        <translation>An</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
</context>
<context>
    <name>StatusAlert</name>
    <message>
        <source>Contacts still not downloaded</source>
        <translation>Kontakte weiterhin nicht geladen</translation>
    </message>
    <message>
        <source>Messages still not downloaded</source>
        <translation>Nachrichten weiterhin nicht geladen</translation>
    </message>
    <message>
        <source>Clear this alert?</source>
        <translation>Diese Meldung löschen?</translation>
    </message>
    <message>
        <source>The alert stays.</source>
        <translation>Die Meldung bleibt.</translation>
    </message>
    <message>
        <source>Download the contacts again?</source>
        <translation>Kontakte erneut laden?</translation>
    </message>
    <message>
        <source>Download the messages again?</source>
        <translation>Nachrichten erneut laden?</translation>
    </message>
    <message>
        <source>Call support on %1?</source>
        <translation>Kundendienst unter %1 anrufen?</translation>
    </message>
    <message>
        <source>Please see the phone&apos;s manual.</source>
        <translation>Bitte in der Anleitung des Telefons nachsehen.</translation>
    </message>
    <message>
        <source>For good</source>
        <translation>Dauerhaft</translation>
    </message>
    <message>
        <source>For this drive</source>
        <translation>Für diese Fahrt</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Download</source>
        <translation>Laden</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
</context>
<context>
    <name>StatusAlerts</name>
    <message>
        <source>Contacts could not be downloaded</source>
        <translation>Kontakte konnten nicht geladen werden</translation>
    </message>
    <message>
        <source>Messages could not be downloaded</source>
        <translation>Nachrichten konnten nicht geladen werden</translation>
    </message>
    <message>
        <source>Hands-free audio problem</source>
        <translation>Tonproblem der Freisprechanlage</translation>
    </message>
    <message>
        <source>Phone connection unstable</source>
        <translation>Telefonverbindung instabil</translation>
    </message>
    <message>
        <source>Phone software out of date</source>
        <translation>Software des Telefons veraltet</translation>
    </message>
    <message>
        <source>Phone storage full</source>
        <translation>Speicher des Telefons voll</translation>
    </message>
    <message>
        <source>Voice assistant not set up</source>
        <translation>Sprachassistent nicht eingerichtet</translation>
    </message>
    <message>
        <source>Too many contacts</source>
        <translation>Zu viele Kontakte</translation>
    </message>
    <message>
        <source>Phone not responding</source>
        <translation>Telefon reagiert nicht</translation>
    </message>
    <message>
        <source>Pairing needs renewing</source>
        <translation>Kopplung muss erneuert werden</translation>
    </message>
    <message>
        <source>Phone alert %1</source>
        <translation>Telefonmeldung %1</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Call accepted</source>
        <translation>Anruf angenommen</translation>
    </message>
    <message>
        <source>Call rejected</source>
        <translation>Anruf abgelehnt</translation>
    </message>
    <message>
        <source>Call ended</source>
        <translation>Anruf beendet</translation>
    </message>
    <message>
        <source>Dialling</source>
        <translation>Wählt</translation>
    </message>
    <message>
        <source>Call connected</source>
        <translation>Anruf verbunden</translation>
    </message>
    <message>
        <source>Downloading contacts</source>
        <translation>Kontakte werden geladen</translation>
    </message>
    <message>
        <source>Contacts downloaded</source>
        <translation>Kontakte geladen</translation>
    </message>
    <message>
        <source>Voice assistant on</source>
        <translation>Sprachassistent an</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>No phone</source>
        <translation>Kein Telefon</translation>
    </message>
</context>
<context>
    <name>TextMessageDownload</name>
    <message>
        <source>Messages not available</source>
        <translation>Nachrichten nicht verfügbar</translation>
    </message>
    <message>
        <source>This phone does not share its messages.</source>
        <translation>Dieses Telefon gibt seine Nachrichten nicht frei.</translation>
    </message>
    <message>
        <source>No access to messages</source>
        <translation>Kein Zugriff auf Nachrichten</translation>
    </message>
    <message>
        <source>Allow access to messages on the phone.</source>
        <translation>Zugriff auf die Nachrichten am Telefon erlauben.</translation>
    </message>
    <message>
        <source>Waiting for the phone</source>
        <translation>Warten auf das Telefon</translation>
    </message>
    <message>
        <source>Confirm access to messages on the phone.</source>
        <translation>Zugriff auf die Nachrichten am Telefon bestätigen.</translation>
    </message>
    <message>
        <source>Downloading messages</source>
        <translation>Nachrichten werden geladen</translation>
    </message>
    <message numerus="yes">
        <source>%n messages</source>
        <translation>
            <numerusform>%n Nachricht</numerusform>
            <numerusform>%n Nachrichten</numerusform>
        </translation>
    </message>
    <message>
        <source>Messages not downloaded</source>
        <translation>Nachrichten nicht geladen</translation>
    </message>
    <message>
        <source>The messages could not be downloaded.</source>
        <translation>Die Nachrichten konnten nicht geladen werden.</translation>
    </message>
    <message numerus="yes">
        <source>Tried %n times.</source>
        <translation>
            <numerusform>%n-mal versucht.</numerusform>
            <numerusform>%n-mal versucht.</numerusform>
        </translation>
    </message>
    <message>
        <source>Try again?</source>
        <translation>Erneut versuchen?</translation>
    </message>
    <message>
        <source>Please reconnect the phone.</source>
        <translation>Bitte das Telefon neu verbinden.</translation>
    </message>
    <message>
        <source>Messages are off</source>
        <translation>Nachrichten sind aus</translation>
    </message>
    <message>
        <source>Switch on text message notification in the settings.</source>
        <translation>Hinweis auf SMS in den Einstellungen einschalten.</translation>
    </message>
    <message>
        <source>Try again</source>
        <translation>Erneut versuchen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>UnknownPopup</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
</context>
<context>
    <name>UnknownView</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
</context>
<context>
    <name>VoiceService</name>
    <message>
        <source>Voice assistant</source>
        <translation>Sprachassistent</translation>
    </message>
    <message>
        <source>Speak now.</source>
        <translation>Jetzt sprechen.</translation>
    </message>
    <message>
        <source>The phone&apos;s voice assistant does not respond.</source>
        <translation>Der Sprachassistent des Telefons antwortet nicht.</translation>
    </message>
    <message>
        <source>Voice assistant off</source>
        <translation>Sprachassistent aus</translation>
    </message>
    <message>
        <source>Switch the voice assistant on in the phone&apos;s settings.</source>
        <translation>Den Sprachassistenten in den Einstellungen des Telefons einschalten.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>WaitingCall</name>
    <message>
        <source>Call waiting</source>
        <translation>Anruf wartet</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>Annehmen</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>Ablehnen</translation>
    </message>
</context>
</TS>
