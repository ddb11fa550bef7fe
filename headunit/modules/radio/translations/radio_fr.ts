<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>AnnouncementPopup</name>
    <message>
        <source>Traffic announcement</source>
        <translation>Info trafic</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>AutoStoreBar</name>
    <message>
        <source>Storing the strongest stations…</source>
        <translation>Mémorisation des stations les plus fortes…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
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
        <translation>Banque %1</translation>
    </message>
    <message>
        <source>Bank</source>
        <translation>Banque</translation>
    </message>
</context>
<context>
    <name>PresetTile</name>
    <message>
        <source>Preset %1</source>
        <translation>Station mémorisée %1</translation>
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
        <translation>Cette source n’existe pas</translation>
    </message>
    <message>
        <source>This source cannot play now</source>
        <translation>Cette source est indisponible</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>Aucune lecture en cours</translation>
    </message>
    <message>
        <source>There is no announcement</source>
        <translation>Aucune annonce en cours</translation>
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
        <translation>Son</translation>
    </message>
    <message>
        <source>Stations</source>
        <translation>Stations</translation>
    </message>
    <message>
        <source>Seek down</source>
        <translation>Recherche vers le bas</translation>
    </message>
    <message>
        <source>Seek up</source>
        <translation>Recherche vers le haut</translation>
    </message>
    <message>
        <source>Traffic announcements</source>
        <translation>Infos trafic</translation>
    </message>
    <message>
        <source>Store the strongest stations</source>
        <translation>Mémoriser les stations les plus fortes</translation>
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
        <translation>Recherche…</translation>
    </message>
    <message>
        <source>Replay</source>
        <translation>En différé</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>En direct</translation>
    </message>
    <message>
        <source>Previous title</source>
        <translation>Titre précédent</translation>
    </message>
    <message>
        <source>Replay the previous title</source>
        <translation>Réécouter le titre précédent</translation>
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
        <source>Next title</source>
        <translation>Titre suivant</translation>
    </message>
    <message>
        <source>Place in what can be replayed</source>
        <translation>Position dans l’enregistrement</translation>
    </message>
</context>
<context>
    <name>StationDisplay</name>
    <message>
        <source>Searching for traffic announcements…</source>
        <translation>Recherche d’infos trafic…</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>Recherche…</translation>
    </message>
    <message>
        <source>HD lost</source>
        <translation>HD perdu</translation>
    </message>
    <message>
        <source>HD</source>
        <translation>HD</translation>
    </message>
    <message>
        <source>Stereo</source>
        <translation>Stéréo</translation>
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
        <translation>Aucune station reçue</translation>
    </message>
</context>
</TS>
