<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>DiscScreen</name>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>CD wird gelesen …</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Keine CD</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Titel %1</translation>
    </message>
</context>
<context>
    <name>LibraryScreen</name>
    <message>
        <source>Library</source>
        <translation>Bibliothek</translation>
    </message>
    <message>
        <source>Titles</source>
        <translation>Titel</translation>
    </message>
    <message>
        <source>Artists</source>
        <translation>Interpreten</translation>
    </message>
    <message>
        <source>Albums</source>
        <translation>Alben</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>Keine Musik</translation>
    </message>
</context>
<context>
    <name>MediaController</name>
    <message>
        <source>Player</source>
        <translation>Player</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Titel %1</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Wiedergabe auf dem Telefon</translation>
    </message>
    <message>
        <source>Track %1 of %2</source>
        <translation>Titel %1 von %2</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>CD wird gelesen …</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Keine CD</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Kein Telefon wird gespiegelt</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>Keine Musik</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>Keine Wiedergabe</translation>
    </message>
    <message>
        <source>No player is heard</source>
        <translation>Keine Medienquelle aktiv</translation>
    </message>
    <message>
        <source>There is nothing to resume</source>
        <translation>Es gibt nichts fortzusetzen</translation>
    </message>
</context>
<context>
    <name>MediaScreen</name>
    <message>
        <source>Media</source>
        <translation>Medien</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>Titel</translation>
    </message>
    <message>
        <source>Library</source>
        <translation>Bibliothek</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Quellen</translation>
    </message>
    <message>
        <source>Insert a disc to play it.</source>
        <translation>Zum Abspielen eine CD einlegen.</translation>
    </message>
    <message>
        <source>Position in the track</source>
        <translation>Position im Titel</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Media</source>
        <translation>Medien</translation>
    </message>
</context>
<context>
    <name>TransportKeys</name>
    <message>
        <source>Previous</source>
        <translation>Vorheriger Titel</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Wiedergabe</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Nächster Titel</translation>
    </message>
</context>
</TS>
