<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>语音助手已关闭</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>请在 %1 的设置中开启，然后再次按住语音键。</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>请在手机设置中开启，然后再次按住语音键。</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>手机助手正在聆听</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>手机语音拨号正在聆听</translation>
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
        <translation>通话</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>无通话</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>正在拨号…</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>切换到车内</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>切换到手机</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>挂断</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>声音来自手机，不在车内播放</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>未知来电</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>电话</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>未连接手机</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>电量 %1%</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>拨号键盘</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>没有联系人</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>紧急呼叫进行中，电话无法使用。</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>来电</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>未知来电</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>接听</translation>
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
        <translation>拨号键盘</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>请输入号码</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>拨打</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>删除最后一位</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>电话</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>紧急呼叫进行中</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>未连接手机</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>正在通话</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>这不是有效的电话号码</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>语音助手已开启</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>电话</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>电话设置</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>已连接的手机</translation>
    </message>
    <message>
        <source>None</source>
        <translation>无</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>联系人</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>用手机扬声器通话</translation>
    </message>
</context>
</TS>
