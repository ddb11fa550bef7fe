<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>Der Assistent ist ausgeschaltet</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>In den Einstellungen von %1 einschalten, dann die Sprachtaste erneut gedrückt halten.</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>In den Einstellungen des Telefons einschalten, dann die Sprachtaste erneut gedrückt halten.</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>Der Assistent des Telefons hört zu</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>Die Sprachwahl des Telefons hört zu</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Stopp</translation>
    </message>
</context>
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation>Anruf</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>Kein Anruf</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Wird gewählt …</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>Über das Auto</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>Über das Telefon</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>Auflegen</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>Ton am Telefon, nicht im Auto</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Unbekannter Anrufer</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>Kein Telefon verbunden</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>Akku %1&#xa0;%</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>Tastenfeld</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>Keine Kontakte</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>Ein Notruf läuft. Das Telefon kann nicht benutzt werden.</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>Eingehender Anruf</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Unbekannter Anrufer</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>Annehmen</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>Ablehnen</translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation>Tastenfeld</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>Nummer eingeben</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Anrufen</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>Letzte Ziffer löschen</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>Ein Notruf läuft</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>Kein Telefon verbunden</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>Ein Anruf läuft</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>Das ist keine Telefonnummer</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>Der Assistent ist eingeschaltet</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>Telefon</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>Telefoneinstellungen</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>Verbundenes Telefon</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Keines</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>Kontakte</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>Anrufe über den Lautsprecher des Telefons</translation>
    </message>
</context>
</TS>
