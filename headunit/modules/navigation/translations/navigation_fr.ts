<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>DestinationsScreen</name>
    <message>
        <source>Destinations</source>
        <translation>Destinations</translation>
    </message>
</context>
<context>
    <name>GuidancePanel</name>
    <message>
        <source>Arrival %1</source>
        <translation>Arrivée %1</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pause</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>Démonstration</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>Itinéraire</translation>
    </message>
    <message>
        <source>End</source>
        <translation>Arrêter</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>Partir</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>Continuer tout droit</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>Serrer à gauche</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>Serrer à droite</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>Tourner à gauche</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>Tourner à droite</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>Tourner franchement à gauche</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>Tourner franchement à droite</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>Faire demi-tour</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>Vous êtes arrivé</translation>
    </message>
</context>
<context>
    <name>MapScreen</name>
    <message>
        <source>Navigation</source>
        <translation>Navigation</translation>
    </message>
    <message>
        <source>Back to the vehicle</source>
        <translation>Revenir au véhicule</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Agrandir</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Réduire</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Navigation</source>
        <translation>Navigation</translation>
    </message>
</context>
<context>
    <name>NavigationSettings</name>
    <message>
        <source>Navigation</source>
        <translation>Navigation</translation>
    </message>
</context>
<context>
    <name>NavigationSettingsScreen</name>
    <message>
        <source>Navigation settings</source>
        <translation>Réglages de navigation</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>Éviter les autoroutes</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>Virages sur les autres écrans</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>Ce lieu n’est pas sur la carte</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>Il n’y a pas de destination</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>Tous les lieux</translation>
    </message>
    <message>
        <source>Work</source>
        <translation>Travail</translation>
    </message>
    <message>
        <source>Fuel</source>
        <translation>Carburant</translation>
    </message>
    <message>
        <source>Charging</source>
        <translation>Recharge</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>Parking</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>Restaurants</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>À voir</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>Santé</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>Train et ferry</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>Domicile</translation>
    </message>
</context>
<context>
    <name>RouteScreen</name>
    <message>
        <source>Route</source>
        <translation>Itinéraire</translation>
    </message>
    <message>
        <source>No destination</source>
        <translation>Aucune destination</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>Où aller ?</translation>
    </message>
</context>
</TS>
