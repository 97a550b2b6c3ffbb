<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>client::CountingTools</name>
    <message>
        <source>Drag the ends of the line in the picture, or change the numbers.</source>
        <translation>Faites glisser les extrémités de la ligne dans l&apos;image, ou modifiez les nombres.</translation>
    </message>
    <message>
        <source>Outside</source>
        <translation>Extérieur</translation>
    </message>
    <message>
        <source>Inside</source>
        <translation>Intérieur</translation>
    </message>
</context>
<context>
    <name>client::LiveView</name>
    <message>
        <source>Reconnect</source>
        <translation>Reconnecter</translation>
    </message>
</context>
<context>
    <name>client::LiveWall</name>
    <message>
        <source>Picture saved</source>
        <translation>Image enregistrée</translation>
    </message>
    <message>
        <source>Connected again</source>
        <translation>De nouveau connecté</translation>
    </message>
</context>
<context>
    <name>client::MarkingTool</name>
    <message>
        <source>Region</source>
        <translation>Zone</translation>
    </message>
</context>
<context>
    <name>client::PtzPanel</name>
    <message>
        <source>Pan</source>
        <translation>Panoramique</translation>
    </message>
    <message>
        <source>Tilt</source>
        <translation>Inclinaison</translation>
    </message>
    <message>
        <source>Zoom</source>
        <translation>Zoom</translation>
    </message>
    <message>
        <source>Stick</source>
        <translation>Manette</translation>
    </message>
    <message>
        <source>to the left</source>
        <translation>vers la gauche</translation>
    </message>
    <message>
        <source>to the right</source>
        <translation>vers la droite</translation>
    </message>
    <message>
        <source>down</source>
        <translation>vers le bas</translation>
    </message>
    <message>
        <source>up</source>
        <translation>vers le haut</translation>
    </message>
    <message>
        <source>farther</source>
        <translation>plus loin</translation>
    </message>
    <message>
        <source>closer</source>
        <translation>plus près</translation>
    </message>
    <message>
        <source>Choose a camera.</source>
        <translation>Choisissez une caméra.</translation>
    </message>
    <message>
        <source>You have no right to turn cameras. An administrator has.</source>
        <translation>Vous n&apos;avez pas le droit d&apos;orienter les caméras. Un administrateur l&apos;a.</translation>
    </message>
    <message>
        <source>This camera has no motor. Choose another one.</source>
        <translation>Cette caméra n&apos;a pas de moteur. Choisissez-en une autre.</translation>
    </message>
    <message>
        <source>The camera is offline.</source>
        <translation>La caméra est hors ligne.</translation>
    </message>
    <message>
        <source>No camera</source>
        <translation>Aucune caméra</translation>
    </message>
    <message>
        <source>Drag the stick, or a dial sideways.</source>
        <translation>Faites glisser la manette, ou un bouton vers le côté.</translation>
    </message>
</context>
</TS>
