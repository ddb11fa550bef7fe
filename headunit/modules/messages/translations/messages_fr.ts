<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>Appel manqué</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>Véhicule</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>La route peut être verglacée. Conduisez prudemment.</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>La batterie du téléphone est presque vide.</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>Expéditeur inconnu</translation>
    </message>
</context>
<context>
    <name>MessageCenter</name>
    <message>
        <source>I am on my way.</source>
        <translation>Je suis en route.</translation>
    </message>
    <message>
        <source>All right.</source>
        <translation>D’accord.</translation>
    </message>
    <message>
        <source>No, sorry.</source>
        <translation>Désolé, non.</translation>
    </message>
    <message>
        <source>There is nothing in this message</source>
        <translation>Ce message est vide</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>Je conduis, je rappelle.</translation>
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
        <translation>Aucun message n’est ouvert</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>Réponse : %1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>Rappeler</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>S’y rendre</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
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
        <translation>Aucun message</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>Les textes, les appels manqués et les avis du véhicule arrivent ici.</translation>
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
