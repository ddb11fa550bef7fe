<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es">
<context>
    <name>AnnouncementPopup</name>
    <message>
        <source>Traffic announcement</source>
        <translation>Anuncio de tráfico</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>AutoStoreBar</name>
    <message>
        <source>Storing the strongest stations…</source>
        <translation>Guardando las emisoras con mejor señal…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Radio</source>
        <translation>Radio</translation>
    </message>
</context>
<context>
    <name>PresetBar</name>
    <message>
        <source>Bank %1</source>
        <translation>Banco %1</translation>
    </message>
    <message>
        <source>Bank</source>
        <translation>Banco</translation>
    </message>
</context>
<context>
    <name>PresetTile</name>
    <message>
        <source>Preset %1</source>
        <translation>Presintonía %1</translation>
    </message>
</context>
<context>
    <name>RadioController</name>
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
        <source>There is no such source</source>
        <translation>Esta fuente no existe</translation>
    </message>
    <message>
        <source>This source cannot play now</source>
        <translation>Esta fuente no está disponible ahora</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>No hay nada en reproducción</translation>
    </message>
    <message>
        <source>There is no announcement</source>
        <translation>No hay ningún anuncio</translation>
    </message>
</context>
<context>
    <name>RadioScreen</name>
    <message>
        <source>Radio</source>
        <translation>Radio</translation>
    </message>
    <message>
        <source>Sound</source>
        <translation>Sonido</translation>
    </message>
    <message>
        <source>Stations</source>
        <translation>Emisoras</translation>
    </message>
    <message>
        <source>Seek down</source>
        <translation>Buscar hacia abajo</translation>
    </message>
    <message>
        <source>Seek up</source>
        <translation>Buscar hacia arriba</translation>
    </message>
    <message>
        <source>Traffic announcements</source>
        <translation>Anuncios de tráfico</translation>
    </message>
    <message>
        <source>Store the strongest stations</source>
        <translation>Guardar las emisoras con mejor señal</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Fuentes</translation>
    </message>
</context>
<context>
    <name>SatelliteDisplay</name>
    <message>
        <source>Searching…</source>
        <translation>Buscando…</translation>
    </message>
    <message>
        <source>Replay</source>
        <translation>En diferido</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>En directo</translation>
    </message>
    <message>
        <source>Previous title</source>
        <translation>Título anterior</translation>
    </message>
    <message>
        <source>Replay the previous title</source>
        <translation>Repetir el título anterior</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pausa</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Reproducir</translation>
    </message>
    <message>
        <source>Next title</source>
        <translation>Título siguiente</translation>
    </message>
    <message>
        <source>Place in what can be replayed</source>
        <translation>Posición en la grabación</translation>
    </message>
</context>
<context>
    <name>StationDisplay</name>
    <message>
        <source>Searching for traffic announcements…</source>
        <translation>Buscando anuncios de tráfico…</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>Buscando…</translation>
    </message>
    <message>
        <source>HD lost</source>
        <translation>Sin HD</translation>
    </message>
    <message>
        <source>HD</source>
        <translation>HD</translation>
    </message>
    <message>
        <source>Stereo</source>
        <translation>Estéreo</translation>
    </message>
    <message>
        <source>TA</source>
        <translation>TA</translation>
    </message>
</context>
<context>
    <name>StationsScreen</name>
    <message>
        <source>Stations</source>
        <translation>Emisoras</translation>
    </message>
    <message>
        <source>No stations can be received</source>
        <translation>No se recibe ninguna emisora</translation>
    </message>
</context>
</TS>
