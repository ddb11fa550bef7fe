<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es">
<context>
    <name>DiscScreen</name>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>Leyendo el disco…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Sin disco</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Pista %1</translation>
    </message>
</context>
<context>
    <name>LibraryScreen</name>
    <message>
        <source>Library</source>
        <translation>Biblioteca</translation>
    </message>
    <message>
        <source>Titles</source>
        <translation>Títulos</translation>
    </message>
    <message>
        <source>Artists</source>
        <translation>Artistas</translation>
    </message>
    <message>
        <source>Albums</source>
        <translation>Álbumes</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>Sin música</translation>
    </message>
</context>
<context>
    <name>MediaController</name>
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
    <message>
        <source>Track %1</source>
        <translation>Pista %1</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Se reproduce en el teléfono</translation>
    </message>
    <message>
        <source>Track %1 of %2</source>
        <translation>Pista %1 de %2</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>Leyendo el disco…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Sin disco</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Ningún teléfono proyectado</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>Sin música</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>No hay nada en reproducción</translation>
    </message>
    <message>
        <source>No player is heard</source>
        <translation>Ninguna fuente multimedia activa</translation>
    </message>
    <message>
        <source>There is nothing to resume</source>
        <translation>No hay nada que reanudar</translation>
    </message>
</context>
<context>
    <name>MediaScreen</name>
    <message>
        <source>Media</source>
        <translation>Multimedia</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>Pistas</translation>
    </message>
    <message>
        <source>Library</source>
        <translation>Biblioteca</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Fuentes</translation>
    </message>
    <message>
        <source>Insert a disc to play it.</source>
        <translation>Inserte un disco para reproducirlo.</translation>
    </message>
    <message>
        <source>Position in the track</source>
        <translation>Posición en la pista</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Media</source>
        <translation>Multimedia</translation>
    </message>
</context>
<context>
    <name>TransportKeys</name>
    <message>
        <source>Previous</source>
        <translation>Pista anterior</translation>
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
        <source>Next</source>
        <translation>Pista siguiente</translation>
    </message>
</context>
</TS>
