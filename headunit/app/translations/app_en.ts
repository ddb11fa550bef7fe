<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en">
<context>
    <name>AudioSources</name>
    <message>
        <source>Reading the disc…</source>
        <translation>Reading the disc…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>No disc</translation>
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
        <translation>Satellite</translation>
    </message>
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
    <message numerus="yes">
        <source>%n track(s)</source>
        <translation>
            <numerusform>%n track</numerusform>
            <numerusform>%n tracks</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AudioSourcesPopup</name>
    <message>
        <source>Sources</source>
        <translation>Sources</translation>
    </message>
</context>
<context>
    <name>CallChip</name>
    <message>
        <source>Show the call</source>
        <translation>Show the call</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Dialling…</translation>
    </message>
</context>
<context>
    <name>ConnectionTransient</name>
    <message>
        <source>Vehicle connected</source>
        <translation>Vehicle connected</translation>
    </message>
    <message>
        <source>No connection to the vehicle</source>
        <translation>No connection to the vehicle</translation>
    </message>
</context>
<context>
    <name>InputPanel</name>
    <message>
        <source>Nothing is typed now</source>
        <translation>Nothing is typed now</translation>
    </message>
</context>
<context>
    <name>Key</name>
    <message>
        <source>Shift</source>
        <translation>Shift</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Symbols</source>
        <translation>Symbols</translation>
    </message>
    <message>
        <source>Letters</source>
        <translation>Letters</translation>
    </message>
    <message>
        <source>Next keyboard</source>
        <translation>Next keyboard</translation>
    </message>
    <message>
        <source>Write by hand</source>
        <translation>Write by hand</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Keyboard</translation>
    </message>
    <message>
        <source>Hide keyboard</source>
        <translation>Hide keyboard</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Done</translation>
    </message>
    <message>
        <source>Space</source>
        <translation>Space</translation>
    </message>
</context>
<context>
    <name>Launcher</name>
    <message>
        <source>Home</source>
        <translation>Home</translation>
    </message>
</context>
<context>
    <name>Market</name>
    <message>
        <source>%1 °F</source>
        <translation>%1 °F</translation>
    </message>
    <message>
        <source>%1 °C</source>
        <translation>%1 °C</translation>
    </message>
</context>
<context>
    <name>ModuleMarks</name>
    <message>
        <source>There is no such mark</source>
        <translation>There is no such mark</translation>
    </message>
</context>
<context>
    <name>NowPlaying</name>
    <message>
        <source>Satellite</source>
        <translation>Satellite</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Plays on the phone</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Phone</translation>
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
        <translation>Track %1</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>Player</translation>
    </message>
</context>
<context>
    <name>NowPlayingCard</name>
    <message>
        <source>Previous</source>
        <translation>Previous</translation>
    </message>
    <message>
        <source>Sound on</source>
        <translation>Sound on</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Mute</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Next</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Sources</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Play</translation>
    </message>
</context>
<context>
    <name>PopupCard</name>
    <message>
        <source>Close</source>
        <translation>Close</translation>
    </message>
</context>
<context>
    <name>ProjectionScreen</name>
    <message>
        <source>Phone screen</source>
        <translation>Phone screen</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>No phone is projected</translation>
    </message>
    <message>
        <source>The phone on the cable draws here.</source>
        <translation>The phone on the cable draws here.</translation>
    </message>
    <message>
        <source>The phone draws here, without cable.</source>
        <translation>The phone draws here, without cable.</translation>
    </message>
    <message>
        <source>Call on the projected phone</source>
        <translation>Call on the projected phone</translation>
    </message>
</context>
<context>
    <name>Rail</name>
    <message>
        <source>Home</source>
        <translation>Home</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Back</translation>
    </message>
    <message>
        <source>Phone screen</source>
        <translation>Phone screen</translation>
    </message>
</context>
<context>
    <name>ScrollList</name>
    <message>
        <source>More when you have stopped</source>
        <translation>More when you have stopped</translation>
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
        <translation>Satellite</translation>
    </message>
</context>
<context>
    <name>SearchScreen</name>
    <message>
        <source>Search</source>
        <translation>Search</translation>
    </message>
    <message>
        <source>Contacts and stations</source>
        <translation>Contacts and stations</translation>
    </message>
    <message>
        <source>Nothing is called that</source>
        <translation>Nothing is called that</translation>
    </message>
    <message>
        <source>Type a name, or write it by hand</source>
        <translation>Type a name, or write it by hand</translation>
    </message>
</context>
<context>
    <name>StandbyScreen</name>
    <message>
        <source>Touch to switch on</source>
        <translation>Touch to switch on</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Search</source>
        <translation>Search</translation>
    </message>
</context>
<context>
    <name>SystemScreens</name>
    <message>
        <source>The head unit is switched off</source>
        <translation>The head unit is switched off</translation>
    </message>
    <message>
        <source>Valet mode is on already</source>
        <translation>Valet mode is on already</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>No phone is projected</translation>
    </message>
    <message>
        <source>This is not possible now</source>
        <translation>This is not possible now</translation>
    </message>
</context>
<context>
    <name>TextField</name>
    <message>
        <source>Clear</source>
        <translation>Clear</translation>
    </message>
    <message>
        <source>Not while driving</source>
        <translation>Not while driving</translation>
    </message>
</context>
<context>
    <name>TurnChip</name>
    <message>
        <source>Show the map</source>
        <translation>Show the map</translation>
    </message>
</context>
<context>
    <name>TurnHint</name>
    <message>
        <source>There is no turn to show</source>
        <translation>There is no turn to show</translation>
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
        <translation>Valet mode</translation>
    </message>
    <message>
        <source>Personal data is hidden and the volume keys are locked.</source>
        <translation>Personal data is hidden and the volume keys are locked.</translation>
    </message>
    <message>
        <source>Leave valet mode</source>
        <translation>Leave valet mode</translation>
    </message>
</context>
<context>
    <name>VoicePopup</name>
    <message>
        <source>Voice control</source>
        <translation>Voice control</translation>
    </message>
    <message>
        <source>Spoken message</source>
        <translation>Spoken message</translation>
    </message>
    <message>
        <source>Voice control is not ready</source>
        <translation>Voice control is not ready</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Step %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Stop</translation>
    </message>
</context>
<context>
    <name>VolumeTransient</name>
    <message>
        <source>Volume</source>
        <translation>Volume</translation>
    </message>
    <message>
        <source>Volume of the voice</source>
        <translation>Volume of the voice</translation>
    </message>
</context>
<context>
    <name>WritingPad</name>
    <message>
        <source>Write here</source>
        <translation>Write here</translation>
    </message>
</context>
</TS>
