<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
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
    <name>client::MarkingTool</name>
    <message>
        <source>Region</source>
        <translation>Bereich</translation>
    </message>
</context>
<context>
    <name>client::PtzPanel</name>
    <message>
        <source>Pan</source>
        <translation>Schwenken</translation>
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
</TS>
