<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>AnnouncementPopup</name>
    <message>
        <source>Traffic announcement</source>
        <translation>Verkehrsdurchsage</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>AutoStoreBar</name>
    <message>
        <source>Storing the strongest stations…</source>
        <translation>Stärkste Sender werden gespeichert …</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
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
        <translation>Speicherbank %1</translation>
    </message>
    <message>
        <source>Bank</source>
        <translation>Bank</translation>
    </message>
</context>
<context>
    <name>PresetTile</name>
    <message>
        <source>Preset %1</source>
        <translation>Stationstaste %1</translation>
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
        <translation>Satellit</translation>
    </message>
    <message>
        <source>There is no such source</source>
        <translation>Diese Quelle gibt es nicht</translation>
    </message>
    <message>
        <source>This source cannot play now</source>
        <translation>Diese Quelle ist gerade nicht verfügbar</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>Keine Wiedergabe</translation>
    </message>
    <message>
        <source>There is no announcement</source>
        <translation>Es läuft keine Durchsage</translation>
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
        <translation>Klang</translation>
    </message>
    <message>
        <source>Stations</source>
        <translation>Sender</translation>
    </message>
    <message>
        <source>Seek down</source>
        <translation>Suchlauf abwärts</translation>
    </message>
    <message>
        <source>Seek up</source>
        <translation>Suchlauf aufwärts</translation>
    </message>
    <message>
        <source>Traffic announcements</source>
        <translation>Verkehrsdurchsagen</translation>
    </message>
    <message>
        <source>Store the strongest stations</source>
        <translation>Stärkste Sender speichern</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Quellen</translation>
    </message>
</context>
<context>
    <name>SatelliteDisplay</name>
    <message>
        <source>Searching…</source>
        <translation>Suche …</translation>
    </message>
    <message>
        <source>Replay</source>
        <translation>Zeitversetzt</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>Live</translation>
    </message>
    <message>
        <source>Previous title</source>
        <translation>Vorheriger Titel</translation>
    </message>
    <message>
        <source>Replay the previous title</source>
        <translation>Vorherigen Titel wiederholen</translation>
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
        <source>Next title</source>
        <translation>Nächster Titel</translation>
    </message>
    <message>
        <source>Place in what can be replayed</source>
        <translation>Position im Zwischenspeicher</translation>
    </message>
</context>
<context>
    <name>StationDisplay</name>
    <message>
        <source>Searching for traffic announcements…</source>
        <translation>Sender mit Verkehrsfunk wird gesucht …</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>Suche …</translation>
    </message>
    <message>
        <source>HD lost</source>
        <translation>Kein HD</translation>
    </message>
    <message>
        <source>HD</source>
        <translation>HD</translation>
    </message>
    <message>
        <source>Stereo</source>
        <translation>Stereo</translation>
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
        <translation>Sender</translation>
    </message>
    <message>
        <source>No stations can be received</source>
        <translation>Kein Sender zu empfangen</translation>
    </message>
</context>
</TS>
