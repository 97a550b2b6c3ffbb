<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>DefaultTimeProfiles.json</name>
    <message>
        <source>Weekend</source>
        <translation>Wochenende</translation>
    </message>
    <message>
        <source>Working Days</source>
        <translation>Arbeitstage</translation>
    </message>
</context>
</TS>
