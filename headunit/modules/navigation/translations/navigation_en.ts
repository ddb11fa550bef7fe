<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
<context>
    <name>DestinationsScreen</name>
    <message>
        <source>Destinations</source>
        <translation>Destinations</translation>
    </message>
</context>
<context>
    <name>GuidancePanel</name>
    <message>
        <source>Arrival %1</source>
        <translation>Arrival %1</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>Demonstration</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>Route</translation>
    </message>
    <message>
        <source>End</source>
        <translation>End</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>Set off</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>Go straight on</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>Bear left</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>Bear right</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>Turn left</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>Turn right</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>Turn sharp left</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>Turn sharp right</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>Turn round</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>You arrive</translation>
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
        <translation>Back to the vehicle</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Zoom in</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Zoom out</translation>
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
        <translation>Navigation settings</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>Avoid motorways</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>Show turns on other screens</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>The map does not have this place</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>There is no destination</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>All places</translation>
    </message>
    <message>
        <source>Work</source>
        <translation>Work</translation>
    </message>
    <message>
        <source>Fuel</source>
        <translation>Fuel</translation>
    </message>
    <message>
        <source>Charging</source>
        <translation>Charging</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>Parking</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>Eating</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>Sights</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>Health</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>Train and ferry</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>Home</translation>
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
        <translation>No destination</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>Where to?</translation>
    </message>
</context>
</TS>
