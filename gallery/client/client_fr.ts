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
    <name>client::DevicePanel</name>
    <message>
        <source>Search devices</source>
        <translation>Rechercher un appareil</translation>
    </message>
    <message>
        <source>Words from name, place or address</source>
        <translation>Mots du nom, du lieu ou de l’adresse</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>Appareils</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Terminé</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifier</translation>
    </message>
    <message>
        <source>No device matches the search.</source>
        <translation>Aucun appareil ne correspond à la recherche.</translation>
    </message>
    <message>
        <source>%1 of %2 devices</source>
        <translation>%1 appareils sur %2</translation>
    </message>
    <message>
        <source>%1 devices</source>
        <translation>%1 appareils</translation>
    </message>
</context>
<context>
    <name>client::DeviceRow</name>
    <message>
        <source>%1, online</source>
        <translation>%1, en ligne</translation>
    </message>
    <message>
        <source>%1, offline</source>
        <translation>%1, hors ligne</translation>
    </message>
    <message>
        <source>Online</source>
        <translation>En ligne</translation>
    </message>
    <message>
        <source>Offline</source>
        <translation>Hors ligne</translation>
    </message>
    <message>
        <source>New events</source>
        <translation>Nouveaux événements</translation>
    </message>
    <message>
        <source>Name of the camera</source>
        <translation>Nom de la caméra</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
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
<context>
    <name>client::ThumbnailModel</name>
    <message>
        <source>%1 (offline)</source>
        <translation>%1 (hors ligne)</translation>
    </message>
</context>
<context>
    <name>client::ThumbnailWall</name>
    <message>
        <source>Search pictures</source>
        <translation>Rechercher une image</translation>
    </message>
    <message>
        <source>Words from name, place or address</source>
        <translation>Mots du nom, du lieu ou de l’adresse</translation>
    </message>
    <message>
        <source>Pictures of all cameras</source>
        <translation>Images de toutes les caméras</translation>
    </message>
    <message>
        <source>No camera matches the search.</source>
        <translation>Aucune caméra ne correspond à la recherche.</translation>
    </message>
    <message>
        <source>%1 of %2 cameras</source>
        <translation>%1 caméras sur %2</translation>
    </message>
    <message>
        <source>%1 cameras</source>
        <translation>%1 caméras</translation>
    </message>
</context>
</TS>
