<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>TimeUtils</name>
    <message>
        <source>Yesterday</source>
        <translation>Hier</translation>
    </message>
    <message>
        <source>Today</source>
        <translation>Aujourd’hui</translation>
    </message>
    <message>
        <source>Tomorrow</source>
        <translation>Demain</translation>
    </message>
    <message>
        <source>%1 d</source>
        <translation>%1 j</translation>
    </message>
    <message>
        <source>%1 h</source>
        <translation>%1 h</translation>
    </message>
    <message>
        <source>%1 min</source>
        <translation>%1 min</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
</context>
<context>
    <name>client::BarEditor</name>
    <message>
        <source>Drag tools into the bar, out of it, or to another place.</source>
        <translation>Glissez des outils dans la barre, hors d’elle ou à une autre place.</translation>
    </message>
    <message>
        <source>Reset</source>
        <translation>Rétablir</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Terminé</translation>
    </message>
</context>
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
    <name>client::Desk</name>
    <message>
        <source>Drag a rectangle in the chosen view.</source>
        <translation>Tracez un rectangle dans la vue choisie.</translation>
    </message>
    <message>
        <source>Drag the ends of the line in the chosen view.</source>
        <translation>Déplacez les extrémités de la ligne dans la vue choisie.</translation>
    </message>
    <message>
        <source>The export is complete.</source>
        <translation>L’export est terminé.</translation>
    </message>
    <message>
        <source>The export was stopped.</source>
        <translation>L’export a été arrêté.</translation>
    </message>
    <message>
        <source>Marked in %1: %2 x %3 pixels at %4, %5</source>
        <translation>Marqué dans %1 : %2 x %3 pixels en %4, %5</translation>
    </message>
    <message>
        <source>A picture of %1 was taken.</source>
        <translation>Une image de %1 a été prise.</translation>
    </message>
    <message>
        <source>%1 is back.</source>
        <translation>%1 est de retour.</translation>
    </message>
    <message>
        <source>%1 has gone.</source>
        <translation>%1 ne répond plus.</translation>
    </message>
    <message>
        <source>Main building</source>
        <translation>Bâtiment principal</translation>
    </message>
    <message>
        <source>Recording of %1</source>
        <translation>Enregistrement du %1</translation>
    </message>
    <message>
        <source>Choose a camera first.</source>
        <translation>Choisissez d’abord une caméra.</translation>
    </message>
    <message>
        <source>%1, %2, %3</source>
        <translation>%1, %2, %3</translation>
    </message>
    <message>
        <source>online</source>
        <translation>en ligne</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>hors ligne</translation>
    </message>
    <message>
        <source>%1 cameras</source>
        <translation>%1 caméras</translation>
    </message>
    <message>
        <source>%1 frames/s</source>
        <translation>%1 images/s</translation>
    </message>
    <message>
        <source>User</source>
        <translation>Utilisateur</translation>
    </message>
    <message>
        <source>Administrator</source>
        <translation>Administrateur</translation>
    </message>
    <message>
        <source>New password...</source>
        <translation>Nouveau mot de passe...</translation>
    </message>
    <message>
        <source>Log out</source>
        <translation>Se déconnecter</translation>
    </message>
    <message>
        <source>Views</source>
        <translation>Vues</translation>
    </message>
    <message>
        <source>%1 views</source>
        <translation>%1 vues</translation>
    </message>
</context>
<context>
    <name>client::DeskBar</name>
    <message>
        <source>Number of views</source>
        <translation>Nombre de vues</translation>
    </message>
    <message>
        <source>Back to the pictures</source>
        <translation>Retour aux images</translation>
    </message>
    <message>
        <source>All cameras as thumbnails</source>
        <translation>Toutes les caméras en miniatures</translation>
    </message>
    <message>
        <source>Live pictures; click for the recordings</source>
        <translation>Images en direct ; un clic montre les enregistrements</translation>
    </message>
    <message>
        <source>Recordings; click for live</source>
        <translation>Enregistrements ; un clic montre le direct</translation>
    </message>
    <message>
        <source>Mark a region</source>
        <translation>Marquer une zone</translation>
    </message>
    <message>
        <source>Counting line</source>
        <translation>Ligne de comptage</translation>
    </message>
    <message>
        <source>Export a recording</source>
        <translation>Exporter un enregistrement</translation>
    </message>
    <message>
        <source>Steer the camera</source>
        <translation>Piloter la caméra</translation>
    </message>
    <message>
        <source>Cut the line of the camera</source>
        <translation>Couper la ligne de la caméra</translation>
    </message>
    <message>
        <source>Restore the line of the camera</source>
        <translation>Rétablir la ligne de la caméra</translation>
    </message>
    <message>
        <source>Tools</source>
        <translation>Outils</translation>
    </message>
    <message>
        <source>LIVE</source>
        <translation>DIRECT</translation>
    </message>
    <message>
        <source>RECORDED</source>
        <translation>ENREGISTRÉ</translation>
    </message>
    <message>
        <source>%1 (administrators only)</source>
        <translation>%1 (administrateurs seulement)</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Réglages</translation>
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
    <name>client::EventStripe</name>
    <message>
        <source>No events within the last 24 hours</source>
        <translation>Aucun événement ces dernières 24 heures</translation>
    </message>
    <message>
        <source>Alarm</source>
        <translation>Alarme</translation>
    </message>
    <message>
        <source>Movement</source>
        <translation>Mouvement</translation>
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
        <translation>Exporter</translation>
    </message>
    <message>
        <source>Cameras</source>
        <translation>Caméras</translation>
    </message>
    <message>
        <source>MP4, for any player</source>
        <translation>MP4, pour tout lecteur</translation>
    </message>
    <message>
        <source>MKV, smaller</source>
        <translation>MKV, plus petit</translation>
    </message>
    <message>
        <source>As recorded</source>
        <translation>Tel qu&apos;enregistré</translation>
    </message>
    <message>
        <source>Quality</source>
        <translation>Qualité</translation>
    </message>
    <message>
        <source>With sound</source>
        <translation>Avec le son</translation>
    </message>
    <message>
        <source>Time in the picture</source>
        <translation>Heure dans l&apos;image</translation>
    </message>
    <message>
        <source>From</source>
        <translation>De</translation>
    </message>
    <message>
        <source>To</source>
        <translation>À</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Nom du fichier</translation>
    </message>
    <message>
        <source>Protect by a password</source>
        <translation>Protéger par mot de passe</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Mot de passe</translation>
    </message>
    <message>
        <source>All (%1)</source>
        <translation>Toutes (%1)</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>client::ExportRun</name>
    <message>
        <source>Exporting %1</source>
        <translation>Exportation de %1</translation>
    </message>
    <message>
        <source>Running for %1</source>
        <translation>En cours depuis %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
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
    <name>client::LoginPanel</name>
    <message>
        <source>Camera client</source>
        <translation>Client de caméras</translation>
    </message>
    <message>
        <source>Log in to see the cameras.</source>
        <translation>Connectez-vous pour voir les caméras.</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Mot de passe</translation>
    </message>
    <message>
        <source>Log in</source>
        <translation>Se connecter</translation>
    </message>
    <message>
        <source>New password...</source>
        <translation>Nouveau mot de passe...</translation>
    </message>
    <message>
        <source>For a look around: user with camera1!, or admin with camera2!</source>
        <translation>Pour regarder : user avec camera1! ou admin avec camera2!</translation>
    </message>
    <message>
        <source>Name and password do not match.</source>
        <translation>Le nom et le mot de passe ne correspondent pas.</translation>
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
    <name>client::PasswordPanel</name>
    <message>
        <source>New password</source>
        <translation>Nouveau mot de passe</translation>
    </message>
    <message>
        <source>A new password for %1, twice. The rules below turn green as they are met.</source>
        <translation>Un nouveau mot de passe pour %1, deux fois. Les règles deviennent vertes une fois remplies.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Once more</source>
        <translation>Encore une fois</translation>
    </message>
    <message>
        <source>%1 characters or more</source>
        <translation>au moins %1 caractères</translation>
    </message>
    <message>
        <source>a small and a capital letter</source>
        <translation>une minuscule et une majuscule</translation>
    </message>
    <message>
        <source>a digit and a letter</source>
        <translation>un chiffre et une lettre</translation>
    </message>
    <message>
        <source>a special character</source>
        <translation>un caractère spécial</translation>
    </message>
    <message>
        <source>not used before</source>
        <translation>jamais utilisé</translation>
    </message>
    <message>
        <source>the same both times</source>
        <translation>identique les deux fois</translation>
    </message>
</context>
<context>
    <name>client::PtzPanel</name>
    <message>
        <source>Pan</source>
        <translation>Pivoter</translation>
    </message>
    <message>
        <source>Tilt</source>
        <translation>Incliner</translation>
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
    <name>client::RecordStripes</name>
    <message>
        <source>Export finished</source>
        <translation>Exportation terminée</translation>
    </message>
</context>
<context>
    <name>client::RecordTimeLine</name>
    <message>
        <source>Live · %1</source>
        <translation>Direct · %1</translation>
    </message>
    <message>
        <source>%1 · %2 ago</source>
        <translation>%1 · il y a %2</translation>
    </message>
    <message>
        <source>Export %1 to %2 (%3)</source>
        <translation>Export de %1 à %2 (%3)</translation>
    </message>
    <message>
        <source>Drag the flags to choose what is exported.</source>
        <translation>Les drapeaux choisissent ce qui est exporté.</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Exporter...</translation>
    </message>
    <message>
        <source>You have no right to export.</source>
        <translation>Vous n&apos;avez pas le droit d&apos;exporter.</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>Direct</translation>
    </message>
    <message>
        <source>Back to what the cameras show now</source>
        <translation>Retour à ce que les caméras montrent maintenant</translation>
    </message>
    <message>
        <source>Go to</source>
        <translation>Aller à</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>Date et heure</translation>
    </message>
</context>
<context>
    <name>client::SettingsPopover</name>
    <message>
        <source>Settings</source>
        <translation>Réglages</translation>
    </message>
    <message>
        <source>Go to a camera</source>
        <translation>Aller à une caméra</translation>
    </message>
    <message>
        <source>Customise the tool bar...</source>
        <translation>Personnaliser la barre d’outils...</translation>
    </message>
    <message>
        <source>Log out</source>
        <translation>Se déconnecter</translation>
    </message>
    <message>
        <source>Views</source>
        <translation>Vues</translation>
    </message>
    <message>
        <source>Device list</source>
        <translation>Liste des appareils</translation>
    </message>
    <message>
        <source>left</source>
        <translation>à gauche</translation>
    </message>
    <message>
        <source>right</source>
        <translation>à droite</translation>
    </message>
    <message>
        <source>hidden</source>
        <translation>masquée</translation>
    </message>
    <message>
        <source>Time line</source>
        <translation>Ligne de temps</translation>
    </message>
    <message>
        <source>shown</source>
        <translation>affichée</translation>
    </message>
    <message>
        <source>Labels in the views</source>
        <translation>Légendes des vues</translation>
    </message>
    <message>
        <source>All labels</source>
        <translation>Tout</translation>
    </message>
    <message>
        <source>Names</source>
        <translation>Noms</translation>
    </message>
    <message>
        <source>Times</source>
        <translation>Heures</translation>
    </message>
    <message>
        <source>Badges</source>
        <translation>Pastilles</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Apparence</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Sombre</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Clair</translation>
    </message>
    <message>
        <source>Recordings</source>
        <translation>Enregistrements</translation>
    </message>
    <message>
        <source>live</source>
        <translation>direct</translation>
    </message>
    <message>
        <source>recorded</source>
        <translation>enregistré</translation>
    </message>
    <message>
        <source>All views show this moment of their recordings, within the last 24 hours.</source>
        <translation>Toutes les vues montrent ce moment de leurs enregistrements des dernières 24 heures.</translation>
    </message>
    <message>
        <source>Moment</source>
        <translation>Moment</translation>
    </message>
    <message>
        <source>Back to live</source>
        <translation>Retour au direct</translation>
    </message>
    <message>
        <source>Cameras and site</source>
        <translation>Caméras et site</translation>
    </message>
    <message>
        <source>Name of the shown</source>
        <translation>Nom des caméras</translation>
    </message>
    <message>
        <source>New name</source>
        <translation>Nouveau nom</translation>
    </message>
    <message>
        <source>several values</source>
        <translation>plusieurs valeurs</translation>
    </message>
    <message>
        <source>Main building</source>
        <translation>Bâtiment principal</translation>
    </message>
    <message>
        <source>Site</source>
        <translation>Site</translation>
    </message>
    <message>
        <source>Outage of a cut line</source>
        <translation>Durée d’une coupure</translation>
    </message>
    <message>
        <source> s</source>
        <translation> s</translation>
    </message>
    <message>
        <source>Account</source>
        <translation>Compte</translation>
    </message>
    <message>
        <source>Logged in as %1, an administrator.</source>
        <translation>Connecté comme %1, administrateur.</translation>
    </message>
    <message>
        <source>Logged in as %1.</source>
        <translation>Connecté comme %1.</translation>
    </message>
    <message>
        <source>Shown name</source>
        <translation>Nom affiché</translation>
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
        <translation>Nouveau mot de passe...</translation>
    </message>
    <message>
        <source>Log out when idle</source>
        <translation>Déconnecter si inactif</translation>
    </message>
    <message>
        <source>After</source>
        <translation>Après</translation>
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
<context>
    <name>client::TimeTrack</name>
    <message>
        <source>Moment that is shown. A double click asks for another one.</source>
        <translation>Moment affiché. Un double clic en demande un autre.</translation>
    </message>
    <message>
        <source>Start of the export</source>
        <translation>Début de l&apos;exportation</translation>
    </message>
    <message>
        <source>End of the export</source>
        <translation>Fin de l&apos;exportation</translation>
    </message>
</context>
</TS>
