<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>AirKeys</name>
    <message>
        <source>Windscreen</source>
        <translation>Frontscheibe</translation>
    </message>
    <message>
        <source>Face</source>
        <translation>Mitte</translation>
    </message>
    <message>
        <source>Feet</source>
        <translation>Füße</translation>
    </message>
</context>
<context>
    <name>Climate</name>
    <message>
        <source>This temperature cannot be set</source>
        <translation>Diese Temperatur ist nicht einstellbar</translation>
    </message>
</context>
<context>
    <name>ClimateNotice</name>
    <message>
        <source>Climate</source>
        <translation>Klima</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperatur</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Sitzheizung</translation>
    </message>
    <message>
        <source>Fan</source>
        <translation>Gebläse</translation>
    </message>
    <message>
        <source>Air direction</source>
        <translation>Luftverteilung</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatik</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Kühlung</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Umluft</translation>
    </message>
    <message>
        <source>Windscreen</source>
        <translation>Frontscheibe</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Heckscheibe</translation>
    </message>
    <message>
        <source>Both sides alike</source>
        <translation>Beide Seiten gleich</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Ein</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
</context>
<context>
    <name>ClimateScreen</name>
    <message>
        <source>Climate</source>
        <translation>Klima</translation>
    </message>
    <message>
        <source>Driver</source>
        <translation>Fahrer</translation>
    </message>
    <message>
        <source>Passenger</source>
        <translation>Beifahrer</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
    <message>
        <source>Defrosting</source>
        <translation>Entfrostung</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatik</translation>
    </message>
    <message>
        <source>By hand</source>
        <translation>Von Hand</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Ein</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Kühlung</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Umluft</translation>
    </message>
    <message>
        <source>Defrost</source>
        <translation>Entfrosten</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Heckscheibe</translation>
    </message>
    <message>
        <source>Both sides</source>
        <translation>Beide Seiten</translation>
    </message>
</context>
<context>
    <name>ClimateZone</name>
    <message>
        <source>Warmer</source>
        <translation>Wärmer</translation>
    </message>
    <message>
        <source>Cooler</source>
        <translation>Kühler</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Sitzheizung</translation>
    </message>
</context>
<context>
    <name>FanControl</name>
    <message>
        <source>Less air</source>
        <translation>Weniger Luft</translation>
    </message>
    <message>
        <source>More air</source>
        <translation>Mehr Luft</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Climate</source>
        <translation>Klima</translation>
    </message>
</context>
</TS>
