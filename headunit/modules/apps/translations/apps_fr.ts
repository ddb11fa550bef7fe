<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>AppsScreen</name>
    <message>
        <source>Apps</source>
        <translation>Applis</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Apps</source>
        <translation>Applis</translation>
    </message>
</context>
<context>
    <name>PhonePanel</name>
    <message>
        <source>No phone is projected</source>
        <translation>Aucun téléphone projeté</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>Votre téléphone</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>Par câble</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>Sans câble</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>Branchez le téléphone avec son câble ou activez sa projection sans fil dans la voiture.</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>La projection n’est pas proposée dans ce pays.</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>Débranchez le câble pour arrêter.</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>Arrêtez-la sur le téléphone.</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>Afficher son écran</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>Cartes</translation>
    </message>
</context>
</TS>
