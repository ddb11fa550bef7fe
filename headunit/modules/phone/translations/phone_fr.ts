<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>L’assistant est désactivé</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>Activez-le dans les réglages de %1, puis maintenez à nouveau la touche vocale enfoncée.</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>Activez-le dans les réglages du téléphone, puis maintenez à nouveau la touche vocale enfoncée.</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>L’assistant du téléphone écoute</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>La numérotation vocale du téléphone écoute</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Arrêter</translation>
    </message>
</context>
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation>Appel</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>Aucun appel</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Numérotation…</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>Sur la voiture</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>Sur le téléphone</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>Raccrocher</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>Son sur le téléphone, pas dans la voiture</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Appelant inconnu</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>Téléphone</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>Aucun téléphone connecté</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>Batterie&#xa0;: %1&#xa0;%</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>Clavier</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>Aucun contact</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>Appel d’urgence en cours. Le téléphone est indisponible.</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>Appel entrant</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Appelant inconnu</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>Répondre</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>Refuser</translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation>Clavier</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>Saisissez un numéro</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Appeler</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>Effacer le dernier chiffre</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>Téléphone</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>Appel d’urgence en cours</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>Aucun téléphone connecté</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>Appel en cours</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>Ce n’est pas un numéro de téléphone</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>L’assistant est activé</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>Téléphone</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>Réglages du téléphone</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>Téléphone connecté</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Aucun</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>Contacts</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>Appels sur le haut-parleur du téléphone</translation>
    </message>
</context>
</TS>
