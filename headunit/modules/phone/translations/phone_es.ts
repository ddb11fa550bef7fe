<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>El asistente está desactivado</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>Actívelo en los ajustes de %1 y vuelva a mantener pulsada la tecla de voz.</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>Actívelo en los ajustes del teléfono y vuelva a mantener pulsada la tecla de voz.</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>El asistente del teléfono escucha</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>La marcación por voz del teléfono escucha</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Detener</translation>
    </message>
</context>
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation>Llamada</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>Sin llamada</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Marcando…</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>En el vehículo</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>En el teléfono</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>Colgar</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>Se escucha en el teléfono, no en el vehículo</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Número desconocido</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>Teléfono</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>Ningún teléfono conectado</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>Batería: %1&#xa0;%</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>Teclado</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>Sin contactos</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>Llamada de emergencia en curso. El teléfono no está disponible.</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>Llamada entrante</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Número desconocido</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>Contestar</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>Rechazar</translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation>Teclado</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>Escriba un número</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Llamar</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>Borrar la última cifra</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>Teléfono</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>Llamada de emergencia en curso</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>Ningún teléfono conectado</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>Llamada en curso</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>No es un número de teléfono</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>El asistente está activado</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>Teléfono</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>Ajustes del teléfono</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>Teléfono conectado</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Ninguno</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>Contactos</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>Llamadas por el altavoz del teléfono</translation>
    </message>
</context>
</TS>
