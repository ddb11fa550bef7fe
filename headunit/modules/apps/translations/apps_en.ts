<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
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
        <translation>No phone is projected</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>Your phone</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>On the cable</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>Without cable</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>Connect the phone by its cable, or switch on its wireless projection near the car.</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>Projection is not offered in this market.</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>Unplug the cable to end it.</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>End it on the phone.</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>Show its screen</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>Maps</translation>
    </message>
</context>
</TS>
