<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
<context>
    <name>AirKeys</name>
    <message>
        <source>Windscreen</source>
        <translation>Windscreen</translation>
    </message>
    <message>
        <source>Face</source>
        <translation>Face</translation>
    </message>
    <message>
        <source>Feet</source>
        <translation>Feet</translation>
    </message>
</context>
<context>
    <name>Climate</name>
    <message>
        <source>This temperature cannot be set</source>
        <translation>This temperature cannot be set</translation>
    </message>
</context>
<context>
    <name>ClimateNotice</name>
    <message>
        <source>Climate</source>
        <translation>Climate</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperature</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Seat heating</translation>
    </message>
    <message>
        <source>Fan</source>
        <translation>Fan</translation>
    </message>
    <message>
        <source>Air direction</source>
        <translation>Air direction</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatic</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Cooling</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Recirculation</translation>
    </message>
    <message>
        <source>Windscreen</source>
        <translation>Windscreen</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Rear window</translation>
    </message>
    <message>
        <source>Both sides alike</source>
        <translation>Both sides alike</translation>
    </message>
    <message>
        <source>On</source>
        <translation>On</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Off</translation>
    </message>
</context>
<context>
    <name>ClimateScreen</name>
    <message>
        <source>Climate</source>
        <translation>Climate</translation>
    </message>
    <message>
        <source>Driver</source>
        <translation>Driver</translation>
    </message>
    <message>
        <source>Passenger</source>
        <translation>Passenger</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Off</translation>
    </message>
    <message>
        <source>Defrosting</source>
        <translation>Defrosting</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatic</translation>
    </message>
    <message>
        <source>By hand</source>
        <translation>By hand</translation>
    </message>
    <message>
        <source>On</source>
        <translation>On</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Cooling</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Recirculation</translation>
    </message>
    <message>
        <source>Defrost</source>
        <translation>Defrost</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Rear window</translation>
    </message>
    <message>
        <source>Both sides</source>
        <translation>Both sides</translation>
    </message>
</context>
<context>
    <name>ClimateZone</name>
    <message>
        <source>Warmer</source>
        <translation>Warmer</translation>
    </message>
    <message>
        <source>Cooler</source>
        <translation>Cooler</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Seat heating</translation>
    </message>
</context>
<context>
    <name>FanControl</name>
    <message>
        <source>Less air</source>
        <translation>Less air</translation>
    </message>
    <message>
        <source>More air</source>
        <translation>More air</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Climate</source>
        <translation>Climate</translation>
    </message>
</context>
</TS>
