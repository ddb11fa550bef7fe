<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en">
<context>
    <name>AnnouncementPopup</name>
    <message>
        <source>Traffic announcement</source>
        <translation>Traffic announcement</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>AutoStoreBar</name>
    <message>
        <source>Storing the strongest stations…</source>
        <translation>Storing the strongest stations…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
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
        <translation>Bank %1</translation>
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
        <translation>Preset %1</translation>
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
        <translation>Satellite</translation>
    </message>
    <message>
        <source>There is no such source</source>
        <translation>There is no such source</translation>
    </message>
    <message>
        <source>This source cannot play now</source>
        <translation>This source cannot play now</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>Nothing plays</translation>
    </message>
    <message>
        <source>There is no announcement</source>
        <translation>There is no announcement</translation>
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
        <translation>Sound</translation>
    </message>
    <message>
        <source>Stations</source>
        <translation>Stations</translation>
    </message>
    <message>
        <source>Seek down</source>
        <translation>Seek down</translation>
    </message>
    <message>
        <source>Seek up</source>
        <translation>Seek up</translation>
    </message>
    <message>
        <source>Traffic announcements</source>
        <translation>Traffic announcements</translation>
    </message>
    <message>
        <source>Store the strongest stations</source>
        <translation>Store the strongest stations</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Sources</translation>
    </message>
</context>
<context>
    <name>SatelliteDisplay</name>
    <message>
        <source>Searching…</source>
        <translation>Searching…</translation>
    </message>
    <message>
        <source>Replay</source>
        <translation>Replay</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>Live</translation>
    </message>
    <message>
        <source>Previous title</source>
        <translation>Previous title</translation>
    </message>
    <message>
        <source>Replay the previous title</source>
        <translation>Replay the previous title</translation>
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
        <source>Next title</source>
        <translation>Next title</translation>
    </message>
    <message>
        <source>Place in what can be replayed</source>
        <translation>Place in what can be replayed</translation>
    </message>
</context>
<context>
    <name>StationDisplay</name>
    <message>
        <source>Searching for traffic announcements…</source>
        <translation>Searching for traffic announcements…</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>Searching…</translation>
    </message>
    <message>
        <source>HD lost</source>
        <translation>HD lost</translation>
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
        <translation>Stations</translation>
    </message>
    <message>
        <source>No stations can be received</source>
        <translation>No stations can be received</translation>
    </message>
</context>
</TS>
