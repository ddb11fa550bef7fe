<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es">
<context>
    <name>AudioSources</name>
    <message>
        <source>Reading the disc…</source>
        <translation>Leyendo el disco…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Sin disco</translation>
    </message>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>Satellite</source>
        <translation>Satélite</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>Reproductor</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Teléfono</translation>
    </message>
    <message numerus="yes">
        <source>%n track(s)</source>
        <translation>
            <numerusform>%n pista</numerusform>
            <numerusform>%n pistas</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AudioSourcesPopup</name>
    <message>
        <source>Sources</source>
        <translation>Fuentes</translation>
    </message>
</context>
<context>
    <name>CallChip</name>
    <message>
        <source>Show the call</source>
        <translation>Mostrar la llamada</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Marcando…</translation>
    </message>
</context>
<context>
    <name>ConnectionTransient</name>
    <message>
        <source>Vehicle connected</source>
        <translation>Vehículo conectado</translation>
    </message>
    <message>
        <source>No connection to the vehicle</source>
        <translation>Sin conexión con el vehículo</translation>
    </message>
</context>
<context>
    <name>InputPanel</name>
    <message>
        <source>Nothing is typed now</source>
        <translation>No se está escribiendo nada</translation>
    </message>
</context>
<context>
    <name>Key</name>
    <message>
        <source>Shift</source>
        <translation>Mayúsculas</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Borrar</translation>
    </message>
    <message>
        <source>Symbols</source>
        <translation>Símbolos</translation>
    </message>
    <message>
        <source>Letters</source>
        <translation>Letras</translation>
    </message>
    <message>
        <source>Next keyboard</source>
        <translation>Teclado siguiente</translation>
    </message>
    <message>
        <source>Write by hand</source>
        <translation>Escribir a mano</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Teclado</translation>
    </message>
    <message>
        <source>Hide keyboard</source>
        <translation>Ocultar el teclado</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Listo</translation>
    </message>
    <message>
        <source>Space</source>
        <translation>Espacio</translation>
    </message>
</context>
<context>
    <name>Launcher</name>
    <message>
        <source>Home</source>
        <translation>Inicio</translation>
    </message>
</context>
<context>
    <name>Market</name>
    <message>
        <source>%1 °F</source>
        <translation>%1&#xa0;°F</translation>
    </message>
    <message>
        <source>%1 °C</source>
        <translation>%1&#xa0;°C</translation>
    </message>
</context>
<context>
    <name>ModuleMarks</name>
    <message>
        <source>There is no such mark</source>
        <translation>No existe esa marca</translation>
    </message>
</context>
<context>
    <name>NowPlaying</name>
    <message>
        <source>Satellite</source>
        <translation>Satélite</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Se reproduce en el teléfono</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Teléfono</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Pista %1</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>Reproductor</translation>
    </message>
</context>
<context>
    <name>NowPlayingCard</name>
    <message>
        <source>Previous</source>
        <translation>Anterior</translation>
    </message>
    <message>
        <source>Sound on</source>
        <translation>Activar el sonido</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Silenciar</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Siguiente</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Fuentes</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pausa</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Reproducir</translation>
    </message>
</context>
<context>
    <name>PopupCard</name>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
    </message>
</context>
<context>
    <name>ProjectionScreen</name>
    <message>
        <source>Phone screen</source>
        <translation>Pantalla del teléfono</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Ningún teléfono proyectado</translation>
    </message>
    <message>
        <source>The phone on the cable draws here.</source>
        <translation>Aquí se muestra el teléfono conectado por cable.</translation>
    </message>
    <message>
        <source>The phone draws here, without cable.</source>
        <translation>Aquí se muestra el teléfono de forma inalámbrica.</translation>
    </message>
    <message>
        <source>Call on the projected phone</source>
        <translation>Llamada en el teléfono proyectado</translation>
    </message>
</context>
<context>
    <name>Rail</name>
    <message>
        <source>Home</source>
        <translation>Inicio</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
    <message>
        <source>Phone screen</source>
        <translation>Pantalla del teléfono</translation>
    </message>
</context>
<context>
    <name>ScrollList</name>
    <message>
        <source>More when you have stopped</source>
        <translation>Más cuando se detenga</translation>
    </message>
</context>
<context>
    <name>SearchModel</name>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>Satellite</source>
        <translation>Satélite</translation>
    </message>
</context>
<context>
    <name>SearchScreen</name>
    <message>
        <source>Search</source>
        <translation>Buscar</translation>
    </message>
    <message>
        <source>Contacts and stations</source>
        <translation>Contactos y emisoras</translation>
    </message>
    <message>
        <source>Nothing is called that</source>
        <translation>Nada se llama así</translation>
    </message>
    <message>
        <source>Type a name, or write it by hand</source>
        <translation>Teclee un nombre o escríbalo a mano</translation>
    </message>
</context>
<context>
    <name>StandbyScreen</name>
    <message>
        <source>Touch to switch on</source>
        <translation>Toque para encender</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Search</source>
        <translation>Buscar</translation>
    </message>
</context>
<context>
    <name>SystemScreens</name>
    <message>
        <source>The head unit is switched off</source>
        <translation>El sistema está apagado</translation>
    </message>
    <message>
        <source>Valet mode is on already</source>
        <translation>El modo valet ya está activo</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Ningún teléfono proyectado</translation>
    </message>
    <message>
        <source>This is not possible now</source>
        <translation>No es posible en este momento</translation>
    </message>
</context>
<context>
    <name>TextField</name>
    <message>
        <source>Clear</source>
        <translation>Vaciar</translation>
    </message>
    <message>
        <source>Not while driving</source>
        <translation>No durante la conducción</translation>
    </message>
</context>
<context>
    <name>TurnChip</name>
    <message>
        <source>Show the map</source>
        <translation>Mostrar el mapa</translation>
    </message>
</context>
<context>
    <name>TurnHint</name>
    <message>
        <source>There is no turn to show</source>
        <translation>No hay giro que mostrar</translation>
    </message>
</context>
<context>
    <name>Units</name>
    <message>
        <source>%1 m</source>
        <translation>%1 m</translation>
    </message>
    <message>
        <source>%1 km</source>
        <translation>%1 km</translation>
    </message>
    <message>
        <source>%1 yd</source>
        <translation>%1 yd</translation>
    </message>
    <message>
        <source>%1 mi</source>
        <translation>%1 mi</translation>
    </message>
    <message>
        <source>%1 ft</source>
        <translation>%1 ft</translation>
    </message>
    <message>
        <source>%1 min</source>
        <translation>%1 min</translation>
    </message>
    <message>
        <source>%1 h %2 min</source>
        <translation>%1 h %2 min</translation>
    </message>
</context>
<context>
    <name>ValetScreen</name>
    <message>
        <source>Valet mode</source>
        <translation>Modo valet</translation>
    </message>
    <message>
        <source>Personal data is hidden and the volume keys are locked.</source>
        <translation>Los datos personales están ocultos y las teclas de volumen, bloqueadas.</translation>
    </message>
    <message>
        <source>Leave valet mode</source>
        <translation>Salir del modo valet</translation>
    </message>
</context>
<context>
    <name>VoicePopup</name>
    <message>
        <source>Voice control</source>
        <translation>Control por voz</translation>
    </message>
    <message>
        <source>Spoken message</source>
        <translation>Mensaje hablado</translation>
    </message>
    <message>
        <source>Voice control is not ready</source>
        <translation>Control por voz no disponible</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Paso %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Detener</translation>
    </message>
</context>
<context>
    <name>VolumeTransient</name>
    <message>
        <source>Volume</source>
        <translation>Volumen</translation>
    </message>
    <message>
        <source>Volume of the voice</source>
        <translation>Volumen de la voz</translation>
    </message>
</context>
<context>
    <name>WritingPad</name>
    <message>
        <source>Write here</source>
        <translation>Escriba aquí</translation>
    </message>
</context>
</TS>
