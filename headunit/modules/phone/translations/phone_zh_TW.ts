<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>語音助理已關閉</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>請在 %1 的設定中開啟，然後再次按住語音鍵。</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>請在手機設定中開啟，然後再次按住語音鍵。</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>手機助理正在聆聽</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>手機語音撥號正在聆聽</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>停止</translation>
    </message>
</context>
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation>通話</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>無通話</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>正在撥號…</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>切換至車內</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>切換至手機</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>掛斷</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>聲音由手機播放，不在車內播放</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>未知來電</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>電話</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>未連接手機</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>電量 %1%</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>撥號鍵盤</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>沒有聯絡人</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>緊急通話進行中，電話無法使用。</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>來電</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>未知來電</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>接聽</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>拒接</translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation>撥號鍵盤</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>請輸入號碼</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>撥打</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>刪除最後一位</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>電話</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>緊急通話進行中</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>未連接手機</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>通話中</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>這不是有效的電話號碼</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>語音助理已開啟</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>電話</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>電話設定</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>已連接的手機</translation>
    </message>
    <message>
        <source>None</source>
        <translation>無</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>聯絡人</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>以手機揚聲器通話</translation>
    </message>
</context>
</TS>
