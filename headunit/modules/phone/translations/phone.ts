<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1">
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No call</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>End call</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Accept</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reject</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Call</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>None</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
