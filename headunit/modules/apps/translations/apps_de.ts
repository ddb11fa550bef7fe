<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>AppsScreen</name>
    <message>
        <source>Apps</source>
        <translation>Apps</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Apps</source>
        <translation>Apps</translation>
    </message>
</context>
<context>
    <name>PhonePanel</name>
    <message>
        <source>No phone is projected</source>
        <translation>Kein Telefon wird gespiegelt</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>Ihr Telefon</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>Am Kabel</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>Ohne Kabel</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>Schließen Sie das Telefon mit dem Kabel an, oder schalten Sie seine drahtlose Spiegelung im Auto ein.</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>Die Spiegelung wird in diesem Markt nicht angeboten.</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>Zum Beenden das Kabel abziehen.</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>Am Telefon beenden.</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>Bildschirm zeigen</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>Karten</translation>
    </message>
</context>
</TS>
