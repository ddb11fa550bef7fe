<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>Llamada perdida</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>Vehículo</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>Puede haber hielo en la carretera. Conduzca con cuidado.</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>La batería del teléfono está casi agotada.</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>Remitente desconocido</translation>
    </message>
</context>
<context>
    <name>MessageCenter</name>
    <message>
        <source>I am on my way.</source>
        <translation>Voy de camino.</translation>
    </message>
    <message>
        <source>All right.</source>
        <translation>De acuerdo.</translation>
    </message>
    <message>
        <source>No, sorry.</source>
        <translation>No, lo siento.</translation>
    </message>
    <message>
        <source>There is nothing in this message</source>
        <translation>Este mensaje está vacío</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>Conduzco, llamo luego.</translation>
    </message>
</context>
<context>
    <name>MessageScreen</name>
    <message>
        <source>Message</source>
        <translation>Mensaje</translation>
    </message>
    <message>
        <source>No message is open</source>
        <translation>No hay ningún mensaje abierto</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>Respuesta: %1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>Devolver la llamada</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>Ir allí</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
</context>
<context>
    <name>MessagesScreen</name>
    <message>
        <source>Messages</source>
        <translation>Mensajes</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>Sin mensajes</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>Aquí llegan los textos, las llamadas perdidas y los avisos del vehículo.</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Messages</source>
        <translation>Mensajes</translation>
    </message>
</context>
</TS>
