<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>gallery::BadgesPage</name>
    <message>
        <source>Busy marks</source>
        <translation>Indicateurs d’activité</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Arc</translation>
    </message>
    <message>
        <source>Ring</source>
        <translation>Anneau</translation>
    </message>
    <message>
        <source>Dots</source>
        <translation>Points</translation>
    </message>
    <message>
        <source>Spokes</source>
        <translation>Rayons</translation>
    </message>
    <message>
        <source>Pills</source>
        <translation>Pastilles</translation>
    </message>
    <message>
        <source>Plain</source>
        <translation>Simple</translation>
    </message>
    <message>
        <source>Stroke</source>
        <translation>Avec contour</translation>
    </message>
    <message>
        <source>Crossed</source>
        <translation>Barré</translation>
    </message>
    <message>
        <source>new</source>
        <translation>neuf</translation>
    </message>
    <message>
        <source>In rows</source>
        <translation>Dans des lignes</translation>
    </message>
    <message>
        <source>live</source>
        <translation>direct</translation>
    </message>
    <message>
        <source>off</source>
        <translation>non</translation>
    </message>
    <message>
        <source>Searching for cameras</source>
        <translation>Recherche de caméras</translation>
    </message>
    <message>
        <source>Unread alarms</source>
        <translation>Alarmes non lues</translation>
    </message>
    <message>
        <source>Main street</source>
        <translation>Rue principale</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parking</translation>
    </message>
    <message>
        <source>Export is running</source>
        <translation>Export en cours</translation>
    </message>
    <message>
        <source>Alignment</source>
        <translation>Alignement</translation>
    </message>
    <message>
        <source>Try it</source>
        <translation>À essayer</translation>
    </message>
    <message>
        <source>Set the label</source>
        <translation>Fixer</translation>
    </message>
    <message>
        <source>Set it crossed</source>
        <translation>Barrer</translation>
    </message>
    <message>
        <source>Busy</source>
        <translation>Occupé</translation>
    </message>
    <message>
        <source>Not busy</source>
        <translation>Libre</translation>
    </message>
    <message>
        <source>No badge</source>
        <translation>Aucune pastille</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Colours</source>
        <translation>Couleurs</translation>
    </message>
</context>
<context>
    <name>gallery::CameraTile</name>
    <message>
        <source>No signal</source>
        <translation>Pas de signal</translation>
    </message>
</context>
<context>
    <name>gallery::CameraWallPage</name>
    <message>
        <source>Main street</source>
        <translation>Rue principale</translation>
    </message>
    <message>
        <source>Reception</source>
        <translation>Accueil</translation>
    </message>
    <message>
        <source>Container yard</source>
        <translation>Cour des conteneurs</translation>
    </message>
    <message>
        <source>North gate</source>
        <translation>Porte nord</translation>
    </message>
    <message>
        <source>Corridor 1</source>
        <translation>Couloir 1</translation>
    </message>
    <message>
        <source>Loading dock</source>
        <translation>Quai de chargement</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parking</translation>
    </message>
    <message>
        <source>Staircase</source>
        <translation>Escalier</translation>
    </message>
    <message>
        <source>Rail siding</source>
        <translation>Voie de garage</translation>
    </message>
    <message>
        <source>South gate</source>
        <translation>Porte sud</translation>
    </message>
    <message>
        <source>Canteen</source>
        <translation>Cantine</translation>
    </message>
    <message>
        <source>Warehouse</source>
        <translation>Entrepôt</translation>
    </message>
    <message>
        <source>Bus stop</source>
        <translation>Arrêt de bus</translation>
    </message>
    <message>
        <source>Corridor 2</source>
        <translation>Couloir 2</translation>
    </message>
    <message>
        <source>Crane</source>
        <translation>Grue</translation>
    </message>
    <message>
        <source>Ring road</source>
        <translation>Périphérique</translation>
    </message>
    <message>
        <source>Workshop</source>
        <translation>Atelier</translation>
    </message>
    <message>
        <source>Quay</source>
        <translation>Embarcadère</translation>
    </message>
    <message>
        <source>Previous</source>
        <translation>Précédent</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Suivant</translation>
    </message>
    <message>
        <source>Wall %1 of %2</source>
        <translation>Mur %1 sur %2</translation>
    </message>
    <message>
        <source>%1 frames per second   Without signal: %2</source>
        <translation>%1 images par seconde   Sans signal : %2</translation>
    </message>
</context>
<context>
    <name>gallery::ClickVariantsPage</name>
    <message>
        <source>The last click</source>
        <translation>Le dernier clic</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Aucun</translation>
    </message>
    <message>
        <source>Click, hold or right click one of the buttons.</source>
        <translation>Cliquez, maintenez ou cliquez droit sur un des boutons.</translation>
    </message>
    <message>
        <source>Long click</source>
        <translation>Clic long</translation>
    </message>
    <message>
        <source>The button clicked by itself, the mouse still down.</source>
        <translation>Le bouton a cliqué de lui-même, souris encore enfoncée.</translation>
    </message>
    <message>
        <source>The button clicked on the release.</source>
        <translation>Le bouton a cliqué au relâchement.</translation>
    </message>
    <message>
        <source>Context click</source>
        <translation>Clic contextuel</translation>
    </message>
    <message>
        <source>A right click is a click of its own kind and opens no menu.</source>
        <translation>Un clic droit est un clic à part et n&apos;ouvre aucun menu.</translation>
    </message>
    <message>
        <source>Click on the arrow</source>
        <translation>Clic sur la flèche</translation>
    </message>
    <message>
        <source>The slot opens what it wants.</source>
        <translation>Le slot ouvre ce qu&apos;il veut.</translation>
    </message>
    <message>
        <source>Normal click</source>
        <translation>Clic normal</translation>
    </message>
    <message>
        <source>Hold the button longer, or use the other mouse button.</source>
        <translation>Maintenez le bouton plus longtemps, ou utilisez l&apos;autre bouton de la souris.</translation>
    </message>
    <message>
        <source>Kinds of clicks</source>
        <translation>Sortes de clics</translation>
    </message>
    <message>
        <source>Hold</source>
        <translation>Maintenir</translation>
    </message>
    <message>
        <source>Clicks by itself after 750 ms.</source>
        <translation>Clique de lui-même après 750 ms.</translation>
    </message>
    <message>
        <source>Hold and release</source>
        <translation>Maintenir et relâcher</translation>
    </message>
    <message>
        <source>Without automatic clicks.</source>
        <translation>Sans clics automatiques.</translation>
    </message>
    <message>
        <source>Checkable</source>
        <translation>Commutable</translation>
    </message>
    <message>
        <source>Held, it reports its state and keeps it.</source>
        <translation>Maintenu, il signale son état et le garde.</translation>
    </message>
    <message>
        <source>Split</source>
        <translation>Divisé</translation>
    </message>
    <message>
        <source>The arrow is a click of its own.</source>
        <translation>La flèche est un clic à part.</translation>
    </message>
    <message>
        <source>Rights</source>
        <translation>Droits</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Export</translation>
    </message>
    <message>
        <source>Needs the right to export.</source>
        <translation>Demande le droit d&apos;exporter.</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Réglages</translation>
    </message>
    <message>
        <source>For administrators.</source>
        <translation>Pour les administrateurs.</translation>
    </message>
    <message>
        <source>The user may export</source>
        <translation>L&apos;utilisateur peut exporter</translation>
    </message>
    <message>
        <source>The user is an administrator</source>
        <translation>L&apos;utilisateur est administrateur</translation>
    </message>
    <message>
        <source>A widget to click</source>
        <translation>Un widget à cliquer</translation>
    </message>
    <message>
        <source>Click me with any button</source>
        <translation>Cliquez avec n&apos;importe quel bouton</translation>
    </message>
    <message>
        <source>Click on a widget</source>
        <translation>Clic sur un widget</translation>
    </message>
    <message>
        <source>It has the signals of a button and is none.</source>
        <translation>Il a les signaux d&apos;un bouton sans en être un.</translation>
    </message>
    <message>
        <source>pressed, clicked and released, with every mouse button.</source>
        <translation>pressed, clicked et released, avec chaque bouton de la souris.</translation>
    </message>
</context>
<context>
    <name>gallery::CountingLinesPage</name>
    <message>
        <source>Main entrance</source>
        <translation>Entrée principale</translation>
    </message>
    <message>
        <source>Outside</source>
        <translation>Dehors</translation>
    </message>
    <message>
        <source>Inside</source>
        <translation>Dedans</translation>
    </message>
    <message>
        <source>Drag the ends of the line in the picture, or change the numbers.</source>
        <translation>Tirer les bouts de la ligne dans l’image, ou changer les nombres.</translation>
    </message>
</context>
<context>
    <name>gallery::DeviceBrowserPage</name>
    <message>
        <source>North gate</source>
        <translation>Porte nord</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parking</translation>
    </message>
    <message>
        <source>Loading ramp</source>
        <translation>Quai de chargement</translation>
    </message>
    <message>
        <source>Lobby</source>
        <translation>Hall</translation>
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
        <source>Building %1, %2, camera %3</source>
        <translation>Bâtiment %1, %2, caméra %3</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Place</source>
        <translation>Lieu</translation>
    </message>
    <message>
        <source>Address</source>
        <translation>Adresse</translation>
    </message>
    <message>
        <source>State</source>
        <translation>État</translation>
    </message>
    <message>
        <source>Search in name and address</source>
        <translation>Rechercher dans le nom et l’adresse</translation>
    </message>
    <message>
        <source>All places</source>
        <translation>Tous les lieux</translation>
    </message>
    <message>
        <source>All states</source>
        <translation>Tous les états</translation>
    </message>
    <message>
        <source>%1 of %2 devices, %3 ms</source>
        <translation>%1 appareils sur %2, %3 ms</translation>
    </message>
</context>
<context>
    <name>gallery::EditsPage</name>
    <message>
        <source>Search</source>
        <translation>Recherche</translation>
    </message>
    <message>
        <source>Find a camera</source>
        <translation>Chercher une caméra</translation>
    </message>
    <message>
        <source>Gate</source>
        <translation>Portail</translation>
    </message>
    <message>
        <source>Yard</source>
        <translation>Cour</translation>
    </message>
    <message>
        <source>Hall</source>
        <translation>Hall</translation>
    </message>
    <message>
        <source>Ramp</source>
        <translation>Rampe</translation>
    </message>
    <message>
        <source>Stairs</source>
        <translation>Escalier</translation>
    </message>
    <message>
        <source>north</source>
        <translation>nord</translation>
    </message>
    <message>
        <source>east</source>
        <translation>est</translation>
    </message>
    <message>
        <source>south</source>
        <translation>sud</translation>
    </message>
    <message>
        <source>west</source>
        <translation>ouest</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Exportation</translation>
    </message>
    <message>
        <source>Read only</source>
        <translation>Lecture seule</translation>
    </message>
    <message>
        <source>Folder</source>
        <translation>Dossier</translation>
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
        <source>Drop a file on the folder: its folder is taken. The cross brings the end back.</source>
        <translation>Déposer un fichier sur le dossier : son dossier est pris. La croix rétablit la fin.</translation>
    </message>
    <message>
        <source>A form that scrolls</source>
        <translation>Un formulaire qui défile</translation>
    </message>
    <message>
        <source>The wheel over a combo box scrolls the form and changes nothing.</source>
        <translation>La molette sur une liste fait défiler le formulaire et ne change rien.</translation>
    </message>
    <message>
        <source>25 pictures a second</source>
        <translation>25 images par seconde</translation>
    </message>
    <message>
        <source>12 pictures a second</source>
        <translation>12 images par seconde</translation>
    </message>
    <message>
        <source>1 picture a second</source>
        <translation>1 image par seconde</translation>
    </message>
    <message>
        <source>Camera %1</source>
        <translation>Caméra %1</translation>
    </message>
</context>
<context>
    <name>gallery::FadesPage</name>
    <message>
        <source>Fade a whole widget</source>
        <translation>Fondu d’un widget entier</translation>
    </message>
    <message>
        <source>Recording resumes in a moment</source>
        <translation>L’enregistrement reprend dans un instant</translation>
    </message>
    <message>
        <source>Opacity %1 %</source>
        <translation>Opacité %1 %</translation>
    </message>
    <message>
        <source>Fade in</source>
        <translation>Faire apparaître</translation>
    </message>
    <message>
        <source>Fade out</source>
        <translation>Faire disparaître</translation>
    </message>
    <message>
        <source>Fade what is inside as well</source>
        <translation>Fondre aussi le contenu</translation>
    </message>
    <message>
        <source>Hide at the end</source>
        <translation>Masquer à la fin</translation>
    </message>
    <message>
        <source>1 s, 0.35 s</source>
        <translation>1 s, 0,35 s</translation>
    </message>
    <message>
        <source>0.2 s, 0.2 s</source>
        <translation>0,2 s, 0,2 s</translation>
    </message>
    <message>
        <source>4 s, 4 s</source>
        <translation>4 s, 4 s</translation>
    </message>
    <message>
        <source>Pulse</source>
        <translation>Pulser</translation>
    </message>
    <message>
        <source>A press on a button ends its pulse.</source>
        <translation>Un appui sur un bouton arrête sa pulsation.</translation>
    </message>
    <message>
        <source>Fall once</source>
        <translation>Décroître une fois</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Arrêter</translation>
    </message>
    <message>
        <source>Overlay, badge, shadow</source>
        <translation>Superposition, pastille, ombre</translation>
    </message>
    <message>
        <source>Drawn on top of the button, with or without a pulse.</source>
        <translation>Dessinés sur le bouton, avec ou sans pulsation.</translation>
    </message>
    <message>
        <source>overlay</source>
        <translation>superposition</translation>
    </message>
    <message>
        <source>badge</source>
        <translation>pastille</translation>
    </message>
    <message>
        <source>busy</source>
        <translation>occupé</translation>
    </message>
    <message>
        <source>shadow</source>
        <translation>ombre</translation>
    </message>
</context>
<context>
    <name>gallery::FramesPage</name>
    <message>
        <source>The picture: %1 × %1 pixels, cut %2 pixels from each side</source>
        <translation>L’image : %1 × %1 pixels, coupée à %2 pixels de chaque côté</translation>
    </message>
    <message>
        <source>Stretch the centre</source>
        <translation>Étirer le centre</translation>
    </message>
    <message>
        <source>The border keeps its width.</source>
        <translation>Le bord garde sa largeur.</translation>
    </message>
    <message>
        <source>Tile the centre</source>
        <translation>Répéter le centre</translation>
    </message>
    <message>
        <source>Stretch the border</source>
        <translation>Étirer le bord</translation>
    </message>
    <message>
        <source>The centre keeps its size.</source>
        <translation>Le centre garde sa taille.</translation>
    </message>
    <message>
        <source>Tile the border</source>
        <translation>Répéter le bord</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Opacité</translation>
    </message>
</context>
<context>
    <name>gallery::GalleryWindow</name>
    <message>
        <source>Zelkov Gallery</source>
        <translation>Galerie Zelkov</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Clair</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Sombre</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Aucun</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Thème</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
    <message>
        <source>Another scale starts the gallery anew.</source>
        <translation>Une autre échelle redémarre la galerie.</translation>
    </message>
    <message>
        <source>Scale</source>
        <translation>Échelle</translation>
    </message>
    <message>
        <source>Signals</source>
        <translation>Signaux</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtrer</translation>
    </message>
    <message>
        <source>Fold repetitions</source>
        <translation>Regrouper les répétitions</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Effacer</translation>
    </message>
</context>
<context>
    <name>gallery::GesturePad</name>
    <message>
        <source>Click, hold, drag or flick here</source>
        <translation>Cliquez, maintenez, glissez ou balayez ici</translation>
    </message>
</context>
<context>
    <name>gallery::LabelsPage</name>
    <message>
        <source>Texts</source>
        <translation>Textes</translation>
    </message>
    <message>
        <source>Drag the bar between the two sides.</source>
        <translation>Faites glisser la barre entre les deux côtés.</translation>
    </message>
    <message>
        <source>The camera in the main entrance of building 4 does not answer any more</source>
        <translation>La caméra de l&apos;entrée principale du bâtiment 4 ne répond plus</translation>
    </message>
    <message>
        <source>Cut at the end</source>
        <translation>Coupé à la fin</translation>
    </message>
    <message>
        <source>In the middle</source>
        <translation>Au milieu</translation>
    </message>
    <message>
        <source>At the start</source>
        <translation>Au début</translation>
    </message>
    <message>
        <source>Word wrap</source>
        <translation>Retour à la ligne</translation>
    </message>
    <message>
        <source>Connect the camera in the main entrance of building 4</source>
        <translation>Connecter la caméra de l&apos;entrée principale du bâtiment 4</translation>
    </message>
    <message>
        <source>Button</source>
        <translation>Bouton</translation>
    </message>
    <message>
        <source>The text itself stays whole, in tool tips and for the program: %1</source>
        <translation>Le texte reste entier, pour le programme et les bulles d&apos;aide : %1</translation>
    </message>
    <message>
        <source>Pictures</source>
        <translation>Images</translation>
    </message>
    <message>
        <source>Keep the proportions</source>
        <translation>Garder les proportions</translation>
    </message>
    <message>
        <source>Wrapped, with one word too long: site_west_building_4_main_entrance_camera_17_2026_04_01.mkv</source>
        <translation>Avec retour à la ligne et un mot trop long : site_ouest_batiment_4_entree_principale_camera_17_2026_04_01.mkv</translation>
    </message>
</context>
<context>
    <name>gallery::MouseGesturesPage</name>
    <message>
        <source>Pressed</source>
        <translation>Appuyé</translation>
    </message>
    <message>
        <source>Panning</source>
        <translation>Déplacement</translation>
    </message>
    <message>
        <source>Released</source>
        <translation>Relâché</translation>
    </message>
    <message>
        <source>Long press</source>
        <translation>Appui long</translation>
    </message>
    <message>
        <source>Click</source>
        <translation>Clic</translation>
    </message>
    <message>
        <source>Double click</source>
        <translation>Double clic</translation>
    </message>
    <message>
        <source>Long click</source>
        <translation>Clic long</translation>
    </message>
    <message>
        <source>Auto click</source>
        <translation>Clic automatique</translation>
    </message>
    <message>
        <source>Swipe to the left</source>
        <translation>Balayage vers la gauche</translation>
    </message>
    <message>
        <source>Swipe to the right</source>
        <translation>Balayage vers la droite</translation>
    </message>
    <message>
        <source>Swipe up</source>
        <translation>Balayage vers le haut</translation>
    </message>
    <message>
        <source>Swipe down</source>
        <translation>Balayage vers le bas</translation>
    </message>
    <message>
        <source>Pan to the left</source>
        <translation>Déplacement vers la gauche</translation>
    </message>
    <message>
        <source>Pan to the right</source>
        <translation>Déplacement vers la droite</translation>
    </message>
    <message>
        <source>Pan up</source>
        <translation>Déplacement vers le haut</translation>
    </message>
    <message>
        <source>Pan down</source>
        <translation>Déplacement vers le bas</translation>
    </message>
    <message>
        <source>off</source>
        <translation>non</translation>
    </message>
    <message>
        <source> ms</source>
        <translation> ms</translation>
    </message>
    <message>
        <source> px</source>
        <translation> px</translation>
    </message>
    <message>
        <source>Double click interval</source>
        <translation>Délai du double clic</translation>
    </message>
    <message>
        <source>Long click interval</source>
        <translation>Délai du clic long</translation>
    </message>
    <message>
        <source>Auto click interval</source>
        <translation>Délai du clic auto</translation>
    </message>
    <message>
        <source>Swipe interval</source>
        <translation>Délai du balayage</translation>
    </message>
    <message>
        <source>Click radius</source>
        <translation>Rayon du clic</translation>
    </message>
    <message>
        <source>Double click radius</source>
        <translation>Rayon du double clic</translation>
    </message>
    <message>
        <source>Report hovering</source>
        <translation>Signaler le survol</translation>
    </message>
    <message>
        <source>Signals entered, moved and left, also without a button held</source>
        <translation>Signaux entered, moved et left, même sans bouton enfoncé</translation>
    </message>
    <message>
        <source>Settings of the pad</source>
        <translation>Réglages de la surface</translation>
    </message>
</context>
<context>
    <name>gallery::OverlaysPage</name>
    <message>
        <source>Connection</source>
        <translation>Connexion</translation>
    </message>
    <message>
        <source>Cut the line</source>
        <translation>Couper la ligne</translation>
    </message>
    <message>
        <source>Count the seconds</source>
        <translation>Compter les secondes</translation>
    </message>
    <message>
        <source>Another text, %1 is the time</source>
        <translation>Autre texte, %1 est la durée</translation>
    </message>
    <message>
        <source>The spinner comes a second later: a short loss shows nothing.</source>
        <translation>Le signe tournant vient une seconde plus tard : une courte perte ne montre rien.</translation>
    </message>
    <message>
        <source>Signs</source>
        <translation>Signes</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Lecture</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Start of the recording</source>
        <translation>Début de l’enregistrement</translation>
    </message>
    <message>
        <source>Icon and text</source>
        <translation>Icône et texte</translation>
    </message>
    <message>
        <source>Picture saved</source>
        <translation>Image enregistrée</translation>
    </message>
</context>
<context>
    <name>gallery::PageList</name>
    <message>
        <source>Cameras</source>
        <translation>Caméras</translation>
    </message>
    <message>
        <source>Camera wall</source>
        <translation>Mur de caméras</translation>
    </message>
    <message>
        <source>Click selects a camera, double click enlarges it, a long press cuts its line, a slow drag looks around, a swipe turns to the next wall.</source>
        <translation>Un clic sélectionne une caméra, un double clic l’agrandit, un appui long coupe sa liaison, un glissement lent oriente la vue, un balayage passe au mur suivant.</translation>
    </message>
    <message>
        <source>Input</source>
        <translation>Saisie</translation>
    </message>
    <message>
        <source>Mouse gestures</source>
        <translation>Gestes de la souris</translation>
    </message>
    <message>
        <source>Indicators</source>
        <translation>Indicateurs</translation>
    </message>
    <message>
        <source>Badges and spinners</source>
        <translation>Pastilles et attente</translation>
    </message>
    <message>
        <source>BadgeWidget shows a short text in a pill or a busy mark; BadgeDrawer paints the same into any widget.</source>
        <translation>BadgeWidget affiche un texte court dans une pastille ou un indicateur d’activité ; BadgeDrawer les peint dans n’importe quel widget.</translation>
    </message>
    <message>
        <source>MouseAdapter turns raw mouse events into clicks, long presses, pans and swipes. Try the pad, and drag or flick the picture below it.</source>
        <translation>MouseAdapter transforme les événements bruts de la souris en clics, appuis longs, déplacements et balayages. Essayez la surface, puis glissez ou lancez l’image au-dessous.</translation>
    </message>
    <message>
        <source>Sliders</source>
        <translation>Curseurs</translation>
    </message>
    <message>
        <source>Scroll bars</source>
        <translation>Barres de défilement</translation>
    </message>
    <message>
        <source>NicerScrollBar floats over the content of a scroll area and fades; JumpSlider follows a click on its groove at once.</source>
        <translation>NicerScrollBar flotte au-dessus du contenu d’une zone de défilement et s’estompe ; JumpSlider suit aussitôt un clic sur sa rainure.</translation>
    </message>
    <message>
        <source>Foundation</source>
        <translation>Fondations</translation>
    </message>
    <message>
        <source>Fades and pulses</source>
        <translation>Fondus et pulsations</translation>
    </message>
    <message>
        <source>FadableThing fades as a whole, and one fade can take over from the other at any moment. TFadingWidget is a button that pulses to catch the eye.</source>
        <translation>FadableThing apparaît et disparaît d’un bloc, et un fondu peut à tout moment prendre le relais de l’autre. TFadingWidget est un bouton qui pulse pour attirer l’œil.</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modèles</translation>
    </message>
    <message>
        <source>Device browser</source>
        <translation>Recherche d’appareils</translation>
    </message>
    <message>
        <source>MultiFilterModel searches 10,000 devices while you type; FlexibleTableModel and TableViewDelegate show them as a wall whose columns follow the width.</source>
        <translation>MultiFilterModel cherche parmi 10 000 appareils pendant la saisie ; FlexibleTableModel et TableViewDelegate les montrent en un mur dont les colonnes suivent la largeur.</translation>
    </message>
    <message>
        <source>Click variants</source>
        <translation>Variantes de clic</translation>
    </message>
    <message>
        <source>Labels</source>
        <translation>Étiquettes</translation>
    </message>
    <message>
        <source>ElidedLabel and ElidedButton shorten their text to the room they have; Label covers itself with a picture that keeps its proportions.</source>
        <translation>ElidedLabel et ElidedButton raccourcissent leur texte selon la place disponible ; Label se couvre d&apos;une image qui garde ses proportions.</translation>
    </message>
    <message>
        <source>TCustomClickWidget tells short, long and context clicks apart and asks for rights; CustomContextClickToolButton adds an arrow.</source>
        <translation>TCustomClickWidget distingue les clics courts, longs et contextuels et demande les droits ; CustomContextClickToolButton ajoute une flèche.</translation>
    </message>
    <message>
        <source>Popovers</source>
        <translation>Popovers</translation>
    </message>
    <message>
        <source>A popover points at what it belongs to, keeps inside the window and closes with a click beside it. Click a number.</source>
        <translation>Un popover pointe vers ce à quoi il appartient, reste dans la fenêtre et se ferme d’un clic à côté. Cliquez sur un nombre.</translation>
    </message>
    <message>
        <source>Time line</source>
        <translation>Ligne de temps</translation>
    </message>
    <message>
        <source>MultiNubsieSlider has any number of handles on one scale, kept apart only as far as needed. Drag them, double-click them, click the flags.</source>
        <translation>MultiNubsieSlider porte autant de poignées que l&apos;on veut sur une échelle, écartées seulement autant qu&apos;il le faut. Faites-les glisser, double-cliquez-les, cliquez sur les drapeaux.</translation>
    </message>
    <message>
        <source>Views</source>
        <translation>Vues</translation>
    </message>
    <message>
        <source>Panels</source>
        <translation>Panneaux</translation>
    </message>
    <message>
        <source>Pages and slideshow</source>
        <translation>Pages et diaporama</translation>
    </message>
    <message>
        <source>NavigationViewController slides from page to page and tells each of its coming and going; WidgetSlideshow moves on by itself.</source>
        <translation>NavigationViewController glisse d&apos;une page à l&apos;autre et annonce à chacune son arrivée et son départ ; WidgetSlideshow avance toute seule.</translation>
    </message>
    <message>
        <source>Zoom area</source>
        <translation>Zone de zoom</translation>
    </message>
    <message>
        <source>ZoomScrollArea turns the wheel into a steady stream of zoom factors instead of scrolling.</source>
        <translation>ZoomScrollArea transforme la molette en un flux régulier de facteurs de zoom au lieu de défiler.</translation>
    </message>
    <message>
        <source>Rubber band</source>
        <translation>Cadre élastique</translation>
    </message>
    <message>
        <source>RubberBandWidget marks a region of a picture in the picture&apos;s own units: move it, resize it, turn it over.</source>
        <translation>RubberBandWidget marque une région d&apos;une image dans les unités de celle-ci : on la déplace, la redimensionne, la retourne.</translation>
    </message>
    <message>
        <source>Tool bar customising</source>
        <translation>Barres d&apos;outils personnalisées</translation>
    </message>
    <message>
        <source>CustomToolBar reports which action was dropped where, and which one is to go.</source>
        <translation>CustomToolBar signale quelle action a été déposée où, et laquelle doit partir.</translation>
    </message>
    <message>
        <source>FadeView is a strip at the edge of a view that slides open and can take the full height; FadeStripeView adds a handle, a time line and rows of contents.</source>
        <translation>FadeView est une bande au bord d&apos;une vue qui s&apos;ouvre en glissant et peut prendre toute la hauteur ; FadeStripeView ajoute une poignée, une ligne de temps et des rangées.</translation>
    </message>
    <message>
        <source>Overlays</source>
        <translation>Incrustations</translation>
    </message>
    <message>
        <source>BusyOverlayView tells that a connection has gone and for how long; IconOverlayView shows a sign for a moment and deletes itself.</source>
        <translation>BusyOverlayView signale qu’une connexion est perdue et depuis combien de temps ; IconOverlayView montre un signe un instant et se supprime.</translation>
    </message>
    <message>
        <source>Time labels</source>
        <translation>Étiquettes d’heure</translation>
    </message>
    <message>
        <source>TimeLabel shows the time of a picture and lets it be edited; NameTimeLabel drops what has no room.</source>
        <translation>TimeLabel montre l’heure d’une image et permet de la modifier ; NameTimeLabel omet ce qui n’a pas de place.</translation>
    </message>
    <message>
        <source>Frames</source>
        <translation>Cadres</translation>
    </message>
    <message>
        <source>BorderIcon cuts a small picture into nine parts and fills any rectangle with it.</source>
        <translation>BorderIcon découpe une petite image en neuf parties et en remplit n’importe quel rectangle.</translation>
    </message>
    <message>
        <source>Controls</source>
        <translation>Commandes</translation>
    </message>
    <message>
        <source>Edits</source>
        <translation>Champs de saisie</translation>
    </message>
    <message>
        <source>Fields for search words, folders and times, and a combo box that leaves the wheel to the form around it.</source>
        <translation>Des champs pour recherches, dossiers et heures, et une liste déroulante qui laisse la molette au formulaire.</translation>
    </message>
    <message>
        <source>Counting lines</source>
        <translation>Lignes de comptage</translation>
    </message>
    <message>
        <source>VxCountingLinesGroupBox edits a line across the picture; whoever crosses it is counted.</source>
        <translation>VxCountingLinesGroupBox modifie une ligne dans l’image ; qui la franchit est compté.</translation>
    </message>
    <message>
        <source>Password form</source>
        <translation>Formulaire de mot de passe</translation>
    </message>
    <message>
        <source>PasswordCheckWidget checks a new password while it is typed; the theme colours the fields by its verdict.</source>
        <translation>PasswordCheckWidget vérifie un nouveau mot de passe pendant la saisie ; le thème colore les champs selon son verdict.</translation>
    </message>
    <message>
        <source>Dial and joystick</source>
        <translation>Molette et manette</translation>
    </message>
    <message>
        <source>DialButton is dragged sideways and can spring back; JoystickViewWidget shows where a stick stands.</source>
        <translation>DialButton se tire latéralement et peut revenir à sa place ; JoystickViewWidget montre la position d’une manette.</translation>
    </message>
    <message>
        <source>Phone-style list</source>
        <translation>Liste façon téléphone</translation>
    </message>
    <message>
        <source>iOSListWidget has rows that can be edited, deleted and put in another order.</source>
        <translation>iOSListWidget a des lignes que l’on peut modifier, supprimer et réordonner.</translation>
    </message>
    <message>
        <source>Popover rows</source>
        <translation>Lignes de popovers</translation>
    </message>
    <message>
        <source>Every row that a popover can hold: texts, choices, values and submenus. What is performed stands in the log, with its value and flags.</source>
        <translation>Chaque ligne qu&apos;un popover peut contenir : textes, choix, valeurs et sous-menus. Ce qui est exécuté figure dans le journal, avec sa valeur et ses indicateurs.</translation>
    </message>
    <message>
        <source>Camera client</source>
        <translation>Client de caméras</translation>
    </message>
    <message>
        <source>A whole client made of the library. Log in as user with camera1!, or as admin with camera2!, who may export, steer and edit.</source>
        <translation>Un client entier fait avec la bibliothèque. Entrez comme user avec camera1! ou comme admin avec camera2!, qui peut tout.</translation>
    </message>
</context>
<context>
    <name>gallery::PagesPage</name>
    <message>
        <source>Camera</source>
        <translation>Caméra</translation>
    </message>
    <message>
        <source>What the new camera is called and where it hangs.</source>
        <translation>Le nom de la nouvelle caméra et son emplacement.</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>North gate</source>
        <translation>Portail nord</translation>
    </message>
    <message>
        <source>Building</source>
        <translation>Bâtiment</translation>
    </message>
    <message>
        <source>Yard</source>
        <translation>Cour</translation>
    </message>
    <message>
        <source>Network</source>
        <translation>Réseau</translation>
    </message>
    <message>
        <source>Where the camera is reached. The port is rarely another one.</source>
        <translation>Où joindre la caméra. Le port est rarement différent.</translation>
    </message>
    <message>
        <source>Address</source>
        <translation>Adresse</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>Port</translation>
    </message>
    <message>
        <source>Recording</source>
        <translation>Enregistrement</translation>
    </message>
    <message>
        <source>How long pictures are kept, and how many a second.</source>
        <translation>Durée de conservation des images, et leur nombre par seconde.</translation>
    </message>
    <message>
        <source>Days</source>
        <translation>Jours</translation>
    </message>
    <message>
        <source>Pictures</source>
        <translation>Images</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Retour</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Suivant</translation>
    </message>
    <message>
        <source>Main street</source>
        <translation>Grand-rue</translation>
    </message>
    <message>
        <source>Reception</source>
        <translation>Accueil</translation>
    </message>
    <message>
        <source>Container yard</source>
        <translation>Parc à conteneurs</translation>
    </message>
    <message>
        <source>Slideshow</source>
        <translation>Diaporama</translation>
    </message>
    <message>
        <source>The next camera every five seconds</source>
        <translation>La caméra suivante toutes les cinq secondes</translation>
    </message>
    <message>
        <source>Step %1 of %2</source>
        <translation>Étape %1 sur %2</translation>
    </message>
</context>
<context>
    <name>gallery::PanelsPage</name>
    <message>
        <source>North gate</source>
        <translation>Portail nord</translation>
    </message>
    <message>
        <source>Latest events</source>
        <translation>Derniers événements</translation>
    </message>
    <message>
        <source>Upper panel</source>
        <translation>Panneau du haut</translation>
    </message>
    <message>
        <source>Lower panel</source>
        <translation>Panneau du bas</translation>
    </message>
    <message>
        <source>Full height</source>
        <translation>Pleine hauteur</translation>
    </message>
    <message>
        <source>Start at the edge</source>
        <translation>Partir du bord</translation>
    </message>
    <message>
        <source>fadein() and fadeout() with force: not from where the panel is</source>
        <translation>fadein() et fadeout() avec force : pas depuis la position du panneau</translation>
    </message>
    <message>
        <source>Click the handles, also while a panel moves; drag the lower one.</source>
        <translation>Cliquez sur les poignées, même pendant le mouvement ; tirez celle du bas.</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Temps</translation>
    </message>
</context>
<context>
    <name>gallery::PasswordPage</name>
    <message>
        <source>New password</source>
        <translation>Nouveau mot de passe</translation>
    </message>
    <message>
        <source>Once more</source>
        <translation>Encore une fois</translation>
    </message>
    <message>
        <source>Password of the camera</source>
        <translation>Mot de passe de la caméra</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Start again</source>
        <translation>Recommencer</translation>
    </message>
    <message>
        <source>What is asked of it</source>
        <translation>Ce qui est exigé</translation>
    </message>
    <message>
        <source>%1 characters or more</source>
        <translation>%1 caractères ou plus</translation>
    </message>
    <message>
        <source>A small and a capital letter</source>
        <translation>Une minuscule et une majuscule</translation>
    </message>
    <message>
        <source>A digit and a letter</source>
        <translation>Un chiffre et une lettre</translation>
    </message>
    <message>
        <source>A special character</source>
        <translation>Un caractère spécial</translation>
    </message>
    <message>
        <source>Not used before (Camera_2025 was)</source>
        <translation>Pas déjà utilisé (Camera_2025 l’a été)</translation>
    </message>
    <message>
        <source>The same both times</source>
        <translation>Identique les deux fois</translation>
    </message>
</context>
<context>
    <name>gallery::PhoneListPage</name>
    <message>
        <source>Gate west</source>
        <translation>Portail ouest</translation>
    </message>
    <message>
        <source>Yard north</source>
        <translation>Cour nord</translation>
    </message>
    <message>
        <source>Entrance hall</source>
        <translation>Hall d’entrée</translation>
    </message>
    <message>
        <source>Ramp</source>
        <translation>Rampe</translation>
    </message>
    <message>
        <source>Stairs</source>
        <translation>Escalier</translation>
    </message>
    <message>
        <source>Roof</source>
        <translation>Toit</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>hors ligne</translation>
    </message>
    <message>
        <source>online</source>
        <translation>en ligne</translation>
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
        <source>Add a camera</source>
        <translation>Ajouter une caméra</translation>
    </message>
    <message>
        <source>Camera %1</source>
        <translation>Caméra %1</translation>
    </message>
    <message>
        <source>Keep the last one</source>
        <translation>Garder la dernière</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>Appareils</translation>
    </message>
    <message>
        <source>While you edit: the red sign brings out a button that deletes the row, a row is dragged to another place, and its name can be changed.</source>
        <translation>Pendant la modification : le signe rouge fait apparaître un bouton qui supprime la ligne, une ligne se tire à une autre place, et son nom peut être changé.</translation>
    </message>
</context>
<context>
    <name>gallery::PopoverRowsPage</name>
    <message>
        <source>Texts</source>
        <translation>Textes</translation>
    </message>
    <message>
        <source>Choices</source>
        <translation>Choix</translation>
    </message>
    <message>
        <source>Values</source>
        <translation>Valeurs</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>I am an administrator</source>
        <translation>Je suis administrateur</translation>
    </message>
    <message>
        <source>Rows are busy</source>
        <translation>Lignes occupées</translation>
    </message>
    <message>
        <source>A right click on a row with a value offers to set it back.</source>
        <translation>Un clic droit sur une ligne avec une valeur propose de la rétablir.</translation>
    </message>
    <message>
        <source>Brightness</source>
        <translation>Luminosité</translation>
    </message>
    <message>
        <source>Set back</source>
        <translation>Rétablir</translation>
    </message>
    <message>
        <source>Search cameras</source>
        <translation>Rechercher des caméras</translation>
    </message>
    <message>
        <source>Text over as many lines as it takes, with &lt;a href=&quot;https://www.qt.io&quot;&gt;links&lt;/a&gt;.</source>
        <translation>Du texte sur autant de lignes qu&apos;il faut, avec des &lt;a href=&quot;https://www.qt.io&quot;&gt;liens&lt;/a&gt;.</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Gate</source>
        <translation>Portail</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Groupe</translation>
    </message>
    <message>
        <source>All groups</source>
        <translation>Tous les groupes</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parking</translation>
    </message>
    <message>
        <source>Place</source>
        <translation>Lieu</translation>
    </message>
    <message>
        <source>several values</source>
        <translation>plusieurs valeurs</translation>
    </message>
    <message>
        <source>Take a picture</source>
        <translation>Prendre une image</translation>
    </message>
    <message>
        <source>Ctrl+P</source>
        <translation>Ctrl+P</translation>
    </message>
    <message>
        <source>Click or double click</source>
        <translation>Clic ou double clic</translation>
    </message>
    <message>
        <source>Recording</source>
        <translation>Enregistrement</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Son</translation>
    </message>
    <message>
        <source>Events of all inputs</source>
        <translation>Événements de toutes les entrées</translation>
    </message>
    <message>
        <source>Stream</source>
        <translation>Flux</translation>
    </message>
    <message>
        <source>High</source>
        <translation>Élevée</translation>
    </message>
    <message>
        <source>Medium</source>
        <translation>Moyenne</translation>
    </message>
    <message>
        <source>Low</source>
        <translation>Basse</translation>
    </message>
    <message>
        <source>Lamp</source>
        <translation>Lampe</translation>
    </message>
    <message>
        <source>level %1</source>
        <translation>niveau %1</translation>
    </message>
    <message>
        <source>Always</source>
        <translation>Toujours</translation>
    </message>
    <message>
        <source>On motion</source>
        <translation>Sur mouvement</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Jamais</translation>
    </message>
    <message>
        <source>Frames a second</source>
        <translation>Images par seconde</translation>
    </message>
    <message>
        <source>From</source>
        <translation>Du</translation>
    </message>
    <message>
        <source>Every</source>
        <translation>Toutes les</translation>
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
        <source>At most</source>
        <translation>Max.</translation>
    </message>
    <message>
        <source>MB</source>
        <translation>Mo</translation>
    </message>
    <message>
        <source>Quality</source>
        <translation>Qualité</translation>
    </message>
    <message>
        <source>Storage</source>
        <translation>Stockage</translation>
    </message>
    <message>
        <source>Overwrite old recordings</source>
        <translation>Écraser les anciens enregistrements</translation>
    </message>
    <message>
        <source>Days to keep</source>
        <translation>Jours de conservation</translation>
    </message>
    <message>
        <source>Show the time</source>
        <translation>Afficher l&apos;heure</translation>
    </message>
    <message>
        <source>GB</source>
        <translation>Go</translation>
    </message>
</context>
<context>
    <name>gallery::PopoversPage</name>
    <message>
        <source>Camera %1</source>
        <translation>Caméra %1</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>hors ligne</translation>
    </message>
    <message>
        <source>live</source>
        <translation>en direct</translation>
    </message>
    <message>
        <source>Sides of the arrow</source>
        <translation>Côtés de la flèche</translation>
    </message>
    <message>
        <source>Top: below the target</source>
        <translation>Haut : sous la cible</translation>
    </message>
    <message>
        <source>Bottom: above the target</source>
        <translation>Bas : au-dessus de la cible</translation>
    </message>
    <message>
        <source>Left: right of the target</source>
        <translation>Gauche : à droite de la cible</translation>
    </message>
    <message>
        <source>Right: left of the target</source>
        <translation>Droite : à gauche de la cible</translation>
    </message>
    <message>
        <source>Features</source>
        <translation>Éléments</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Titre</translation>
    </message>
    <message>
        <source>Close button</source>
        <translation>Bouton de fermeture</translation>
    </message>
    <message>
        <source>Help button</source>
        <translation>Bouton d’aide</translation>
    </message>
    <message>
        <source>No title bar</source>
        <translation>Sans barre de titre</translation>
    </message>
    <message>
        <source>%1 rows</source>
        <translation>%1 lignes</translation>
    </message>
    <message>
        <source>Grow from the middle</source>
        <translation>Grandir depuis le centre</translation>
    </message>
    <message>
        <source>Modal</source>
        <translation>Modal</translation>
    </message>
    <message>
        <source>Ask</source>
        <translation>Demander</translation>
    </message>
    <message>
        <source>No answer yet</source>
        <translation>Pas encore de réponse</translation>
    </message>
    <message>
        <source>Drag help</source>
        <translation>Aide au glisser</translation>
    </message>
    <message>
        <source>Drag a camera: the popover that takes it comes up.</source>
        <translation>Faites glisser une caméra : le popover qui l’accepte apparaît.</translation>
    </message>
    <message>
        <source>Nothing dropped yet</source>
        <translation>Rien n’a encore été déposé</translation>
    </message>
    <message>
        <source>Cameras</source>
        <translation>Caméras</translation>
    </message>
    <message>
        <source>Delete the recording?</source>
        <translation>Supprimer l’enregistrement ?</translation>
    </message>
    <message>
        <source>Camera 3, today from 10:00 to 10:45</source>
        <translation>Caméra 3, aujourd’hui de 10:00 à 10:45</translation>
    </message>
    <message>
        <source>Accepted: 1</source>
        <translation>Accepté : 1</translation>
    </message>
    <message>
        <source>Rejected: 0</source>
        <translation>Refusé : 0</translation>
    </message>
    <message>
        <source>Favourites</source>
        <translation>Favoris</translation>
    </message>
    <message>
        <source>Drop it here</source>
        <translation>Déposez-la ici</translation>
    </message>
    <message>
        <source>Dropped: %1</source>
        <translation>Déposé : %1</translation>
    </message>
</context>
<context>
    <name>gallery::PtzPage</name>
    <message>
        <source>to the left</source>
        <translation>à gauche</translation>
    </message>
    <message>
        <source>to the right</source>
        <translation>à droite</translation>
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
        <source>Camera</source>
        <translation>Caméra</translation>
    </message>
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
        <source>Drag a dial sideways. Pan and tilt spring back, zoom stays.</source>
        <translation>Tirer une molette latéralement. Panoramique et inclinaison reviennent, le zoom reste.</translation>
    </message>
</context>
<context>
    <name>gallery::RubberBandPage</name>
    <message>
        <source>Container yard</source>
        <translation>Parc à conteneurs</translation>
    </message>
    <message>
        <source>Gate</source>
        <translation>Portail</translation>
    </message>
    <message>
        <source>Crane</source>
        <translation>Grue</translation>
    </message>
    <message>
        <source>Left</source>
        <translation>Gauche</translation>
    </message>
    <message>
        <source>Top</source>
        <translation>Haut</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Largeur</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Hauteur</translation>
    </message>
    <message>
        <source>Keep 16 : 9</source>
        <translation>Garder 16 : 9</translation>
    </message>
    <message>
        <source>New region</source>
        <translation>Nouvelle région</translation>
    </message>
    <message>
        <source>Drag edges, corners or the inside. Shift keeps the proportions.</source>
        <translation>Tirez les bords, les coins ou l&apos;intérieur. Maj garde les proportions.</translation>
    </message>
    <message>
        <source>Pixels of the camera</source>
        <translation>Pixels de la caméra</translation>
    </message>
    <message>
        <source>Region %1</source>
        <translation>Région %1</translation>
    </message>
</context>
<context>
    <name>gallery::ScrollBarsPage</name>
    <message>
        <source>Plain bars</source>
        <translation>Barres ordinaires</translation>
    </message>
    <message>
        <source>They take room from the content.</source>
        <translation>Elles prennent de la place au contenu.</translation>
    </message>
    <message>
        <source>Overlay bars</source>
        <translation>Barres flottantes</translation>
    </message>
    <message>
        <source>They float over it, and fade.</source>
        <translation>Elles flottent et s’estompent.</translation>
    </message>
    <message>
        <source>Top and left</source>
        <translation>En haut et à gauche</translation>
    </message>
    <message>
        <source>The same on the other edges.</source>
        <translation>Les mêmes sur les autres bords.</translation>
    </message>
    <message>
        <source>A click on the groove</source>
        <translation>Un clic sur la rainure</translation>
    </message>
    <message>
        <source>pages</source>
        <translation>avance par page</translation>
    </message>
    <message>
        <source>jumps</source>
        <translation>saute</translation>
    </message>
    <message>
        <source>Shown as needed</source>
        <translation>Affichées au besoin</translation>
    </message>
    <message>
        <source>Always shown</source>
        <translation>Toujours affichées</translation>
    </message>
    <message>
        <source>Never shown</source>
        <translation>Jamais affichées</translation>
    </message>
    <message>
        <source>Fade after a while</source>
        <translation>S’estompent après un moment</translation>
    </message>
</context>
<context>
    <name>gallery::SignalLog</name>
    <message>
        <source>Time</source>
        <translation>Heure</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objet</translation>
    </message>
    <message>
        <source>Signal</source>
        <translation>Signal</translation>
    </message>
    <message>
        <source>Arguments</source>
        <translation>Arguments</translation>
    </message>
</context>
<context>
    <name>gallery::TimeLabelsPage</name>
    <message>
        <source>Time of the picture</source>
        <translation>Heure de l’image</translation>
    </message>
    <message>
        <source>Can be edited</source>
        <translation>Modifiable</translation>
    </message>
    <message>
        <source>Comes from the file server</source>
        <translation>Vient du serveur de fichiers</translation>
    </message>
    <message>
        <source>Something is wrong</source>
        <translation>Quelque chose ne va pas</translation>
    </message>
    <message>
        <source>Count from here</source>
        <translation>Compter à partir d’ici</translation>
    </message>
    <message>
        <source>Drag the label by its symbol; a double click puts it back.</source>
        <translation>Tirer l’étiquette par son symbole ; un double clic la remet en place.</translation>
    </message>
    <message>
        <source>Name, date and time in the room there is</source>
        <translation>Nom, date et heure dans la place disponible</translation>
    </message>
    <message>
        <source>The clock of the device is two minutes late</source>
        <translation>L’horloge de l’appareil retarde de deux minutes</translation>
    </message>
    <message>
        <source>Loading bay west</source>
        <translation>Quai ouest</translation>
    </message>
    <message>
        <source>A click on the narrowest line turns it over.</source>
        <translation>Un clic sur la ligne la plus étroite la retourne.</translation>
    </message>
</context>
<context>
    <name>gallery::TimeLinePage</name>
    <message>
        <source>Drag the blue handle through the day. The farther you pull away from the bar, the slower it goes, down to single seconds. The flags go with the ends of the range.</source>
        <translation>Faites glisser la poignée bleue à travers la journée. Plus vous vous éloignez de la barre, plus elle ralentit, jusqu&apos;à la seconde près. Les drapeaux suivent les extrémités de la plage.</translation>
    </message>
    <message>
        <source>A day of recordings</source>
        <translation>Une journée d&apos;enregistrements</translation>
    </message>
    <message>
        <source>Handles that share a scale</source>
        <translation>Des poignées sur une échelle</translation>
    </message>
    <message>
        <source>Close values are pushed apart. Take one out, and its neighbours drift home.</source>
        <translation>Les valeurs proches s&apos;écartent. Retirez-en une, et ses voisines reviennent.</translation>
    </message>
    <message>
        <source>Kinds of handles</source>
        <translation>Sortes de poignées</translation>
    </message>
    <message>
        <source>Five steps</source>
        <translation>Cinq crans</translation>
    </message>
    <message>
        <source>Spring</source>
        <translation>Ressort</translation>
    </message>
    <message>
        <source>Inverted</source>
        <translation>Inversée</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Nombres</translation>
    </message>
    <message>
        <source>Fading</source>
        <translation>Fondu</translation>
    </message>
    <message>
        <source>Jumping</source>
        <translation>Saut</translation>
    </message>
    <message>
        <source>Minimum and maximum while a handle is in use</source>
        <translation>Minimum et maximum tant qu&apos;une poignée est utilisée</translation>
    </message>
    <message>
        <source>The bar fades when the pointer leaves</source>
        <translation>La barre s&apos;estompe quand le pointeur la quitte</translation>
    </message>
    <message>
        <source>A click on the track moves the only handle</source>
        <translation>Un clic sur la barre déplace l&apos;unique poignée</translation>
    </message>
    <message>
        <source>Features</source>
        <translation>Options</translation>
    </message>
    <message>
        <source>Start of the range to export</source>
        <translation>Début de la plage à exporter</translation>
    </message>
    <message>
        <source>End of the range to export</source>
        <translation>Fin de la plage à exporter</translation>
    </message>
    <message>
        <source>Moment that is shown</source>
        <translation>Moment affiché</translation>
    </message>
    <message>
        <source>To export: %1 to %2</source>
        <translation>À exporter : de %1 à %2</translation>
    </message>
</context>
<context>
    <name>gallery::ToolBarPage</name>
    <message>
        <source>Back</source>
        <translation>Retour</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Lecture</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Avant</translation>
    </message>
    <message>
        <source>Record</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Snapshot</source>
        <translation>Instantané</translation>
    </message>
    <message>
        <source>Camera wall</source>
        <translation>Mur de caméras</translation>
    </message>
    <message>
        <source>Flag</source>
        <translation>Marquer</translation>
    </message>
    <message>
        <source>Drag an action from the list onto a bar.</source>
        <translation>Tirez une action de la liste sur une barre.</translation>
    </message>
    <message>
        <source>%1 before %2</source>
        <translation>%1 avant %2</translation>
    </message>
    <message>
        <source>%1 at the end</source>
        <translation>%1 à la fin</translation>
    </message>
    <message>
        <source>%1 removed</source>
        <translation>%1 supprimé</translation>
    </message>
    <message>
        <source>Bar dropped: %1</source>
        <translation>Barre déposée : %1</translation>
    </message>
    <message>
        <source>Drag an action onto a bar; right click an action there to remove it. The bars can be dragged by their empty part.</source>
        <translation>Tirez une action sur une barre ; un clic droit l&apos;y supprime. Les barres se tirent par leur partie vide.</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Actions</translation>
    </message>
</context>
<context>
    <name>gallery::ZoomAreaPage</name>
    <message>
        <source>Original size</source>
        <translation>Taille d&apos;origine</translation>
    </message>
    <message>
        <source>Scroll bars</source>
        <translation>Barres de défilement</translation>
    </message>
    <message>
        <source>Turn the wheel over the picture; scroll with the bars.</source>
        <translation>Tournez la molette sur l&apos;image ; défilez avec les barres.</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
</context>
</TS>
