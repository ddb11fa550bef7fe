<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>DiscScreen</name>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>Chargement du disque…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Aucun disque</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Piste %1</translation>
    </message>
</context>
<context>
    <name>LibraryScreen</name>
    <message>
        <source>Library</source>
        <translation>Bibliothèque</translation>
    </message>
    <message>
        <source>Titles</source>
        <translation>Titres</translation>
    </message>
    <message>
        <source>Artists</source>
        <translation>Artistes</translation>
    </message>
    <message>
        <source>Albums</source>
        <translation>Albums</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>Aucune musique</translation>
    </message>
</context>
<context>
    <name>MediaController</name>
    <message>
        <source>Player</source>
        <translation>Lecteur</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Téléphone</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Piste %1</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Lecture sur le téléphone</translation>
    </message>
    <message>
        <source>Track %1 of %2</source>
        <translation>Piste %1 sur %2</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>Chargement du disque…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Aucun disque</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Aucun téléphone projeté</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>Aucune musique</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>Aucune lecture en cours</translation>
    </message>
    <message>
        <source>No player is heard</source>
        <translation>Aucune source multimédia active</translation>
    </message>
    <message>
        <source>There is nothing to resume</source>
        <translation>Rien à reprendre</translation>
    </message>
</context>
<context>
    <name>MediaScreen</name>
    <message>
        <source>Media</source>
        <translation>Médias</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>Pistes</translation>
    </message>
    <message>
        <source>Library</source>
        <translation>Bibliothèque</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Sources</translation>
    </message>
    <message>
        <source>Insert a disc to play it.</source>
        <translation>Insérez un disque pour l’écouter.</translation>
    </message>
    <message>
        <source>Position in the track</source>
        <translation>Position dans la piste</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Media</source>
        <translation>Médias</translation>
    </message>
</context>
<context>
    <name>TransportKeys</name>
    <message>
        <source>Previous</source>
        <translation>Piste précédente</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Lecture</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Piste suivante</translation>
    </message>
</context>
</TS>
