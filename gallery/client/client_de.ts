<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>TimeUtils</name>
    <message>
        <source>Yesterday</source>
        <translation>Gestern</translation>
    </message>
    <message>
        <source>Today</source>
        <translation>Heute</translation>
    </message>
    <message>
        <source>Tomorrow</source>
        <translation>Morgen</translation>
    </message>
    <message>
        <source>%1 d</source>
        <translation>%1 T</translation>
    </message>
    <message>
        <source>%1 h</source>
        <translation>%1 Std.</translation>
    </message>
    <message>
        <source>%1 min</source>
        <translation>%1 Min.</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 Sek.</translation>
    </message>
</context>
<context>
    <name>client::BarEditor</name>
    <message>
        <source>Drag tools into the bar, out of it, or to another place.</source>
        <translation>Werkzeuge in die Leiste ziehen, heraus oder an einen anderen Platz.</translation>
    </message>
    <message>
        <source>Reset</source>
        <translation>Zurücksetzen</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Fertig</translation>
    </message>
</context>
<context>
    <name>client::CountingTools</name>
    <message>
        <source>Drag the ends of the line in the picture, or change the numbers.</source>
        <translation>Ziehen Sie die Enden der Linie im Bild, oder ändern Sie die Zahlen.</translation>
    </message>
    <message>
        <source>Outside</source>
        <translation>Außen</translation>
    </message>
    <message>
        <source>Inside</source>
        <translation>Innen</translation>
    </message>
</context>
<context>
    <name>client::Desk</name>
    <message>
        <source>Drag a rectangle in the chosen view.</source>
        <translation>In der gewählten Ansicht ein Rechteck aufziehen.</translation>
    </message>
    <message>
        <source>Drag the ends of the line in the chosen view.</source>
        <translation>In der gewählten Ansicht die Enden der Linie ziehen.</translation>
    </message>
    <message>
        <source>The export is complete.</source>
        <translation>Der Export ist fertig.</translation>
    </message>
    <message>
        <source>The export was stopped.</source>
        <translation>Der Export wurde abgebrochen.</translation>
    </message>
    <message>
        <source>Marked in %1: %2 x %3 pixels at %4, %5</source>
        <translation>Markiert in %1: %2 x %3 Pixel bei %4, %5</translation>
    </message>
    <message>
        <source>A picture of %1 was taken.</source>
        <translation>Ein Bild von %1 wurde aufgenommen.</translation>
    </message>
    <message>
        <source>%1 is back.</source>
        <translation>%1 ist wieder da.</translation>
    </message>
    <message>
        <source>%1 has gone.</source>
        <translation>%1 ist ausgefallen.</translation>
    </message>
    <message>
        <source>Main building</source>
        <translation>Hauptgebäude</translation>
    </message>
    <message>
        <source>Recording of %1</source>
        <translation>Aufnahme von %1</translation>
    </message>
    <message>
        <source>Choose a camera first.</source>
        <translation>Zuerst eine Kamera wählen.</translation>
    </message>
    <message>
        <source>%1, %2, %3</source>
        <translation>%1, %2, %3</translation>
    </message>
    <message>
        <source>online</source>
        <translation>online</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>offline</translation>
    </message>
    <message>
        <source>%1 cameras</source>
        <translation>%1 Kameras</translation>
    </message>
    <message>
        <source>%1 frames/s</source>
        <translation>%1 Bilder/s</translation>
    </message>
    <message>
        <source>User</source>
        <translation>Benutzer</translation>
    </message>
    <message>
        <source>Administrator</source>
        <translation>Administrator</translation>
    </message>
    <message>
        <source>New password...</source>
        <translation>Neues Passwort ...</translation>
    </message>
    <message>
        <source>Log out</source>
        <translation>Abmelden</translation>
    </message>
    <message>
        <source>Views</source>
        <translation>Ansichten</translation>
    </message>
    <message>
        <source>%1 views</source>
        <translation>%1 Ansichten</translation>
    </message>
</context>
<context>
    <name>client::DeskBar</name>
    <message>
        <source>Number of views</source>
        <translation>Anzahl der Ansichten</translation>
    </message>
    <message>
        <source>Back to the pictures</source>
        <translation>Zurück zu den Bildern</translation>
    </message>
    <message>
        <source>All cameras as thumbnails</source>
        <translation>Alle Kameras als Vorschau</translation>
    </message>
    <message>
        <source>Live pictures; click for the recordings</source>
        <translation>Live-Bilder; ein Klick zeigt die Aufnahmen</translation>
    </message>
    <message>
        <source>Recordings; click for live</source>
        <translation>Aufnahmen; ein Klick zeigt live</translation>
    </message>
    <message>
        <source>Mark a region</source>
        <translation>Bereich markieren</translation>
    </message>
    <message>
        <source>Counting line</source>
        <translation>Zähllinie</translation>
    </message>
    <message>
        <source>Export a recording</source>
        <translation>Aufnahme exportieren</translation>
    </message>
    <message>
        <source>Steer the camera</source>
        <translation>Kamera steuern</translation>
    </message>
    <message>
        <source>Cut the line of the camera</source>
        <translation>Leitung der Kamera trennen</translation>
    </message>
    <message>
        <source>Restore the line of the camera</source>
        <translation>Leitung der Kamera verbinden</translation>
    </message>
    <message>
        <source>Tools</source>
        <translation>Werkzeuge</translation>
    </message>
    <message>
        <source>LIVE</source>
        <translation>LIVE</translation>
    </message>
    <message>
        <source>RECORDED</source>
        <translation>AUFNAHME</translation>
    </message>
    <message>
        <source>%1 (administrators only)</source>
        <translation>%1 (nur Administratoren)</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
</context>
<context>
    <name>client::DevicePanel</name>
    <message>
        <source>Search devices</source>
        <translation>Geräte suchen</translation>
    </message>
    <message>
        <source>Words from name, place or address</source>
        <translation>Wörter aus Name, Ort oder Adresse</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>Geräte</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Fertig</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>No device matches the search.</source>
        <translation>Kein Gerät passt zur Suche.</translation>
    </message>
    <message>
        <source>%1 of %2 devices</source>
        <translation>%1 von %2 Geräten</translation>
    </message>
    <message>
        <source>%1 devices</source>
        <translation>%1 Geräte</translation>
    </message>
</context>
<context>
    <name>client::DeviceRow</name>
    <message>
        <source>%1, online</source>
        <translation>%1, verbunden</translation>
    </message>
    <message>
        <source>%1, offline</source>
        <translation>%1, getrennt</translation>
    </message>
    <message>
        <source>Online</source>
        <translation>Verbunden</translation>
    </message>
    <message>
        <source>Offline</source>
        <translation>Getrennt</translation>
    </message>
    <message>
        <source>New events</source>
        <translation>Neue Ereignisse</translation>
    </message>
    <message>
        <source>Name of the camera</source>
        <translation>Name der Kamera</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
</context>
<context>
    <name>client::EventStripe</name>
    <message>
        <source>No events within the last 24 hours</source>
        <translation>Keine Ereignisse in den letzten 24 Stunden</translation>
    </message>
    <message>
        <source>Alarm</source>
        <translation>Alarm</translation>
    </message>
    <message>
        <source>Movement</source>
        <translation>Bewegung</translation>
    </message>
</context>
<context>
    <name>client::ExportPopover</name>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Export</translation>
    </message>
    <message>
        <source>Cameras</source>
        <translation>Kameras</translation>
    </message>
    <message>
        <source>MP4, for any player</source>
        <translation>MP4, für jeden Player</translation>
    </message>
    <message>
        <source>MKV, smaller</source>
        <translation>MKV, kleiner</translation>
    </message>
    <message>
        <source>As recorded</source>
        <translation>Wie aufgezeichnet</translation>
    </message>
    <message>
        <source>Quality</source>
        <translation>Qualität</translation>
    </message>
    <message>
        <source>With sound</source>
        <translation>Mit Ton</translation>
    </message>
    <message>
        <source>Time in the picture</source>
        <translation>Zeit im Bild</translation>
    </message>
    <message>
        <source>From</source>
        <translation>Von</translation>
    </message>
    <message>
        <source>To</source>
        <translation>Bis</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Dateiname</translation>
    </message>
    <message>
        <source>Protect by a password</source>
        <translation>Mit Passwort schützen</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>All (%1)</source>
        <translation>Alle (%1)</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>client::ExportRun</name>
    <message>
        <source>Exporting %1</source>
        <translation>%1 wird exportiert</translation>
    </message>
    <message>
        <source>Running for %1</source>
        <translation>Läuft seit %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>client::LiveView</name>
    <message>
        <source>Reconnect</source>
        <translation>Neu verbinden</translation>
    </message>
</context>
<context>
    <name>client::LiveWall</name>
    <message>
        <source>Picture saved</source>
        <translation>Bild gespeichert</translation>
    </message>
    <message>
        <source>Connected again</source>
        <translation>Wieder verbunden</translation>
    </message>
</context>
<context>
    <name>client::LoginPanel</name>
    <message>
        <source>Camera client</source>
        <translation>Kamera-Client</translation>
    </message>
    <message>
        <source>Log in to see the cameras.</source>
        <translation>Zum Ansehen der Kameras anmelden.</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Log in</source>
        <translation>Anmelden</translation>
    </message>
    <message>
        <source>New password...</source>
        <translation>Neues Passwort ...</translation>
    </message>
    <message>
        <source>For a look around: user with camera1!, or admin with camera2!</source>
        <translation>Zum Umsehen: user mit camera1! oder admin mit camera2!</translation>
    </message>
    <message>
        <source>Name and password do not match.</source>
        <translation>Name und Passwort passen nicht zusammen.</translation>
    </message>
</context>
<context>
    <name>client::MarkingTool</name>
    <message>
        <source>Region</source>
        <translation>Bereich</translation>
    </message>
</context>
<context>
    <name>client::PasswordPanel</name>
    <message>
        <source>New password</source>
        <translation>Neues Passwort</translation>
    </message>
    <message>
        <source>A new password for %1, twice. The rules below turn green as they are met.</source>
        <translation>Ein neues Passwort für %1, zweimal. Die Regeln werden grün, sobald sie erfüllt sind.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Once more</source>
        <translation>Noch einmal</translation>
    </message>
    <message>
        <source>%1 characters or more</source>
        <translation>mindestens %1 Zeichen</translation>
    </message>
    <message>
        <source>a small and a capital letter</source>
        <translation>ein kleiner und ein großer Buchstabe</translation>
    </message>
    <message>
        <source>a digit and a letter</source>
        <translation>eine Ziffer und ein Buchstabe</translation>
    </message>
    <message>
        <source>a special character</source>
        <translation>ein Sonderzeichen</translation>
    </message>
    <message>
        <source>not used before</source>
        <translation>noch nicht verwendet</translation>
    </message>
    <message>
        <source>the same both times</source>
        <translation>beide Male gleich</translation>
    </message>
</context>
<context>
    <name>client::PtzPanel</name>
    <message>
        <source>Pan</source>
        <translation>Drehen</translation>
    </message>
    <message>
        <source>Tilt</source>
        <translation>Neigen</translation>
    </message>
    <message>
        <source>Zoom</source>
        <translation>Zoom</translation>
    </message>
    <message>
        <source>Stick</source>
        <translation>Steuerknüppel</translation>
    </message>
    <message>
        <source>to the left</source>
        <translation>nach links</translation>
    </message>
    <message>
        <source>to the right</source>
        <translation>nach rechts</translation>
    </message>
    <message>
        <source>down</source>
        <translation>nach unten</translation>
    </message>
    <message>
        <source>up</source>
        <translation>nach oben</translation>
    </message>
    <message>
        <source>farther</source>
        <translation>weiter weg</translation>
    </message>
    <message>
        <source>closer</source>
        <translation>näher</translation>
    </message>
    <message>
        <source>Choose a camera.</source>
        <translation>Wählen Sie eine Kamera.</translation>
    </message>
    <message>
        <source>You have no right to turn cameras. An administrator has.</source>
        <translation>Sie dürfen Kameras nicht drehen. Ein Administrator darf es.</translation>
    </message>
    <message>
        <source>This camera has no motor. Choose another one.</source>
        <translation>Diese Kamera hat keinen Motor. Wählen Sie eine andere.</translation>
    </message>
    <message>
        <source>The camera is offline.</source>
        <translation>Die Kamera ist offline.</translation>
    </message>
    <message>
        <source>No camera</source>
        <translation>Keine Kamera</translation>
    </message>
    <message>
        <source>Drag the stick, or a dial sideways.</source>
        <translation>Ziehen Sie den Knüppel, oder einen Regler seitwärts.</translation>
    </message>
</context>
<context>
    <name>client::RecordStripes</name>
    <message>
        <source>Export finished</source>
        <translation>Export fertig</translation>
    </message>
</context>
<context>
    <name>client::RecordTimeLine</name>
    <message>
        <source>Live · %1</source>
        <translation>Live · %1</translation>
    </message>
    <message>
        <source>%1 · %2 ago</source>
        <translation>%1 · vor %2</translation>
    </message>
    <message>
        <source>Export %1 to %2 (%3)</source>
        <translation>Export %1 bis %2 (%3)</translation>
    </message>
    <message>
        <source>Drag the flags to choose what is exported.</source>
        <translation>Die Fahnen bestimmen, was exportiert wird.</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Exportieren...</translation>
    </message>
    <message>
        <source>You have no right to export.</source>
        <translation>Sie haben kein Recht zum Export.</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>Live</translation>
    </message>
    <message>
        <source>Back to what the cameras show now</source>
        <translation>Zurück zu dem, was die Kameras jetzt zeigen</translation>
    </message>
    <message>
        <source>Go to</source>
        <translation>Gehe zu</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>Datum und Zeit</translation>
    </message>
</context>
<context>
    <name>client::SettingsPopover</name>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Go to a camera</source>
        <translation>Zu einer Kamera gehen</translation>
    </message>
    <message>
        <source>Customise the tool bar...</source>
        <translation>Werkzeugleiste anpassen ...</translation>
    </message>
    <message>
        <source>Log out</source>
        <translation>Abmelden</translation>
    </message>
    <message>
        <source>Views</source>
        <translation>Ansichten</translation>
    </message>
    <message>
        <source>Device list</source>
        <translation>Geräteliste</translation>
    </message>
    <message>
        <source>left</source>
        <translation>links</translation>
    </message>
    <message>
        <source>right</source>
        <translation>rechts</translation>
    </message>
    <message>
        <source>hidden</source>
        <translation>verborgen</translation>
    </message>
    <message>
        <source>Time line</source>
        <translation>Zeitleiste</translation>
    </message>
    <message>
        <source>shown</source>
        <translation>sichtbar</translation>
    </message>
    <message>
        <source>Labels in the views</source>
        <translation>Beschriftung der Ansichten</translation>
    </message>
    <message>
        <source>All labels</source>
        <translation>Alles</translation>
    </message>
    <message>
        <source>Names</source>
        <translation>Namen</translation>
    </message>
    <message>
        <source>Times</source>
        <translation>Zeiten</translation>
    </message>
    <message>
        <source>Badges</source>
        <translation>Plaketten</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Aussehen</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Dunkel</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Hell</translation>
    </message>
    <message>
        <source>Recordings</source>
        <translation>Aufnahmen</translation>
    </message>
    <message>
        <source>live</source>
        <translation>live</translation>
    </message>
    <message>
        <source>recorded</source>
        <translation>Aufnahme</translation>
    </message>
    <message>
        <source>All views show this moment of their recordings, within the last 24 hours.</source>
        <translation>Alle Ansichten zeigen diesen Moment ihrer Aufnahmen aus den letzten 24 Stunden.</translation>
    </message>
    <message>
        <source>Moment</source>
        <translation>Zeitpunkt</translation>
    </message>
    <message>
        <source>Back to live</source>
        <translation>Zurück zu live</translation>
    </message>
    <message>
        <source>Cameras and site</source>
        <translation>Kameras und Standort</translation>
    </message>
    <message>
        <source>Name of the shown</source>
        <translation>Name der gezeigten</translation>
    </message>
    <message>
        <source>New name</source>
        <translation>Neuer Name</translation>
    </message>
    <message>
        <source>several values</source>
        <translation>mehrere Werte</translation>
    </message>
    <message>
        <source>Main building</source>
        <translation>Hauptgebäude</translation>
    </message>
    <message>
        <source>Site</source>
        <translation>Standort</translation>
    </message>
    <message>
        <source>Outage of a cut line</source>
        <translation>Dauer eines Ausfalls</translation>
    </message>
    <message>
        <source> s</source>
        <translation> s</translation>
    </message>
    <message>
        <source>Account</source>
        <translation>Konto</translation>
    </message>
    <message>
        <source>Logged in as %1, an administrator.</source>
        <translation>Angemeldet als %1, Administrator.</translation>
    </message>
    <message>
        <source>Logged in as %1.</source>
        <translation>Angemeldet als %1.</translation>
    </message>
    <message>
        <source>Shown name</source>
        <translation>Angezeigter Name</translation>
    </message>
    <message>
        <source>s</source>
        <translation>s</translation>
    </message>
    <message>
        <source>min</source>
        <translation>min</translation>
    </message>
    <message>
        <source>New password...</source>
        <translation>Neues Passwort ...</translation>
    </message>
    <message>
        <source>Log out when idle</source>
        <translation>Bei Untätigkeit abmelden</translation>
    </message>
    <message>
        <source>After</source>
        <translation>Nach</translation>
    </message>
</context>
<context>
    <name>client::ThumbnailModel</name>
    <message>
        <source>%1 (offline)</source>
        <translation>%1 (getrennt)</translation>
    </message>
</context>
<context>
    <name>client::ThumbnailWall</name>
    <message>
        <source>Search pictures</source>
        <translation>Bilder suchen</translation>
    </message>
    <message>
        <source>Words from name, place or address</source>
        <translation>Wörter aus Name, Ort oder Adresse</translation>
    </message>
    <message>
        <source>Pictures of all cameras</source>
        <translation>Bilder aller Kameras</translation>
    </message>
    <message>
        <source>No camera matches the search.</source>
        <translation>Keine Kamera passt zur Suche.</translation>
    </message>
    <message>
        <source>%1 of %2 cameras</source>
        <translation>%1 von %2 Kameras</translation>
    </message>
    <message>
        <source>%1 cameras</source>
        <translation>%1 Kameras</translation>
    </message>
</context>
<context>
    <name>client::TimeTrack</name>
    <message>
        <source>Moment that is shown. A double click asks for another one.</source>
        <translation>Gezeigter Zeitpunkt. Ein Doppelklick fragt nach einem anderen.</translation>
    </message>
    <message>
        <source>Start of the export</source>
        <translation>Anfang des Exports</translation>
    </message>
    <message>
        <source>End of the export</source>
        <translation>Ende des Exports</translation>
    </message>
</context>
</TS>
