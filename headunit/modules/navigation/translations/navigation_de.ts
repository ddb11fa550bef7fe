<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>DestinationsScreen</name>
    <message>
        <source>Destinations</source>
        <translation>Ziele</translation>
    </message>
</context>
<context>
    <name>GuidancePanel</name>
    <message>
        <source>Arrival %1</source>
        <translation>Ankunft %1</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>Vorführung</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>Route</translation>
    </message>
    <message>
        <source>End</source>
        <translation>Beenden</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>Losfahren</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>Geradeaus fahren</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>Links halten</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>Rechts halten</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>Links abbiegen</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>Rechts abbiegen</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>Scharf links abbiegen</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>Scharf rechts abbiegen</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>Wenden</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>Ziel erreicht</translation>
    </message>
</context>
<context>
    <name>MapScreen</name>
    <message>
        <source>Navigation</source>
        <translation>Navigation</translation>
    </message>
    <message>
        <source>Back to the vehicle</source>
        <translation>Zurück zum Fahrzeug</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Vergrößern</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Verkleinern</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Navigation</source>
        <translation>Navigation</translation>
    </message>
</context>
<context>
    <name>NavigationSettings</name>
    <message>
        <source>Navigation</source>
        <translation>Navigation</translation>
    </message>
</context>
<context>
    <name>NavigationSettingsScreen</name>
    <message>
        <source>Navigation settings</source>
        <translation>Navigationseinstellungen</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>Autobahnen meiden</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>Abbiegehinweise überall zeigen</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>Die Karte hat diesen Ort nicht</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>Es gibt kein Ziel</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>Alle Orte</translation>
    </message>
    <message>
        <source>Work</source>
        <translation>Arbeit</translation>
    </message>
    <message>
        <source>Fuel</source>
        <translation>Tanken</translation>
    </message>
    <message>
        <source>Charging</source>
        <translation>Laden</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>Parken</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>Essen</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>Sehenswertes</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>Gesundheit</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>Bahn und Fähre</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>Zuhause</translation>
    </message>
</context>
<context>
    <name>RouteScreen</name>
    <message>
        <source>Route</source>
        <translation>Route</translation>
    </message>
    <message>
        <source>No destination</source>
        <translation>Kein Ziel</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>Wohin?</translation>
    </message>
</context>
</TS>
