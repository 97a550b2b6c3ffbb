<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr" sourcelanguage="en">
<context>
    <name>DefaultTimeProfiles.json</name>
    <message>
        <source>Weekend</source>
        <translation>Weekend</translation>
    </message>
    <message>
        <source>Working Days</source>
        <translation>Jours ouvrés</translation>
    </message>
</context>
</TS>
