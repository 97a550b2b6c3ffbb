<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>gallery::BadgesPage</name>
    <message>
        <source>Busy marks</source>
        <translation>Wartezeichen</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Bogen</translation>
    </message>
    <message>
        <source>Ring</source>
        <translation>Ring</translation>
    </message>
    <message>
        <source>Dots</source>
        <translation>Punkte</translation>
    </message>
    <message>
        <source>Spokes</source>
        <translation>Speichen</translation>
    </message>
    <message>
        <source>Pills</source>
        <translation>Plaketten</translation>
    </message>
    <message>
        <source>Plain</source>
        <translation>Schlicht</translation>
    </message>
    <message>
        <source>Stroke</source>
        <translation>Umrandet</translation>
    </message>
    <message>
        <source>Crossed</source>
        <translation>Durchgestrichen</translation>
    </message>
    <message>
        <source>new</source>
        <translation>neu</translation>
    </message>
    <message>
        <source>In rows</source>
        <translation>In Zeilen</translation>
    </message>
    <message>
        <source>live</source>
        <translation>live</translation>
    </message>
    <message>
        <source>off</source>
        <translation>aus</translation>
    </message>
    <message>
        <source>Searching for cameras</source>
        <translation>Kameras werden gesucht</translation>
    </message>
    <message>
        <source>Unread alarms</source>
        <translation>Ungelesene Alarme</translation>
    </message>
    <message>
        <source>Main street</source>
        <translation>Hauptstraße</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parkplatz</translation>
    </message>
    <message>
        <source>Export is running</source>
        <translation>Export läuft</translation>
    </message>
    <message>
        <source>Alignment</source>
        <translation>Ausrichtung</translation>
    </message>
    <message>
        <source>Try it</source>
        <translation>Ausprobieren</translation>
    </message>
    <message>
        <source>Set the label</source>
        <translation>Text setzen</translation>
    </message>
    <message>
        <source>Set it crossed</source>
        <translation>Durchstreichen</translation>
    </message>
    <message>
        <source>Busy</source>
        <translation>Beschäftigt</translation>
    </message>
    <message>
        <source>Not busy</source>
        <translation>Fertig</translation>
    </message>
    <message>
        <source>No badge</source>
        <translation>Keine Plakette</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Colours</source>
        <translation>Farben</translation>
    </message>
</context>
<context>
    <name>gallery::CameraTile</name>
    <message>
        <source>No signal</source>
        <translation>Kein Signal</translation>
    </message>
</context>
<context>
    <name>gallery::CameraWallPage</name>
    <message>
        <source>Main street</source>
        <translation>Hauptstraße</translation>
    </message>
    <message>
        <source>Reception</source>
        <translation>Empfang</translation>
    </message>
    <message>
        <source>Container yard</source>
        <translation>Containerhof</translation>
    </message>
    <message>
        <source>North gate</source>
        <translation>Nordtor</translation>
    </message>
    <message>
        <source>Corridor 1</source>
        <translation>Flur 1</translation>
    </message>
    <message>
        <source>Loading dock</source>
        <translation>Laderampe</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parkplatz</translation>
    </message>
    <message>
        <source>Staircase</source>
        <translation>Treppenhaus</translation>
    </message>
    <message>
        <source>Rail siding</source>
        <translation>Gleisanschluss</translation>
    </message>
    <message>
        <source>South gate</source>
        <translation>Südtor</translation>
    </message>
    <message>
        <source>Canteen</source>
        <translation>Kantine</translation>
    </message>
    <message>
        <source>Warehouse</source>
        <translation>Lagerhalle</translation>
    </message>
    <message>
        <source>Bus stop</source>
        <translation>Bushaltestelle</translation>
    </message>
    <message>
        <source>Corridor 2</source>
        <translation>Flur 2</translation>
    </message>
    <message>
        <source>Crane</source>
        <translation>Kran</translation>
    </message>
    <message>
        <source>Ring road</source>
        <translation>Ringstraße</translation>
    </message>
    <message>
        <source>Workshop</source>
        <translation>Werkstatt</translation>
    </message>
    <message>
        <source>Quay</source>
        <translation>Kai</translation>
    </message>
    <message>
        <source>Previous</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Weiter</translation>
    </message>
    <message>
        <source>Wall %1 of %2</source>
        <translation>Wand %1 von %2</translation>
    </message>
    <message>
        <source>%1 frames per second   Without signal: %2</source>
        <translation>%1 Bilder pro Sekunde   Ohne Signal: %2</translation>
    </message>
</context>
<context>
    <name>gallery::ClickVariantsPage</name>
    <message>
        <source>The last click</source>
        <translation>Der letzte Klick</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Noch keiner</translation>
    </message>
    <message>
        <source>Click, hold or right click one of the buttons.</source>
        <translation>Klicken, halten oder rechtsklicken Sie auf einen der Knöpfe.</translation>
    </message>
    <message>
        <source>Long click</source>
        <translation>Langer Klick</translation>
    </message>
    <message>
        <source>The button clicked by itself, the mouse still down.</source>
        <translation>Der Knopf hat von selbst geklickt, die Maustaste noch gedrückt.</translation>
    </message>
    <message>
        <source>The button clicked on the release.</source>
        <translation>Der Knopf hat beim Loslassen geklickt.</translation>
    </message>
    <message>
        <source>Context click</source>
        <translation>Kontextklick</translation>
    </message>
    <message>
        <source>A right click is a click of its own kind and opens no menu.</source>
        <translation>Ein Rechtsklick ist ein Klick eigener Art und öffnet kein Menü.</translation>
    </message>
    <message>
        <source>Click on the arrow</source>
        <translation>Klick auf den Pfeil</translation>
    </message>
    <message>
        <source>The slot opens what it wants.</source>
        <translation>Der Slot öffnet, was er will.</translation>
    </message>
    <message>
        <source>Normal click</source>
        <translation>Normaler Klick</translation>
    </message>
    <message>
        <source>Hold the button longer, or use the other mouse button.</source>
        <translation>Halten Sie den Knopf länger, oder nehmen Sie die andere Maustaste.</translation>
    </message>
    <message>
        <source>Kinds of clicks</source>
        <translation>Arten von Klicks</translation>
    </message>
    <message>
        <source>Hold</source>
        <translation>Halten</translation>
    </message>
    <message>
        <source>Clicks by itself after 750 ms.</source>
        <translation>Klickt nach 750 ms von selbst.</translation>
    </message>
    <message>
        <source>Hold and release</source>
        <translation>Halten und loslassen</translation>
    </message>
    <message>
        <source>Without automatic clicks.</source>
        <translation>Ohne automatische Klicks.</translation>
    </message>
    <message>
        <source>Checkable</source>
        <translation>Umschaltbar</translation>
    </message>
    <message>
        <source>Held, it reports its state and keeps it.</source>
        <translation>Gehalten meldet er seinen Zustand und behält ihn.</translation>
    </message>
    <message>
        <source>Split</source>
        <translation>Geteilt</translation>
    </message>
    <message>
        <source>The arrow is a click of its own.</source>
        <translation>Der Pfeil ist ein eigener Klick.</translation>
    </message>
    <message>
        <source>Rights</source>
        <translation>Rechte</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Export</translation>
    </message>
    <message>
        <source>Needs the right to export.</source>
        <translation>Braucht das Recht zu exportieren.</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>For administrators.</source>
        <translation>Für Administratoren.</translation>
    </message>
    <message>
        <source>The user may export</source>
        <translation>Der Benutzer darf exportieren</translation>
    </message>
    <message>
        <source>The user is an administrator</source>
        <translation>Der Benutzer ist Administrator</translation>
    </message>
    <message>
        <source>A widget to click</source>
        <translation>Ein Widget zum Klicken</translation>
    </message>
    <message>
        <source>Click me with any button</source>
        <translation>Mit jeder Maustaste klickbar</translation>
    </message>
    <message>
        <source>Click on a widget</source>
        <translation>Klick auf ein Widget</translation>
    </message>
    <message>
        <source>It has the signals of a button and is none.</source>
        <translation>Es hat die Signale eines Knopfes und ist keiner.</translation>
    </message>
    <message>
        <source>pressed, clicked and released, with every mouse button.</source>
        <translation>pressed, clicked und released, mit jeder Maustaste.</translation>
    </message>
</context>
<context>
    <name>gallery::CountingLinesPage</name>
    <message>
        <source>Main entrance</source>
        <translation>Haupteingang</translation>
    </message>
    <message>
        <source>Outside</source>
        <translation>Draußen</translation>
    </message>
    <message>
        <source>Inside</source>
        <translation>Drinnen</translation>
    </message>
    <message>
        <source>Drag the ends of the line in the picture, or change the numbers.</source>
        <translation>Die Enden der Linie im Bild ziehen oder die Zahlen ändern.</translation>
    </message>
</context>
<context>
    <name>gallery::DeviceBrowserPage</name>
    <message>
        <source>North gate</source>
        <translation>Nordtor</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parkplatz</translation>
    </message>
    <message>
        <source>Loading ramp</source>
        <translation>Laderampe</translation>
    </message>
    <message>
        <source>Lobby</source>
        <translation>Eingangshalle</translation>
    </message>
    <message>
        <source>online</source>
        <translation>verbunden</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>getrennt</translation>
    </message>
    <message>
        <source>Building %1, %2, camera %3</source>
        <translation>Gebäude %1, %2, Kamera %3</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Place</source>
        <translation>Ort</translation>
    </message>
    <message>
        <source>Address</source>
        <translation>Adresse</translation>
    </message>
    <message>
        <source>State</source>
        <translation>Zustand</translation>
    </message>
    <message>
        <source>Search in name and address</source>
        <translation>In Name und Adresse suchen</translation>
    </message>
    <message>
        <source>All places</source>
        <translation>Alle Orte</translation>
    </message>
    <message>
        <source>All states</source>
        <translation>Alle Zustände</translation>
    </message>
    <message>
        <source>%1 of %2 devices, %3 ms</source>
        <translation>%1 von %2 Geräten, %3 ms</translation>
    </message>
</context>
<context>
    <name>gallery::EditsPage</name>
    <message>
        <source>Search</source>
        <translation>Suche</translation>
    </message>
    <message>
        <source>Find a camera</source>
        <translation>Kamera suchen</translation>
    </message>
    <message>
        <source>Gate</source>
        <translation>Tor</translation>
    </message>
    <message>
        <source>Yard</source>
        <translation>Hof</translation>
    </message>
    <message>
        <source>Hall</source>
        <translation>Halle</translation>
    </message>
    <message>
        <source>Ramp</source>
        <translation>Rampe</translation>
    </message>
    <message>
        <source>Stairs</source>
        <translation>Treppe</translation>
    </message>
    <message>
        <source>north</source>
        <translation>Nord</translation>
    </message>
    <message>
        <source>east</source>
        <translation>Ost</translation>
    </message>
    <message>
        <source>south</source>
        <translation>Süd</translation>
    </message>
    <message>
        <source>west</source>
        <translation>West</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Export</translation>
    </message>
    <message>
        <source>Read only</source>
        <translation>Nur lesen</translation>
    </message>
    <message>
        <source>Folder</source>
        <translation>Ordner</translation>
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
        <source>Drop a file on the folder: its folder is taken. The cross brings the end back.</source>
        <translation>Eine Datei auf den Ordner fallen lassen: Ihr Ordner wird genommen. Das Kreuz bringt das Ende zurück.</translation>
    </message>
    <message>
        <source>A form that scrolls</source>
        <translation>Ein Formular, das rollt</translation>
    </message>
    <message>
        <source>The wheel over a combo box scrolls the form and changes nothing.</source>
        <translation>Das Mausrad über einer Auswahl rollt das Formular und ändert nichts.</translation>
    </message>
    <message>
        <source>25 pictures a second</source>
        <translation>25 Bilder je Sekunde</translation>
    </message>
    <message>
        <source>12 pictures a second</source>
        <translation>12 Bilder je Sekunde</translation>
    </message>
    <message>
        <source>1 picture a second</source>
        <translation>1 Bild je Sekunde</translation>
    </message>
    <message>
        <source>Camera %1</source>
        <translation>Kamera %1</translation>
    </message>
</context>
<context>
    <name>gallery::FadesPage</name>
    <message>
        <source>Fade a whole widget</source>
        <translation>Ein ganzes Widget blenden</translation>
    </message>
    <message>
        <source>Recording resumes in a moment</source>
        <translation>Die Aufzeichnung geht gleich weiter</translation>
    </message>
    <message>
        <source>Opacity %1 %</source>
        <translation>Deckkraft %1 %</translation>
    </message>
    <message>
        <source>Fade in</source>
        <translation>Einblenden</translation>
    </message>
    <message>
        <source>Fade out</source>
        <translation>Ausblenden</translation>
    </message>
    <message>
        <source>Fade what is inside as well</source>
        <translation>Auch den Inhalt blenden</translation>
    </message>
    <message>
        <source>Hide at the end</source>
        <translation>Am Ende verbergen</translation>
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
        <translation>Pulsieren</translation>
    </message>
    <message>
        <source>A press on a button ends its pulse.</source>
        <translation>Ein Druck auf eine Taste beendet ihr Pulsieren.</translation>
    </message>
    <message>
        <source>Fall once</source>
        <translation>Einmal abklingen</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Anhalten</translation>
    </message>
    <message>
        <source>Overlay, badge, shadow</source>
        <translation>Auflage, Plakette, Schatten</translation>
    </message>
    <message>
        <source>Drawn on top of the button, with or without a pulse.</source>
        <translation>Liegt über der Taste, ob sie pulsiert oder nicht.</translation>
    </message>
    <message>
        <source>overlay</source>
        <translation>Auflage</translation>
    </message>
    <message>
        <source>badge</source>
        <translation>Plakette</translation>
    </message>
    <message>
        <source>busy</source>
        <translation>beschäftigt</translation>
    </message>
    <message>
        <source>shadow</source>
        <translation>Schatten</translation>
    </message>
</context>
<context>
    <name>gallery::FramesPage</name>
    <message>
        <source>The picture: %1 × %1 pixels, cut %2 pixels from each side</source>
        <translation>Das Bild: %1 × %1 Pixel, %2 Pixel von jeder Seite geschnitten</translation>
    </message>
    <message>
        <source>Stretch the centre</source>
        <translation>Mitte strecken</translation>
    </message>
    <message>
        <source>The border keeps its width.</source>
        <translation>Der Rand behält seine Breite.</translation>
    </message>
    <message>
        <source>Tile the centre</source>
        <translation>Mitte kacheln</translation>
    </message>
    <message>
        <source>Stretch the border</source>
        <translation>Rand strecken</translation>
    </message>
    <message>
        <source>The centre keeps its size.</source>
        <translation>Die Mitte behält ihre Größe.</translation>
    </message>
    <message>
        <source>Tile the border</source>
        <translation>Rand kacheln</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Deckkraft</translation>
    </message>
</context>
<context>
    <name>gallery::GalleryWindow</name>
    <message>
        <source>Zelkov Gallery</source>
        <translation>Zelkov-Galerie</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Hell</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Dunkel</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Keines</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Thema</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Another scale starts the gallery anew.</source>
        <translation>Ein anderer Maßstab startet die Galerie neu.</translation>
    </message>
    <message>
        <source>Scale</source>
        <translation>Maßstab</translation>
    </message>
    <message>
        <source>Signals</source>
        <translation>Signale</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtern</translation>
    </message>
    <message>
        <source>Fold repetitions</source>
        <translation>Wiederholungen zusammenfassen</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Leeren</translation>
    </message>
</context>
<context>
    <name>gallery::GesturePad</name>
    <message>
        <source>Click, hold, drag or flick here</source>
        <translation>Hier klicken, halten, ziehen oder wischen</translation>
    </message>
</context>
<context>
    <name>gallery::LabelsPage</name>
    <message>
        <source>Texts</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Drag the bar between the two sides.</source>
        <translation>Ziehen Sie den Balken zwischen den beiden Seiten.</translation>
    </message>
    <message>
        <source>The camera in the main entrance of building 4 does not answer any more</source>
        <translation>Die Kamera am Haupteingang von Gebäude 4 antwortet nicht mehr</translation>
    </message>
    <message>
        <source>Cut at the end</source>
        <translation>Am Ende gekürzt</translation>
    </message>
    <message>
        <source>In the middle</source>
        <translation>In der Mitte</translation>
    </message>
    <message>
        <source>At the start</source>
        <translation>Am Anfang</translation>
    </message>
    <message>
        <source>Word wrap</source>
        <translation>Zeilenumbruch</translation>
    </message>
    <message>
        <source>Connect the camera in the main entrance of building 4</source>
        <translation>Die Kamera am Haupteingang von Gebäude 4 verbinden</translation>
    </message>
    <message>
        <source>Button</source>
        <translation>Knopf</translation>
    </message>
    <message>
        <source>The text itself stays whole, in tool tips and for the program: %1</source>
        <translation>Der Text selbst bleibt ganz, für das Programm und für Tipps: %1</translation>
    </message>
    <message>
        <source>Pictures</source>
        <translation>Bilder</translation>
    </message>
    <message>
        <source>Keep the proportions</source>
        <translation>Proportionen behalten</translation>
    </message>
    <message>
        <source>Wrapped, with one word too long: site_west_building_4_main_entrance_camera_17_2026_04_01.mkv</source>
        <translation>Umbrochen, mit einem zu langen Wort: standort_west_gebaeude_4_haupteingang_kamera_17_2026_04_01.mkv</translation>
    </message>
</context>
<context>
    <name>gallery::MouseGesturesPage</name>
    <message>
        <source>Pressed</source>
        <translation>Gedrückt</translation>
    </message>
    <message>
        <source>Panning</source>
        <translation>Wird geschoben</translation>
    </message>
    <message>
        <source>Released</source>
        <translation>Losgelassen</translation>
    </message>
    <message>
        <source>Long press</source>
        <translation>Langes Drücken</translation>
    </message>
    <message>
        <source>Click</source>
        <translation>Klick</translation>
    </message>
    <message>
        <source>Double click</source>
        <translation>Doppelklick</translation>
    </message>
    <message>
        <source>Long click</source>
        <translation>Langer Klick</translation>
    </message>
    <message>
        <source>Auto click</source>
        <translation>Automatischer Klick</translation>
    </message>
    <message>
        <source>Swipe to the left</source>
        <translation>Wischen nach links</translation>
    </message>
    <message>
        <source>Swipe to the right</source>
        <translation>Wischen nach rechts</translation>
    </message>
    <message>
        <source>Swipe up</source>
        <translation>Wischen nach oben</translation>
    </message>
    <message>
        <source>Swipe down</source>
        <translation>Wischen nach unten</translation>
    </message>
    <message>
        <source>Pan to the left</source>
        <translation>Schieben nach links</translation>
    </message>
    <message>
        <source>Pan to the right</source>
        <translation>Schieben nach rechts</translation>
    </message>
    <message>
        <source>Pan up</source>
        <translation>Schieben nach oben</translation>
    </message>
    <message>
        <source>Pan down</source>
        <translation>Schieben nach unten</translation>
    </message>
    <message>
        <source>off</source>
        <translation>aus</translation>
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
        <translation>Doppelklickzeit</translation>
    </message>
    <message>
        <source>Long click interval</source>
        <translation>Zeit für langen Klick</translation>
    </message>
    <message>
        <source>Auto click interval</source>
        <translation>Abstand automatischer Klicks</translation>
    </message>
    <message>
        <source>Swipe interval</source>
        <translation>Wischzeit</translation>
    </message>
    <message>
        <source>Click radius</source>
        <translation>Klickradius</translation>
    </message>
    <message>
        <source>Double click radius</source>
        <translation>Doppelklickradius</translation>
    </message>
    <message>
        <source>Report hovering</source>
        <translation>Überfahren melden</translation>
    </message>
    <message>
        <source>Signals entered, moved and left, also without a button held</source>
        <translation>Signale entered, moved und left, auch ohne gedrückte Taste</translation>
    </message>
    <message>
        <source>Settings of the pad</source>
        <translation>Einstellungen der Fläche</translation>
    </message>
</context>
<context>
    <name>gallery::OverlaysPage</name>
    <message>
        <source>Connection</source>
        <translation>Verbindung</translation>
    </message>
    <message>
        <source>Cut the line</source>
        <translation>Leitung trennen</translation>
    </message>
    <message>
        <source>Count the seconds</source>
        <translation>Sekunden zählen</translation>
    </message>
    <message>
        <source>Another text, %1 is the time</source>
        <translation>Anderer Text, %1 ist die Zeit</translation>
    </message>
    <message>
        <source>The spinner comes a second later: a short loss shows nothing.</source>
        <translation>Das Drehzeichen kommt eine Sekunde später: Ein kurzer Ausfall zeigt nichts.</translation>
    </message>
    <message>
        <source>Signs</source>
        <translation>Zeichen</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Wiedergabe</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Start of the recording</source>
        <translation>Anfang der Aufnahme</translation>
    </message>
    <message>
        <source>Icon and text</source>
        <translation>Symbol und Text</translation>
    </message>
    <message>
        <source>Picture saved</source>
        <translation>Bild gespeichert</translation>
    </message>
</context>
<context>
    <name>gallery::PageList</name>
    <message>
        <source>Cameras</source>
        <translation>Kameras</translation>
    </message>
    <message>
        <source>Camera wall</source>
        <translation>Kamerawand</translation>
    </message>
    <message>
        <source>Click selects a camera, double click enlarges it, a long press cuts its line, a slow drag looks around, a swipe turns to the next wall.</source>
        <translation>Ein Klick wählt eine Kamera, ein Doppelklick vergrößert sie, langes Drücken kappt ihre Leitung, langsames Ziehen schaut umher, Wischen blättert zur nächsten Wand.</translation>
    </message>
    <message>
        <source>Input</source>
        <translation>Eingabe</translation>
    </message>
    <message>
        <source>Mouse gestures</source>
        <translation>Mausgesten</translation>
    </message>
    <message>
        <source>Indicators</source>
        <translation>Anzeigen</translation>
    </message>
    <message>
        <source>Badges and spinners</source>
        <translation>Plaketten und Wartezeichen</translation>
    </message>
    <message>
        <source>BadgeWidget shows a short text in a pill or a busy mark; BadgeDrawer paints the same into any widget.</source>
        <translation>BadgeWidget zeigt einen kurzen Text in einer Plakette oder ein Wartezeichen; BadgeDrawer malt dasselbe in jedes Widget.</translation>
    </message>
    <message>
        <source>MouseAdapter turns raw mouse events into clicks, long presses, pans and swipes. Try the pad, and drag or flick the picture below it.</source>
        <translation>MouseAdapter macht aus rohen Mausereignissen Klicks, langes Drücken, Schieben und Wischen. Die Fläche lädt zum Ausprobieren ein; das Bild darunter lässt sich ziehen und anstoßen.</translation>
    </message>
    <message>
        <source>Sliders</source>
        <translation>Schieberegler</translation>
    </message>
    <message>
        <source>Scroll bars</source>
        <translation>Bildlaufleisten</translation>
    </message>
    <message>
        <source>NicerScrollBar floats over the content of a scroll area and fades; JumpSlider follows a click on its groove at once.</source>
        <translation>NicerScrollBar schwebt über dem Inhalt eines Bildlaufbereichs und verblasst; JumpSlider folgt einem Klick auf seine Rille sofort.</translation>
    </message>
    <message>
        <source>Foundation</source>
        <translation>Grundlagen</translation>
    </message>
    <message>
        <source>Fades and pulses</source>
        <translation>Blenden und Pulsieren</translation>
    </message>
    <message>
        <source>FadableThing fades as a whole, and one fade can take over from the other at any moment. TFadingWidget is a button that pulses to catch the eye.</source>
        <translation>FadableThing blendet als Ganzes, und eine Blende kann die andere jederzeit ablösen. TFadingWidget ist eine Taste, die pulsiert, um aufzufallen.</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modelle</translation>
    </message>
    <message>
        <source>Device browser</source>
        <translation>Gerätesuche</translation>
    </message>
    <message>
        <source>MultiFilterModel searches 10,000 devices while you type; FlexibleTableModel and TableViewDelegate show them as a wall whose columns follow the width.</source>
        <translation>MultiFilterModel durchsucht 10.000 Geräte während der Eingabe; FlexibleTableModel und TableViewDelegate zeigen sie als Wand, deren Spalten der Breite folgen.</translation>
    </message>
    <message>
        <source>Click variants</source>
        <translation>Klickarten</translation>
    </message>
    <message>
        <source>Labels</source>
        <translation>Beschriftungen</translation>
    </message>
    <message>
        <source>ElidedLabel and ElidedButton shorten their text to the room they have; Label covers itself with a picture that keeps its proportions.</source>
        <translation>ElidedLabel und ElidedButton kürzen ihren Text auf den vorhandenen Platz; Label füllt sich mit einem Bild, das seine Proportionen behält.</translation>
    </message>
    <message>
        <source>TCustomClickWidget tells short, long and context clicks apart and asks for rights; CustomContextClickToolButton adds an arrow.</source>
        <translation>TCustomClickWidget unterscheidet kurze, lange und Kontextklicks und fragt nach Rechten; CustomContextClickToolButton hat dazu einen Pfeil.</translation>
    </message>
    <message>
        <source>Popovers</source>
        <translation>Popover</translation>
    </message>
    <message>
        <source>A popover points at what it belongs to, keeps inside the window and closes with a click beside it. Click a number.</source>
        <translation>Ein Popover zeigt auf das, wozu es gehört, bleibt im Fenster und schließt sich bei einem Klick daneben. Klicken Sie auf eine Zahl.</translation>
    </message>
    <message>
        <source>Time line</source>
        <translation>Zeitleiste</translation>
    </message>
    <message>
        <source>MultiNubsieSlider has any number of handles on one scale, kept apart only as far as needed. Drag them, double-click them, click the flags.</source>
        <translation>MultiNubsieSlider hat beliebig viele Griffe auf einer Skala, die nur so weit wie nötig auseinanderrücken. Ziehen Sie sie, doppelklicken Sie darauf, klicken Sie auf die Fahnen.</translation>
    </message>
    <message>
        <source>Views</source>
        <translation>Ansichten</translation>
    </message>
    <message>
        <source>Panels</source>
        <translation>Schiebeflächen</translation>
    </message>
    <message>
        <source>Pages and slideshow</source>
        <translation>Seiten und Diaschau</translation>
    </message>
    <message>
        <source>NavigationViewController slides from page to page and tells each of its coming and going; WidgetSlideshow moves on by itself.</source>
        <translation>NavigationViewController schiebt von Seite zu Seite und meldet jeder ihr Kommen und Gehen; WidgetSlideshow läuft von selbst weiter.</translation>
    </message>
    <message>
        <source>Zoom area</source>
        <translation>Zoombereich</translation>
    </message>
    <message>
        <source>ZoomScrollArea turns the wheel into a steady stream of zoom factors instead of scrolling.</source>
        <translation>ZoomScrollArea macht aus dem Mausrad einen stetigen Strom von Zoomfaktoren, statt zu rollen.</translation>
    </message>
    <message>
        <source>Rubber band</source>
        <translation>Gummiband</translation>
    </message>
    <message>
        <source>RubberBandWidget marks a region of a picture in the picture&apos;s own units: move it, resize it, turn it over.</source>
        <translation>RubberBandWidget markiert einen Bereich eines Bildes in dessen eigenen Einheiten: verschieben, vergrößern, umklappen.</translation>
    </message>
    <message>
        <source>Tool bar customising</source>
        <translation>Symbolleisten anpassen</translation>
    </message>
    <message>
        <source>CustomToolBar reports which action was dropped where, and which one is to go.</source>
        <translation>CustomToolBar meldet, welche Aktion wo abgelegt wurde und welche entfernt werden soll.</translation>
    </message>
    <message>
        <source>FadeView is a strip at the edge of a view that slides open and can take the full height; FadeStripeView adds a handle, a time line and rows of contents.</source>
        <translation>FadeView ist ein Streifen am Rand einer Ansicht, der sich aufschiebt und die volle Höhe einnehmen kann; FadeStripeView fügt einen Griff, eine Zeitleiste und Zeilen hinzu.</translation>
    </message>
    <message>
        <source>Overlays</source>
        <translation>Einblendungen</translation>
    </message>
    <message>
        <source>BusyOverlayView tells that a connection has gone and for how long; IconOverlayView shows a sign for a moment and deletes itself.</source>
        <translation>BusyOverlayView meldet, dass eine Verbindung weg ist und wie lange; IconOverlayView zeigt kurz ein Zeichen und löscht sich selbst.</translation>
    </message>
    <message>
        <source>Time labels</source>
        <translation>Zeitanzeigen</translation>
    </message>
    <message>
        <source>TimeLabel shows the time of a picture and lets it be edited; NameTimeLabel drops what has no room.</source>
        <translation>TimeLabel zeigt die Zeit eines Bildes und lässt sie ändern; NameTimeLabel lässt weg, was keinen Platz hat.</translation>
    </message>
    <message>
        <source>Frames</source>
        <translation>Rahmen</translation>
    </message>
    <message>
        <source>BorderIcon cuts a small picture into nine parts and fills any rectangle with it.</source>
        <translation>BorderIcon schneidet ein kleines Bild in neun Teile und füllt damit jedes Rechteck.</translation>
    </message>
    <message>
        <source>Controls</source>
        <translation>Bedienelemente</translation>
    </message>
    <message>
        <source>Edits</source>
        <translation>Eingabefelder</translation>
    </message>
    <message>
        <source>Fields for search words, folders and times, and a combo box that leaves the wheel to the form around it.</source>
        <translation>Felder für Suchwörter, Ordner und Zeiten, und eine Auswahl, die das Mausrad dem Formular überlässt.</translation>
    </message>
    <message>
        <source>Counting lines</source>
        <translation>Zähllinien</translation>
    </message>
    <message>
        <source>VxCountingLinesGroupBox edits a line across the picture; whoever crosses it is counted.</source>
        <translation>VxCountingLinesGroupBox bearbeitet eine Linie im Bild; wer sie überquert, wird gezählt.</translation>
    </message>
    <message>
        <source>Password form</source>
        <translation>Passwortformular</translation>
    </message>
    <message>
        <source>PasswordCheckWidget checks a new password while it is typed; the theme colours the fields by its verdict.</source>
        <translation>PasswordCheckWidget prüft ein neues Passwort beim Tippen; das Thema färbt die Felder nach seinem Urteil.</translation>
    </message>
    <message>
        <source>Dial and joystick</source>
        <translation>Drehknopf und Joystick</translation>
    </message>
    <message>
        <source>DialButton is dragged sideways and can spring back; JoystickViewWidget shows where a stick stands.</source>
        <translation>DialButton wird seitwärts gezogen und kann zurückspringen; JoystickViewWidget zeigt, wo ein Knüppel steht.</translation>
    </message>
    <message>
        <source>Phone-style list</source>
        <translation>Liste wie am Telefon</translation>
    </message>
    <message>
        <source>iOSListWidget has rows that can be edited, deleted and put in another order.</source>
        <translation>iOSListWidget hat Zeilen, die sich bearbeiten, löschen und umordnen lassen.</translation>
    </message>
    <message>
        <source>Popover rows</source>
        <translation>Zeilen von Popovern</translation>
    </message>
    <message>
        <source>Every row that a popover can hold: texts, choices, values and submenus. What is performed stands in the log, with its value and flags.</source>
        <translation>Jede Zeile, die ein Popover enthalten kann: Texte, Auswahl, Werte und Untermenüs. Was ausgeführt wird, steht mit Wert und Flags im Protokoll.</translation>
    </message>
    <message>
        <source>Camera client</source>
        <translation>Kamera-Client</translation>
    </message>
    <message>
        <source>A whole client made of the library. Log in as user with camera1!, or as admin with camera2!, who may export, steer and edit.</source>
        <translation>Ein ganzer Client aus der Bibliothek. Anmelden als user mit camera1! oder als admin mit camera2!, der exportieren, steuern und ändern darf.</translation>
    </message>
</context>
<context>
    <name>gallery::PagesPage</name>
    <message>
        <source>Camera</source>
        <translation>Kamera</translation>
    </message>
    <message>
        <source>What the new camera is called and where it hangs.</source>
        <translation>Wie die neue Kamera heißt und wo sie hängt.</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>North gate</source>
        <translation>Nordtor</translation>
    </message>
    <message>
        <source>Building</source>
        <translation>Gebäude</translation>
    </message>
    <message>
        <source>Yard</source>
        <translation>Hof</translation>
    </message>
    <message>
        <source>Network</source>
        <translation>Netzwerk</translation>
    </message>
    <message>
        <source>Where the camera is reached. The port is rarely another one.</source>
        <translation>Wo die Kamera erreichbar ist. Der Port ist selten ein anderer.</translation>
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
        <translation>Aufzeichnung</translation>
    </message>
    <message>
        <source>How long pictures are kept, and how many a second.</source>
        <translation>Wie lange Bilder aufbewahrt werden und wie viele je Sekunde.</translation>
    </message>
    <message>
        <source>Days</source>
        <translation>Tage</translation>
    </message>
    <message>
        <source>Pictures</source>
        <translation>Bilder</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Weiter</translation>
    </message>
    <message>
        <source>Main street</source>
        <translation>Hauptstraße</translation>
    </message>
    <message>
        <source>Reception</source>
        <translation>Empfang</translation>
    </message>
    <message>
        <source>Container yard</source>
        <translation>Containerhof</translation>
    </message>
    <message>
        <source>Slideshow</source>
        <translation>Diaschau</translation>
    </message>
    <message>
        <source>The next camera every five seconds</source>
        <translation>Alle fünf Sekunden die nächste Kamera</translation>
    </message>
    <message>
        <source>Step %1 of %2</source>
        <translation>Schritt %1 von %2</translation>
    </message>
</context>
<context>
    <name>gallery::PanelsPage</name>
    <message>
        <source>North gate</source>
        <translation>Nordtor</translation>
    </message>
    <message>
        <source>Latest events</source>
        <translation>Letzte Ereignisse</translation>
    </message>
    <message>
        <source>Upper panel</source>
        <translation>Obere Fläche</translation>
    </message>
    <message>
        <source>Lower panel</source>
        <translation>Untere Fläche</translation>
    </message>
    <message>
        <source>Full height</source>
        <translation>Volle Höhe</translation>
    </message>
    <message>
        <source>Start at the edge</source>
        <translation>Am Rand beginnen</translation>
    </message>
    <message>
        <source>fadein() and fadeout() with force: not from where the panel is</source>
        <translation>fadein() und fadeout() mit force: nicht von da, wo die Fläche steht</translation>
    </message>
    <message>
        <source>Click the handles, also while a panel moves; drag the lower one.</source>
        <translation>Klicken Sie auf die Griffe, auch während der Bewegung; den unteren können Sie ziehen.</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Zeit</translation>
    </message>
</context>
<context>
    <name>gallery::PasswordPage</name>
    <message>
        <source>New password</source>
        <translation>Neues Passwort</translation>
    </message>
    <message>
        <source>Once more</source>
        <translation>Noch einmal</translation>
    </message>
    <message>
        <source>Password of the camera</source>
        <translation>Passwort der Kamera</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Start again</source>
        <translation>Von vorn</translation>
    </message>
    <message>
        <source>What is asked of it</source>
        <translation>Was verlangt wird</translation>
    </message>
    <message>
        <source>%1 characters or more</source>
        <translation>%1 Zeichen oder mehr</translation>
    </message>
    <message>
        <source>A small and a capital letter</source>
        <translation>Ein kleiner und ein großer Buchstabe</translation>
    </message>
    <message>
        <source>A digit and a letter</source>
        <translation>Eine Ziffer und ein Buchstabe</translation>
    </message>
    <message>
        <source>A special character</source>
        <translation>Ein Sonderzeichen</translation>
    </message>
    <message>
        <source>Not used before (Camera_2025 was)</source>
        <translation>Nicht schon benutzt (Camera_2025 war es)</translation>
    </message>
    <message>
        <source>The same both times</source>
        <translation>Beide Male dasselbe</translation>
    </message>
</context>
<context>
    <name>gallery::PhoneListPage</name>
    <message>
        <source>Gate west</source>
        <translation>Tor West</translation>
    </message>
    <message>
        <source>Yard north</source>
        <translation>Hof Nord</translation>
    </message>
    <message>
        <source>Entrance hall</source>
        <translation>Eingangshalle</translation>
    </message>
    <message>
        <source>Ramp</source>
        <translation>Rampe</translation>
    </message>
    <message>
        <source>Stairs</source>
        <translation>Treppe</translation>
    </message>
    <message>
        <source>Roof</source>
        <translation>Dach</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>getrennt</translation>
    </message>
    <message>
        <source>online</source>
        <translation>verbunden</translation>
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
        <source>Add a camera</source>
        <translation>Kamera hinzufügen</translation>
    </message>
    <message>
        <source>Camera %1</source>
        <translation>Kamera %1</translation>
    </message>
    <message>
        <source>Keep the last one</source>
        <translation>Die letzte behalten</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>Geräte</translation>
    </message>
    <message>
        <source>While you edit: the red sign brings out a button that deletes the row, a row is dragged to another place, and its name can be changed.</source>
        <translation>Beim Bearbeiten: Das rote Zeichen bringt einen Knopf hervor, der die Zeile löscht, eine Zeile lässt sich an eine andere Stelle ziehen, und ihr Name ist änderbar.</translation>
    </message>
</context>
<context>
    <name>gallery::PopoverRowsPage</name>
    <message>
        <source>Texts</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Choices</source>
        <translation>Auswahl</translation>
    </message>
    <message>
        <source>Values</source>
        <translation>Werte</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>I am an administrator</source>
        <translation>Ich bin Administrator</translation>
    </message>
    <message>
        <source>Rows are busy</source>
        <translation>Zeilen sind beschäftigt</translation>
    </message>
    <message>
        <source>A right click on a row with a value offers to set it back.</source>
        <translation>Ein Rechtsklick auf eine Zeile mit einem Wert bietet an, ihn zurückzusetzen.</translation>
    </message>
    <message>
        <source>Brightness</source>
        <translation>Helligkeit</translation>
    </message>
    <message>
        <source>Set back</source>
        <translation>Zurücksetzen</translation>
    </message>
    <message>
        <source>Search cameras</source>
        <translation>Kameras suchen</translation>
    </message>
    <message>
        <source>Text over as many lines as it takes, with &lt;a href=&quot;https://www.qt.io&quot;&gt;links&lt;/a&gt;.</source>
        <translation>Text über so viele Zeilen wie nötig, mit &lt;a href=&quot;https://www.qt.io&quot;&gt;Verweisen&lt;/a&gt;.</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Gate</source>
        <translation>Tor</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Gruppe</translation>
    </message>
    <message>
        <source>All groups</source>
        <translation>Alle Gruppen</translation>
    </message>
    <message>
        <source>Car park</source>
        <translation>Parkplatz</translation>
    </message>
    <message>
        <source>Place</source>
        <translation>Ort</translation>
    </message>
    <message>
        <source>several values</source>
        <translation>mehrere Werte</translation>
    </message>
    <message>
        <source>Take a picture</source>
        <translation>Bild aufnehmen</translation>
    </message>
    <message>
        <source>Ctrl+P</source>
        <translation>Strg+P</translation>
    </message>
    <message>
        <source>Click or double click</source>
        <translation>Klick oder Doppelklick</translation>
    </message>
    <message>
        <source>Recording</source>
        <translation>Aufzeichnung</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Ton</translation>
    </message>
    <message>
        <source>Events of all inputs</source>
        <translation>Ereignisse aller Eingänge</translation>
    </message>
    <message>
        <source>Stream</source>
        <translation>Strom</translation>
    </message>
    <message>
        <source>High</source>
        <translation>Hoch</translation>
    </message>
    <message>
        <source>Medium</source>
        <translation>Mittel</translation>
    </message>
    <message>
        <source>Low</source>
        <translation>Niedrig</translation>
    </message>
    <message>
        <source>Lamp</source>
        <translation>Lampe</translation>
    </message>
    <message>
        <source>level %1</source>
        <translation>Stufe %1</translation>
    </message>
    <message>
        <source>Always</source>
        <translation>Immer</translation>
    </message>
    <message>
        <source>On motion</source>
        <translation>Bei Bewegung</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Nie</translation>
    </message>
    <message>
        <source>Frames a second</source>
        <translation>Bilder pro Sekunde</translation>
    </message>
    <message>
        <source>From</source>
        <translation>Von</translation>
    </message>
    <message>
        <source>Every</source>
        <translation>Alle</translation>
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
        <translation>MB</translation>
    </message>
    <message>
        <source>Quality</source>
        <translation>Qualität</translation>
    </message>
    <message>
        <source>Storage</source>
        <translation>Speicher</translation>
    </message>
    <message>
        <source>Overwrite old recordings</source>
        <translation>Alte Aufzeichnungen überschreiben</translation>
    </message>
    <message>
        <source>Days to keep</source>
        <translation>Tage Vorhaltezeit</translation>
    </message>
    <message>
        <source>Show the time</source>
        <translation>Zeit anzeigen</translation>
    </message>
    <message>
        <source>GB</source>
        <translation>GB</translation>
    </message>
</context>
<context>
    <name>gallery::PopoversPage</name>
    <message>
        <source>Camera %1</source>
        <translation>Kamera %1</translation>
    </message>
    <message>
        <source>offline</source>
        <translation>offline</translation>
    </message>
    <message>
        <source>live</source>
        <translation>live</translation>
    </message>
    <message>
        <source>Sides of the arrow</source>
        <translation>Seiten des Pfeils</translation>
    </message>
    <message>
        <source>Top: below the target</source>
        <translation>Oben: unter dem Ziel</translation>
    </message>
    <message>
        <source>Bottom: above the target</source>
        <translation>Unten: über dem Ziel</translation>
    </message>
    <message>
        <source>Left: right of the target</source>
        <translation>Links: rechts vom Ziel</translation>
    </message>
    <message>
        <source>Right: left of the target</source>
        <translation>Rechts: links vom Ziel</translation>
    </message>
    <message>
        <source>Features</source>
        <translation>Merkmale</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Titel</translation>
    </message>
    <message>
        <source>Close button</source>
        <translation>Schließen-Knopf</translation>
    </message>
    <message>
        <source>Help button</source>
        <translation>Hilfe-Knopf</translation>
    </message>
    <message>
        <source>No title bar</source>
        <translation>Keine Titelleiste</translation>
    </message>
    <message>
        <source>%1 rows</source>
        <translation>%1 Zeilen</translation>
    </message>
    <message>
        <source>Grow from the middle</source>
        <translation>Aus der Mitte wachsen</translation>
    </message>
    <message>
        <source>Modal</source>
        <translation>Modal</translation>
    </message>
    <message>
        <source>Ask</source>
        <translation>Fragen</translation>
    </message>
    <message>
        <source>No answer yet</source>
        <translation>Noch keine Antwort</translation>
    </message>
    <message>
        <source>Drag help</source>
        <translation>Hilfe beim Ziehen</translation>
    </message>
    <message>
        <source>Drag a camera: the popover that takes it comes up.</source>
        <translation>Ziehen Sie eine Kamera: Das Popover, das sie annimmt, erscheint.</translation>
    </message>
    <message>
        <source>Nothing dropped yet</source>
        <translation>Noch nichts abgelegt</translation>
    </message>
    <message>
        <source>Cameras</source>
        <translation>Kameras</translation>
    </message>
    <message>
        <source>Delete the recording?</source>
        <translation>Aufnahme löschen?</translation>
    </message>
    <message>
        <source>Camera 3, today from 10:00 to 10:45</source>
        <translation>Kamera 3, heute von 10:00 bis 10:45</translation>
    </message>
    <message>
        <source>Accepted: 1</source>
        <translation>Angenommen: 1</translation>
    </message>
    <message>
        <source>Rejected: 0</source>
        <translation>Abgelehnt: 0</translation>
    </message>
    <message>
        <source>Favourites</source>
        <translation>Favoriten</translation>
    </message>
    <message>
        <source>Drop it here</source>
        <translation>Hier ablegen</translation>
    </message>
    <message>
        <source>Dropped: %1</source>
        <translation>Abgelegt: %1</translation>
    </message>
</context>
<context>
    <name>gallery::PtzPage</name>
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
        <source>Camera</source>
        <translation>Kamera</translation>
    </message>
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
        <source>Drag a dial sideways. Pan and tilt spring back, zoom stays.</source>
        <translation>Einen Knopf seitwärts ziehen. Schwenken und Neigen springen zurück, Zoom bleibt.</translation>
    </message>
</context>
<context>
    <name>gallery::RubberBandPage</name>
    <message>
        <source>Container yard</source>
        <translation>Containerhof</translation>
    </message>
    <message>
        <source>Gate</source>
        <translation>Tor</translation>
    </message>
    <message>
        <source>Crane</source>
        <translation>Kran</translation>
    </message>
    <message>
        <source>Left</source>
        <translation>Links</translation>
    </message>
    <message>
        <source>Top</source>
        <translation>Oben</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Breite</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Höhe</translation>
    </message>
    <message>
        <source>Keep 16 : 9</source>
        <translation>16 : 9 beibehalten</translation>
    </message>
    <message>
        <source>New region</source>
        <translation>Neuer Bereich</translation>
    </message>
    <message>
        <source>Drag edges, corners or the inside. Shift keeps the proportions.</source>
        <translation>Ziehen Sie an Kanten, Ecken oder innen. Umschalt hält die Proportionen.</translation>
    </message>
    <message>
        <source>Pixels of the camera</source>
        <translation>Pixel der Kamera</translation>
    </message>
    <message>
        <source>Region %1</source>
        <translation>Bereich %1</translation>
    </message>
</context>
<context>
    <name>gallery::ScrollBarsPage</name>
    <message>
        <source>Plain bars</source>
        <translation>Gewöhnliche Leisten</translation>
    </message>
    <message>
        <source>They take room from the content.</source>
        <translation>Sie nehmen dem Inhalt Platz weg.</translation>
    </message>
    <message>
        <source>Overlay bars</source>
        <translation>Schwebende Leisten</translation>
    </message>
    <message>
        <source>They float over it, and fade.</source>
        <translation>Sie schweben darüber und verblassen.</translation>
    </message>
    <message>
        <source>Top and left</source>
        <translation>Oben und links</translation>
    </message>
    <message>
        <source>The same on the other edges.</source>
        <translation>Dasselbe an den anderen Rändern.</translation>
    </message>
    <message>
        <source>A click on the groove</source>
        <translation>Ein Klick auf die Rille</translation>
    </message>
    <message>
        <source>pages</source>
        <translation>blättert</translation>
    </message>
    <message>
        <source>jumps</source>
        <translation>springt</translation>
    </message>
    <message>
        <source>Shown as needed</source>
        <translation>Bei Bedarf zeigen</translation>
    </message>
    <message>
        <source>Always shown</source>
        <translation>Immer zeigen</translation>
    </message>
    <message>
        <source>Never shown</source>
        <translation>Nie zeigen</translation>
    </message>
    <message>
        <source>Fade after a while</source>
        <translation>Nach einer Weile verblassen</translation>
    </message>
</context>
<context>
    <name>gallery::SignalLog</name>
    <message>
        <source>Time</source>
        <translation>Zeit</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>Signal</source>
        <translation>Signal</translation>
    </message>
    <message>
        <source>Arguments</source>
        <translation>Argumente</translation>
    </message>
</context>
<context>
    <name>gallery::TimeLabelsPage</name>
    <message>
        <source>Time of the picture</source>
        <translation>Zeit des Bildes</translation>
    </message>
    <message>
        <source>Can be edited</source>
        <translation>Kann geändert werden</translation>
    </message>
    <message>
        <source>Comes from the file server</source>
        <translation>Kommt vom Dateiserver</translation>
    </message>
    <message>
        <source>Something is wrong</source>
        <translation>Etwas stimmt nicht</translation>
    </message>
    <message>
        <source>Count from here</source>
        <translation>Von hier an zählen</translation>
    </message>
    <message>
        <source>Drag the label by its symbol; a double click puts it back.</source>
        <translation>Die Anzeige am Symbol ziehen; ein Doppelklick bringt sie zurück.</translation>
    </message>
    <message>
        <source>Name, date and time in the room there is</source>
        <translation>Name, Datum und Zeit im Platz, den es gibt</translation>
    </message>
    <message>
        <source>The clock of the device is two minutes late</source>
        <translation>Die Uhr des Geräts geht zwei Minuten nach</translation>
    </message>
    <message>
        <source>Loading bay west</source>
        <translation>Laderampe West</translation>
    </message>
    <message>
        <source>A click on the narrowest line turns it over.</source>
        <translation>Ein Klick auf die schmalste Zeile wendet sie.</translation>
    </message>
</context>
<context>
    <name>gallery::TimeLinePage</name>
    <message>
        <source>Drag the blue handle through the day. The farther you pull away from the bar, the slower it goes, down to single seconds. The flags go with the ends of the range.</source>
        <translation>Ziehen Sie den blauen Griff durch den Tag. Je weiter Sie sich von der Leiste entfernen, desto langsamer läuft er, bis hinab zu einzelnen Sekunden. Die Fahnen gehen mit den Enden des Bereichs.</translation>
    </message>
    <message>
        <source>A day of recordings</source>
        <translation>Ein Tag Aufzeichnungen</translation>
    </message>
    <message>
        <source>Handles that share a scale</source>
        <translation>Griffe auf einer Skala</translation>
    </message>
    <message>
        <source>Close values are pushed apart. Take one out, and its neighbours drift home.</source>
        <translation>Nahe Werte rücken auseinander. Nimmt man einen heraus, gleiten die Nachbarn zurück.</translation>
    </message>
    <message>
        <source>Kinds of handles</source>
        <translation>Arten von Griffen</translation>
    </message>
    <message>
        <source>Five steps</source>
        <translation>Fünf Stufen</translation>
    </message>
    <message>
        <source>Spring</source>
        <translation>Feder</translation>
    </message>
    <message>
        <source>Inverted</source>
        <translation>Umgekehrt</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Zahlen</translation>
    </message>
    <message>
        <source>Fading</source>
        <translation>Verblassen</translation>
    </message>
    <message>
        <source>Jumping</source>
        <translation>Springen</translation>
    </message>
    <message>
        <source>Minimum and maximum while a handle is in use</source>
        <translation>Minimum und Maximum, solange ein Griff in Gebrauch ist</translation>
    </message>
    <message>
        <source>The bar fades when the pointer leaves</source>
        <translation>Die Leiste verblasst, wenn der Zeiger sie verlässt</translation>
    </message>
    <message>
        <source>A click on the track moves the only handle</source>
        <translation>Ein Klick auf die Leiste versetzt den einzigen Griff</translation>
    </message>
    <message>
        <source>Features</source>
        <translation>Merkmale</translation>
    </message>
    <message>
        <source>Start of the range to export</source>
        <translation>Anfang des Exportbereichs</translation>
    </message>
    <message>
        <source>End of the range to export</source>
        <translation>Ende des Exportbereichs</translation>
    </message>
    <message>
        <source>Moment that is shown</source>
        <translation>Gezeigter Zeitpunkt</translation>
    </message>
    <message>
        <source>To export: %1 to %2</source>
        <translation>Zu exportieren: %1 bis %2</translation>
    </message>
</context>
<context>
    <name>gallery::ToolBarPage</name>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Abspielen</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Vor</translation>
    </message>
    <message>
        <source>Record</source>
        <translation>Aufnehmen</translation>
    </message>
    <message>
        <source>Snapshot</source>
        <translation>Schnappschuss</translation>
    </message>
    <message>
        <source>Camera wall</source>
        <translation>Kamerawand</translation>
    </message>
    <message>
        <source>Flag</source>
        <translation>Markieren</translation>
    </message>
    <message>
        <source>Drag an action from the list onto a bar.</source>
        <translation>Ziehen Sie eine Aktion aus der Liste auf eine Leiste.</translation>
    </message>
    <message>
        <source>%1 before %2</source>
        <translation>%1 vor %2</translation>
    </message>
    <message>
        <source>%1 at the end</source>
        <translation>%1 am Ende</translation>
    </message>
    <message>
        <source>%1 removed</source>
        <translation>%1 entfernt</translation>
    </message>
    <message>
        <source>Bar dropped: %1</source>
        <translation>Leiste abgelegt: %1</translation>
    </message>
    <message>
        <source>Drag an action onto a bar; right click an action there to remove it. The bars can be dragged by their empty part.</source>
        <translation>Ziehen Sie eine Aktion auf eine Leiste; ein Rechtsklick dort entfernt sie. Die Leisten lassen sich an ihrem leeren Teil ziehen.</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Aktionen</translation>
    </message>
</context>
<context>
    <name>gallery::ZoomAreaPage</name>
    <message>
        <source>Original size</source>
        <translation>Originalgröße</translation>
    </message>
    <message>
        <source>Scroll bars</source>
        <translation>Rollbalken</translation>
    </message>
    <message>
        <source>Turn the wheel over the picture; scroll with the bars.</source>
        <translation>Drehen Sie das Rad über dem Bild; rollen Sie mit den Balken.</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
</context>
</TS>
