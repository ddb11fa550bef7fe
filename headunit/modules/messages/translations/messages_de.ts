<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>Verpasster Anruf</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>Fahrzeug</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>Die Straße kann glatt sein. Fahren Sie vorsichtig.</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>Der Akku des Telefons ist fast leer.</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>Unbekannter Absender</translation>
    </message>
</context>
<context>
    <name>MessageCenter</name>
    <message>
        <source>I am on my way.</source>
        <translation>Ich bin unterwegs.</translation>
    </message>
    <message>
        <source>All right.</source>
        <translation>In Ordnung.</translation>
    </message>
    <message>
        <source>No, sorry.</source>
        <translation>Leider nein.</translation>
    </message>
    <message>
        <source>There is nothing in this message</source>
        <translation>Diese Nachricht ist leer</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>Ich fahre, rufe später an.</translation>
    </message>
</context>
<context>
    <name>MessageScreen</name>
    <message>
        <source>Message</source>
        <translation>Nachricht</translation>
    </message>
    <message>
        <source>No message is open</source>
        <translation>Keine Nachricht ist geöffnet</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>Geantwortet: %1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>Zurückrufen</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>Dorthin fahren</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
</context>
<context>
    <name>MessagesScreen</name>
    <message>
        <source>Messages</source>
        <translation>Nachrichten</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>Keine Nachrichten</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>Hier stehen Texte, verpasste Anrufe und Hinweise des Fahrzeugs.</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Messages</source>
        <translation>Nachrichten</translation>
    </message>
</context>
</TS>
