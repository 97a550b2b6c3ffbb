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
</TS>
