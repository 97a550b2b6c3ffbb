<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>CountingLinesGroupBox</name>
    <message>
        <source>Additional Parameters</source>
        <translation>Weitere Einstellungen</translation>
    </message>
    <message>
        <source>Coordinates</source>
        <translation>Koordinaten</translation>
    </message>
    <message>
        <source>Counting Corridors</source>
        <translation>Zählkorridore</translation>
    </message>
    <message>
        <source>East</source>
        <translation>Ost</translation>
    </message>
    <message>
        <source>End point:</source>
        <translation>Endpunkt:</translation>
    </message>
    <message>
        <source>GroupBox</source>
        <translation>GroupBox</translation>
    </message>
    <message>
        <source>ID</source>
        <translation>ID</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Starting point:</source>
        <translation>Startpunkt:</translation>
    </message>
    <message>
        <source>Title &quot;East&quot;</source>
        <translation>Titel &quot;Ost&quot;</translation>
    </message>
    <message>
        <source>Title &quot;West&quot;</source>
        <translation>Titel &quot;West&quot;</translation>
    </message>
    <message>
        <source>West</source>
        <translation>West</translation>
    </message>
    <message>
        <source>x</source>
        <translation>x</translation>
    </message>
    <message>
        <source>y</source>
        <translation>j</translation>
    </message>
</context>
<context>
    <name>vx::BusyOverlayView</name>
    <message>
        <source>Connection lost since %1</source>
        <translation>Verbindung unterbrochen seit %1</translation>
    </message>
</context>
<context>
    <name>vx::CustomToolBar</name>
    <message>
        <source>Customize Toolbar...</source>
        <translation>Symbolleiste anpassen...</translation>
    </message>
    <message>
        <source>Icons &amp; Text</source>
        <translation>Symbole &amp; Text</translation>
    </message>
    <message>
        <source>Icons Only</source>
        <translation>Nur Symbole</translation>
    </message>
    <message>
        <source>Remove Item</source>
        <translation>Element entfernen</translation>
    </message>
    <message>
        <source>Small Icons</source>
        <translation>Kleine Symbole</translation>
    </message>
    <message>
        <source>Text Only</source>
        <translation>Nur Text</translation>
    </message>
</context>
<context>
    <name>vx::DateTimeDefaultEdit</name>
    <message>
        <source>Reset time</source>
        <translation>Zeit zurücksetzen</translation>
    </message>
</context>
<context>
    <name>vx::FilepathEdit</name>
    <message>
        <source>Choose Directory...</source>
        <translation>Verzeichnis wählen...</translation>
    </message>
</context>
<context>
    <name>vx::MultiNubsieSlider</name>
    <message>
        <source>Export range end marker</source>
        <translation>Ende des Exportbereichs</translation>
    </message>
    <message>
        <source>Export range start marker</source>
        <translation>Start des Exportbereichs</translation>
    </message>
    <message>
        <source>Time range to export</source>
        <translation>Export-Zeitbereich</translation>
    </message>
</context>
<context>
    <name>vx::PasswordCheckWidget</name>
    <message>
        <source>Confirm Password</source>
        <translation>Passwort bestätigen</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Retype Password</source>
        <translation>Passwort wiederholen</translation>
    </message>
    <message>
        <source>Type Password</source>
        <translation>Passwort eingeben</translation>
    </message>
</context>
<context>
    <name>vx::iOSListWidgetItem</name>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
</context>
</TS>
