<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>AppsScreen</name>
    <message>
        <source>Apps</source>
        <translation>Aplicaciones</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Apps</source>
        <translation>Aplicaciones</translation>
    </message>
</context>
<context>
    <name>PhonePanel</name>
    <message>
        <source>No phone is projected</source>
        <translation>No se proyecta ningún teléfono</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>Su teléfono</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>Por cable</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>Sin cable</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>Conecte el teléfono con su cable o active su proyección inalámbrica en el coche.</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>La proyección no se ofrece en este mercado.</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>Desconecte el cable para terminar.</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>Termínela en el teléfono.</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>Mostrar su pantalla</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>Mapas</translation>
    </message>
</context>
</TS>
