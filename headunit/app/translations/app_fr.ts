<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>AudioSources</name>
    <message>
        <source>Reading the disc…</source>
        <translation>Chargement du disque…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>Aucun disque</translation>
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
    <message numerus="yes">
        <source>%n track(s)</source>
        <translation>
            <numerusform>%n piste</numerusform>
            <numerusform>%n pistes</numerusform>
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
        <translation>Afficher l’appel</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Numérotation…</translation>
    </message>
</context>
<context>
    <name>ConnectionTransient</name>
    <message>
        <source>Vehicle connected</source>
        <translation>Véhicule connecté</translation>
    </message>
    <message>
        <source>No connection to the vehicle</source>
        <translation>Pas de connexion avec le véhicule</translation>
    </message>
</context>
<context>
    <name>InputPanel</name>
    <message>
        <source>Nothing is typed now</source>
        <translation>Aucune saisie en cours</translation>
    </message>
</context>
<context>
    <name>Key</name>
    <message>
        <source>Shift</source>
        <translation>Majuscule</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Effacer</translation>
    </message>
    <message>
        <source>Symbols</source>
        <translation>Symboles</translation>
    </message>
    <message>
        <source>Letters</source>
        <translation>Lettres</translation>
    </message>
    <message>
        <source>Next keyboard</source>
        <translation>Clavier suivant</translation>
    </message>
    <message>
        <source>Write by hand</source>
        <translation>Écrire à la main</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Clavier</translation>
    </message>
    <message>
        <source>Hide keyboard</source>
        <translation>Masquer le clavier</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Terminé</translation>
    </message>
    <message>
        <source>Space</source>
        <translation>Espace</translation>
    </message>
</context>
<context>
    <name>Launcher</name>
    <message>
        <source>Home</source>
        <translation>Accueil</translation>
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
        <translation>Cette marque n’existe pas</translation>
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
        <translation>Lecture sur le téléphone</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>Téléphone</translation>
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
        <translation>Piste %1</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>Lecteur</translation>
    </message>
</context>
<context>
    <name>NowPlayingCard</name>
    <message>
        <source>Previous</source>
        <translation>Précédent</translation>
    </message>
    <message>
        <source>Sound on</source>
        <translation>Activer le son</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Couper le son</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Suivant</translation>
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
        <translation>Lecture</translation>
    </message>
</context>
<context>
    <name>PopupCard</name>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
</context>
<context>
    <name>ProjectionScreen</name>
    <message>
        <source>Phone screen</source>
        <translation>Écran du téléphone</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Aucun téléphone projeté</translation>
    </message>
    <message>
        <source>The phone on the cable draws here.</source>
        <translation>L’image du téléphone branché s’affiche ici.</translation>
    </message>
    <message>
        <source>The phone draws here, without cable.</source>
        <translation>L’image du téléphone s’affiche ici sans fil.</translation>
    </message>
    <message>
        <source>Call on the projected phone</source>
        <translation>Appel sur le téléphone projeté</translation>
    </message>
</context>
<context>
    <name>Rail</name>
    <message>
        <source>Home</source>
        <translation>Accueil</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Retour</translation>
    </message>
    <message>
        <source>Phone screen</source>
        <translation>Écran du téléphone</translation>
    </message>
</context>
<context>
    <name>ScrollList</name>
    <message>
        <source>More when you have stopped</source>
        <translation>La suite à l&apos;arrêt</translation>
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
        <translation>Rechercher</translation>
    </message>
    <message>
        <source>Contacts and stations</source>
        <translation>Contacts et stations</translation>
    </message>
    <message>
        <source>Nothing is called that</source>
        <translation>Aucun résultat</translation>
    </message>
    <message>
        <source>Type a name, or write it by hand</source>
        <translation>Saisissez un nom ou écrivez-le à la main</translation>
    </message>
</context>
<context>
    <name>StandbyScreen</name>
    <message>
        <source>Touch to switch on</source>
        <translation>Touchez pour allumer</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Search</source>
        <translation>Rechercher</translation>
    </message>
</context>
<context>
    <name>SystemScreens</name>
    <message>
        <source>The head unit is switched off</source>
        <translation>Le système est éteint</translation>
    </message>
    <message>
        <source>Valet mode is on already</source>
        <translation>Le mode voiturier est déjà actif</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>Aucun téléphone projeté</translation>
    </message>
    <message>
        <source>This is not possible now</source>
        <translation>Impossible pour le moment</translation>
    </message>
</context>
<context>
    <name>TextField</name>
    <message>
        <source>Clear</source>
        <translation>Vider</translation>
    </message>
    <message>
        <source>Not while driving</source>
        <translation>Pas en conduisant</translation>
    </message>
</context>
<context>
    <name>TurnChip</name>
    <message>
        <source>Show the map</source>
        <translation>Afficher la carte</translation>
    </message>
</context>
<context>
    <name>TurnHint</name>
    <message>
        <source>There is no turn to show</source>
        <translation>Il n’y a pas de virage à afficher</translation>
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
        <translation>Mode voiturier</translation>
    </message>
    <message>
        <source>Personal data is hidden and the volume keys are locked.</source>
        <translation>Les données personnelles sont masquées et les touches de volume verrouillées.</translation>
    </message>
    <message>
        <source>Leave valet mode</source>
        <translation>Quitter le mode voiturier</translation>
    </message>
</context>
<context>
    <name>VoicePopup</name>
    <message>
        <source>Voice control</source>
        <translation>Commande vocale</translation>
    </message>
    <message>
        <source>Spoken message</source>
        <translation>Message vocal</translation>
    </message>
    <message>
        <source>Voice control is not ready</source>
        <translation>Commande vocale indisponible</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Étape %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Arrêter</translation>
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
        <translation>Volume de la voix</translation>
    </message>
</context>
<context>
    <name>WritingPad</name>
    <message>
        <source>Write here</source>
        <translation>Écrivez ici</translation>
    </message>
</context>
</TS>
