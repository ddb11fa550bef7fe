<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>The assistant is switched off</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>Switch it on in the settings of %1, then hold the voice key again.</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>Switch it on in the settings of the phone, then hold the voice key again.</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>The phone&apos;s assistant is listening</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>The phone&apos;s voice dialling is listening</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Stop</translation>
    </message>
</context>
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation>Call</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>No call</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>Dialling…</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>Back to the car</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>On the phone</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>End call</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>Heard on the phone, not in the car</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Unknown caller</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>Phone</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>No phone connected</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>Battery %1 %</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>Keypad</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>No contacts</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>An emergency call is running. The phone cannot be used.</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>Incoming call</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>Unknown caller</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>Accept</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>Reject</translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation>Keypad</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>Enter a number</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>Call</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>Delete the last digit</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>Phone</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>An emergency call is running</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>No phone is connected</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>A call is running</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>This is no telephone number</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>The assistant is switched on</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>Phone</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>Phone settings</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>Connected phone</translation>
    </message>
    <message>
        <source>None</source>
        <translation>None</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>Contacts</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>Calls on the phone&apos;s own loudspeaker</translation>
    </message>
</context>
</TS>
