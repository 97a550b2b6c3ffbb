<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr" sourcelanguage="en">
<context>
    <name>CountingLinesGroupBox</name>
    <message>
        <source>Additional Parameters</source>
        <translation>Paramètres supplémentaires</translation>
    </message>
    <message>
        <source>Coordinates</source>
        <translation>Coordonnées</translation>
    </message>
    <message>
        <source>Counting Corridors</source>
        <translation>Couloirs de comptage</translation>
    </message>
    <message>
        <source>East</source>
        <translation>Est</translation>
    </message>
    <message>
        <source>End point:</source>
        <translation>Point de fin :</translation>
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
        <translation>Nom</translation>
    </message>
    <message>
        <source>Starting point:</source>
        <translation>Point de départ :</translation>
    </message>
    <message>
        <source>Title &quot;East&quot;</source>
        <translation>Titre &quot;Est&quot;</translation>
    </message>
    <message>
        <source>Title &quot;West&quot;</source>
        <translation>Titre &quot;Ouest&quot;</translation>
    </message>
    <message>
        <source>West</source>
        <translation>Ouest</translation>
    </message>
    <message>
        <source>x</source>
        <translation>x</translation>
    </message>
    <message>
        <source>y</source>
        <translation>y</translation>
    </message>
</context>
<context>
    <name>vx::BusyOverlayView</name>
    <message>
        <source>Connection lost since %1</source>
        <translation>Connexion perdue depuis %1</translation>
    </message>
</context>
<context>
    <name>vx::CustomToolBar</name>
    <message>
        <source>Customize Toolbar...</source>
        <translation>Personnaliser barre d&apos;outils...</translation>
    </message>
    <message>
        <source>Icons &amp; Text</source>
        <translation>Icônes &amp; textes</translation>
    </message>
    <message>
        <source>Icons Only</source>
        <translation>Icônes uniquement</translation>
    </message>
    <message>
        <source>Remove Item</source>
        <translation>Supprimer élément</translation>
    </message>
    <message>
        <source>Small Icons</source>
        <translation>Icônes petites</translation>
    </message>
    <message>
        <source>Text Only</source>
        <translation>Textes seulement</translation>
    </message>
</context>
<context>
    <name>vx::DateTimeDefaultEdit</name>
    <message>
        <source>Reset time</source>
        <translation>Réinitialiser temps</translation>
    </message>
</context>
<context>
    <name>vx::FilepathEdit</name>
    <message>
        <source>Choose Directory...</source>
        <translation>Sélectionner répertoire...</translation>
    </message>
</context>
<context>
    <name>vx::MultiNubsieSlider</name>
    <message>
        <source>Export range end marker</source>
        <translation>Curseur de fin de plage d&apos;exportation</translation>
    </message>
    <message>
        <source>Export range start marker</source>
        <translation>Curseur de début de plage d&apos;exportation</translation>
    </message>
    <message>
        <source>Time range to export</source>
        <translation>Plage horaire à exporter</translation>
    </message>
</context>
<context>
    <name>vx::PasswordCheckWidget</name>
    <message>
        <source>Confirm Password</source>
        <translation>Confirmer mot de passe</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Mot de passe</translation>
    </message>
    <message>
        <source>Retype Password</source>
        <translation>Retaper mot de passe</translation>
    </message>
    <message>
        <source>Type Password</source>
        <translation>Taper mot de passe</translation>
    </message>
</context>
<context>
    <name>vx::iOSListWidgetItem</name>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
</context>
</TS>
