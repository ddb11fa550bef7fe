<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>AirKeys</name>
    <message>
        <source>Windscreen</source>
        <translation>Pare-brise</translation>
    </message>
    <message>
        <source>Face</source>
        <translation>Visage</translation>
    </message>
    <message>
        <source>Feet</source>
        <translation>Pieds</translation>
    </message>
</context>
<context>
    <name>Climate</name>
    <message>
        <source>This temperature cannot be set</source>
        <translation>Cette température ne peut pas être réglée</translation>
    </message>
</context>
<context>
    <name>ClimateNotice</name>
    <message>
        <source>Climate</source>
        <translation>Climatisation</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Température</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Siège chauffant</translation>
    </message>
    <message>
        <source>Fan</source>
        <translation>Ventilation</translation>
    </message>
    <message>
        <source>Air direction</source>
        <translation>Direction de l’air</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatique</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Climatiseur</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Recyclage</translation>
    </message>
    <message>
        <source>Windscreen</source>
        <translation>Pare-brise</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Lunette arrière</translation>
    </message>
    <message>
        <source>Both sides alike</source>
        <translation>Deux côtés identiques</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Marche</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Arrêt</translation>
    </message>
</context>
<context>
    <name>ClimateScreen</name>
    <message>
        <source>Climate</source>
        <translation>Climatisation</translation>
    </message>
    <message>
        <source>Driver</source>
        <translation>Conducteur</translation>
    </message>
    <message>
        <source>Passenger</source>
        <translation>Passager</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Arrêt</translation>
    </message>
    <message>
        <source>Defrosting</source>
        <translation>Dégivrage</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatique</translation>
    </message>
    <message>
        <source>By hand</source>
        <translation>Manuel</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Marche</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Climatiseur</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Recyclage</translation>
    </message>
    <message>
        <source>Defrost</source>
        <translation>Dégivrer</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Lunette arrière</translation>
    </message>
    <message>
        <source>Both sides</source>
        <translation>Deux côtés</translation>
    </message>
</context>
<context>
    <name>ClimateZone</name>
    <message>
        <source>Warmer</source>
        <translation>Plus chaud</translation>
    </message>
    <message>
        <source>Cooler</source>
        <translation>Plus frais</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Siège chauffant</translation>
    </message>
</context>
<context>
    <name>FanControl</name>
    <message>
        <source>Less air</source>
        <translation>Moins d’air</translation>
    </message>
    <message>
        <source>More air</source>
        <translation>Plus d’air</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Climate</source>
        <translation>Climatisation</translation>
    </message>
</context>
</TS>
