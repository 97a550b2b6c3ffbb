<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>gallery::BadgesPage</name>
    <message>
        <source>Busy marks</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Arc</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Ring</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Dots</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Spokes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pills</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Plain</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Stroke</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Crossed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>new</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>In rows</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>live</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>off</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Searching for cameras</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unread alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Main street</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Car park</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export is running</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Alignment</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Try it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set the label</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set it crossed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Busy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not busy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No badge</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::CameraTile</name>
    <message>
        <source>No signal</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::CameraWallPage</name>
    <message>
        <source>Main street</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reception</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Container yard</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>North gate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Corridor 1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Loading dock</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Car park</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Staircase</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Rail siding</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>South gate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Canteen</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Warehouse</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Bus stop</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Corridor 2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Crane</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Ring road</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Workshop</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Quay</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Previous</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Next</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Wall %1 of %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 frames per second   Without signal: %2</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::GalleryWindow</name>
    <message>
        <source>Zelkov Gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Light</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Dark</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>None</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Theme</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Language</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Another scale starts the gallery anew.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Scale</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Signals</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Filter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Fold repetitions</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Clear</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::GesturePad</name>
    <message>
        <source>Click, hold, drag or flick here</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::MouseGesturesPage</name>
    <message>
        <source>Pressed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Panning</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Released</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Long press</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Click</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Double click</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Long click</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Auto click</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Swipe to the left</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Swipe to the right</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Swipe up</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Swipe down</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pan to the left</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pan to the right</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pan up</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pan down</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>off</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> ms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> px</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Double click interval</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Long click interval</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Auto click interval</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Swipe interval</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Click radius</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Double click radius</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Report hovering</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Signals entered, moved and left, also without a button held</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Settings of the pad</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::PageList</name>
    <message>
        <source>Cameras</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Camera wall</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Click selects a camera, double click enlarges it, a long press cuts its line, a slow drag looks around, a swipe turns to the next wall.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Input</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Mouse gestures</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>MouseAdapter turns raw mouse events into clicks, long presses, pans and swipes. Try the pad, and drag or flick the map below it.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Indicators</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Badges and spinners</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>BadgeWidget shows a short text in a pill or a busy mark; BadgeDrawer paints the same into any widget.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>gallery::SignalLog</name>
    <message>
        <source>Time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Signal</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Arguments</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
