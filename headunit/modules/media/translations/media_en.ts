<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en">
<context>
    <name>DiscScreen</name>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>Reading the disc…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>No disc</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Track %1</translation>
    </message>
</context>
<context>
    <name>LibraryScreen</name>
    <message>
        <source>Library</source>
        <translation>Library</translation>
    </message>
    <message>
        <source>Titles</source>
        <translation>Titles</translation>
    </message>
    <message>
        <source>Artists</source>
        <translation>Artists</translation>
    </message>
    <message>
        <source>Albums</source>
        <translation>Albums</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>No music</translation>
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
        <translation>Phone</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>Track %1</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Plays on the phone</translation>
    </message>
    <message>
        <source>Track %1 of %2</source>
        <translation>Track %1 of %2</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>Reading the disc…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>No disc</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>No phone is projected</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>No music</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>Nothing plays</translation>
    </message>
    <message>
        <source>No player is heard</source>
        <translation>No player is heard</translation>
    </message>
    <message>
        <source>There is nothing to resume</source>
        <translation>There is nothing to resume</translation>
    </message>
</context>
<context>
    <name>MediaScreen</name>
    <message>
        <source>Media</source>
        <translation>Media</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>Tracks</translation>
    </message>
    <message>
        <source>Library</source>
        <translation>Library</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Sources</translation>
    </message>
    <message>
        <source>Insert a disc to play it.</source>
        <translation>Insert a disc to play it.</translation>
    </message>
    <message>
        <source>Position in the track</source>
        <translation>Position in the track</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Media</source>
        <translation>Media</translation>
    </message>
</context>
<context>
    <name>TransportKeys</name>
    <message>
        <source>Previous</source>
        <translation>Previous</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Play</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Next</translation>
    </message>
</context>
</TS>
