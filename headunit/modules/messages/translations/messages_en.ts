<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>Missed call</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>Vehicle</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>The road may be icy. Drive with care.</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>The battery of the phone is nearly empty.</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>Unknown sender</translation>
    </message>
</context>
<context>
    <name>MessageCenter</name>
    <message>
        <source>I am on my way.</source>
        <translation>I am on my way.</translation>
    </message>
    <message>
        <source>All right.</source>
        <translation>All right.</translation>
    </message>
    <message>
        <source>No, sorry.</source>
        <translation>No, sorry.</translation>
    </message>
    <message>
        <source>There is nothing in this message</source>
        <translation>There is nothing in this message</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>I am driving, call you later.</translation>
    </message>
</context>
<context>
    <name>MessageScreen</name>
    <message>
        <source>Message</source>
        <translation>Message</translation>
    </message>
    <message>
        <source>No message is open</source>
        <translation>No message is open</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>Answered: %1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>Call back</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>Drive there</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
</context>
<context>
    <name>MessagesScreen</name>
    <message>
        <source>Messages</source>
        <translation>Messages</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>No messages</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>Texts, missed calls and notices of the vehicle come here.</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Messages</source>
        <translation>Messages</translation>
    </message>
</context>
</TS>
