<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>AudioSources</name>
    <message>
        <source>Reading the disc…</source>
        <translation>CD wird gelesen …</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Keine CD</translation>
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
        <translation>Satellit</translation>
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
        <translation>Telefon</translation>
    </message>
    <message numerus="yes">
        <source>%n track(s)</source>
        <translation>
            <numerusform>%n Titel</numerusform>
            <numerusform>%n Titel</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AudioSourcesPopup</name>
    <message>
        <source>Sources</source>
        <translation>Quellen</translation>
    </message>
</context>
<context>
    <name>CallChip</name>
    <message>
        <source>Show the call</source>
        <translation>Anruf anzeigen</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Wird gewählt …</translation>
    </message>
</context>
<context>
    <name>ConnectionTransient</name>
    <message>
        <source>Vehicle connected</source>
        <translation>Fahrzeug verbunden</translation>
    </message>
    <message>
        <source>No connection to the vehicle</source>
        <translation>Keine Verbindung zum Fahrzeug</translation>
    </message>
</context>
<context>
    <name>InputPanel</name>
    <message>
        <source>Nothing is typed now</source>
        <translation>Gerade wird nichts eingegeben</translation>
    </message>
</context>
<context>
    <name>Key</name>
    <message>
        <source>Shift</source>
        <translation>Umschalten</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Symbols</source>
        <translation>Zeichen</translation>
    </message>
    <message>
        <source>Letters</source>
        <translation>Buchstaben</translation>
    </message>
    <message>
        <source>Next keyboard</source>
        <translation>Nächste Tastatur</translation>
    </message>
    <message>
        <source>Write by hand</source>
        <translation>Von Hand schreiben</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Tastatur</translation>
    </message>
    <message>
        <source>Hide keyboard</source>
        <translation>Tastatur ausblenden</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Fertig</translation>
    </message>
    <message>
        <source>Space</source>
        <translation>Leerzeichen</translation>
    </message>
</context>
<context>
    <name>Launcher</name>
    <message>
        <source>Home</source>
        <translation>Startseite</translation>
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
        <translation>Diese Markierung gibt es nicht</translation>
    </message>
</context>
<context>
    <name>NowPlaying</name>
    <message>
        <source>Satellite</source>
        <translation>Satellit</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>Wiedergabe auf dem Telefon</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
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
        <translation>Titel %1</translation>
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
        <translation>Vorheriger</translation>
    </message>
    <message>
        <source>Sound on</source>
        <translation>Ton ein</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Stummschalten</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Nächster</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>Quellen</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Wiedergabe</translation>
    </message>
</context>
<context>
    <name>PopupCard</name>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>ProjectionScreen</name>
    <message>
        <source>Phone screen</source>
        <translation>Telefonbildschirm</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Kein Telefon wird gespiegelt</translation>
    </message>
    <message>
        <source>The phone on the cable draws here.</source>
        <translation>Hier erscheint das Bild des Telefons am Kabel.</translation>
    </message>
    <message>
        <source>The phone draws here, without cable.</source>
        <translation>Hier erscheint das drahtlos übertragene Bild des Telefons.</translation>
    </message>
    <message>
        <source>Call on the projected phone</source>
        <translation>Anruf auf dem gespiegelten Telefon</translation>
    </message>
</context>
<context>
    <name>Rail</name>
    <message>
        <source>Home</source>
        <translation>Startseite</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Phone screen</source>
        <translation>Telefonbildschirm</translation>
    </message>
</context>
<context>
    <name>ScrollList</name>
    <message>
        <source>More when you have stopped</source>
        <translation>Mehr, wenn Sie stehen</translation>
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
        <translation>Satellit</translation>
    </message>
</context>
<context>
    <name>SearchScreen</name>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Contacts and stations</source>
        <translation>Kontakte und Sender</translation>
    </message>
    <message>
        <source>Nothing is called that</source>
        <translation>Nichts heißt so</translation>
    </message>
    <message>
        <source>Type a name, or write it by hand</source>
        <translation>Einen Namen tippen oder von Hand schreiben</translation>
    </message>
</context>
<context>
    <name>StandbyScreen</name>
    <message>
        <source>Touch to switch on</source>
        <translation>Zum Einschalten berühren</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
</context>
<context>
    <name>SystemScreens</name>
    <message>
        <source>The head unit is switched off</source>
        <translation>Das System ist ausgeschaltet</translation>
    </message>
    <message>
        <source>Valet mode is on already</source>
        <translation>Der Valet-Modus ist bereits aktiv</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Kein Telefon wird gespiegelt</translation>
    </message>
    <message>
        <source>This is not possible now</source>
        <translation>Das ist gerade nicht möglich</translation>
    </message>
</context>
<context>
    <name>TextField</name>
    <message>
        <source>Clear</source>
        <translation>Leeren</translation>
    </message>
    <message>
        <source>Not while driving</source>
        <translation>Nicht während der Fahrt</translation>
    </message>
</context>
<context>
    <name>TurnChip</name>
    <message>
        <source>Show the map</source>
        <translation>Karte zeigen</translation>
    </message>
</context>
<context>
    <name>TurnHint</name>
    <message>
        <source>There is no turn to show</source>
        <translation>Es gibt keinen Hinweis zu zeigen</translation>
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
        <translation>Valet-Modus</translation>
    </message>
    <message>
        <source>Personal data is hidden and the volume keys are locked.</source>
        <translation>Persönliche Daten sind ausgeblendet, die Lautstärketasten sind gesperrt.</translation>
    </message>
    <message>
        <source>Leave valet mode</source>
        <translation>Valet-Modus beenden</translation>
    </message>
</context>
<context>
    <name>VoicePopup</name>
    <message>
        <source>Voice control</source>
        <translation>Sprachbedienung</translation>
    </message>
    <message>
        <source>Spoken message</source>
        <translation>Sprachansage</translation>
    </message>
    <message>
        <source>Voice control is not ready</source>
        <translation>Sprachbedienung nicht bereit</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Schritt %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Stopp</translation>
    </message>
</context>
<context>
    <name>VolumeTransient</name>
    <message>
        <source>Volume</source>
        <translation>Lautstärke</translation>
    </message>
    <message>
        <source>Volume of the voice</source>
        <translation>Lautstärke der Sprachausgabe</translation>
    </message>
</context>
<context>
    <name>WritingPad</name>
    <message>
        <source>Write here</source>
        <translation>Hier schreiben</translation>
    </message>
</context>
</TS>
