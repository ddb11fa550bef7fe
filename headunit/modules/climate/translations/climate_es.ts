<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>AirKeys</name>
    <message>
        <source>Windscreen</source>
        <translation>Parabrisas</translation>
    </message>
    <message>
        <source>Face</source>
        <translation>Frontal</translation>
    </message>
    <message>
        <source>Feet</source>
        <translation>Pies</translation>
    </message>
</context>
<context>
    <name>Climate</name>
    <message>
        <source>This temperature cannot be set</source>
        <translation>Esta temperatura no se puede ajustar</translation>
    </message>
</context>
<context>
    <name>ClimateNotice</name>
    <message>
        <source>Climate</source>
        <translation>Climatización</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperatura</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Asiento calefactado</translation>
    </message>
    <message>
        <source>Fan</source>
        <translation>Ventilador</translation>
    </message>
    <message>
        <source>Air direction</source>
        <translation>Dirección del aire</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automático</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Refrigeración</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Recirculación</translation>
    </message>
    <message>
        <source>Windscreen</source>
        <translation>Parabrisas</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Luneta trasera</translation>
    </message>
    <message>
        <source>Both sides alike</source>
        <translation>Ambos lados iguales</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Encendido</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Apagado</translation>
    </message>
</context>
<context>
    <name>ClimateScreen</name>
    <message>
        <source>Climate</source>
        <translation>Climatización</translation>
    </message>
    <message>
        <source>Driver</source>
        <translation>Conductor</translation>
    </message>
    <message>
        <source>Passenger</source>
        <translation>Acompañante</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Apagado</translation>
    </message>
    <message>
        <source>Defrosting</source>
        <translation>Desempañado</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automático</translation>
    </message>
    <message>
        <source>By hand</source>
        <translation>Manual</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Encendido</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>Refrigeración</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>Recirculación</translation>
    </message>
    <message>
        <source>Defrost</source>
        <translation>Desempañar</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>Luneta trasera</translation>
    </message>
    <message>
        <source>Both sides</source>
        <translation>Ambos lados</translation>
    </message>
</context>
<context>
    <name>ClimateZone</name>
    <message>
        <source>Warmer</source>
        <translation>Más calor</translation>
    </message>
    <message>
        <source>Cooler</source>
        <translation>Más frío</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>Asiento calefactado</translation>
    </message>
</context>
<context>
    <name>FanControl</name>
    <message>
        <source>Less air</source>
        <translation>Menos aire</translation>
    </message>
    <message>
        <source>More air</source>
        <translation>Más aire</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Climate</source>
        <translation>Climatización</translation>
    </message>
</context>
</TS>
