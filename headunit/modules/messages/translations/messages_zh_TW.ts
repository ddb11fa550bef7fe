<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>未接來電</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>車輛</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>路面可能結冰，請小心駕駛。</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>手機電量即將耗盡。</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>未知寄件者</translation>
    </message>
</context>
<context>
    <name>MessageCenter</name>
    <message>
        <source>I am on my way.</source>
        <translation>我在路上。</translation>
    </message>
    <message>
        <source>All right.</source>
        <translation>好的。</translation>
    </message>
    <message>
        <source>No, sorry.</source>
        <translation>抱歉，不行。</translation>
    </message>
    <message>
        <source>There is nothing in this message</source>
        <translation>這則訊息是空的</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>我在開車，稍後回電。</translation>
    </message>
</context>
<context>
    <name>MessageScreen</name>
    <message>
        <source>Message</source>
        <translation>訊息</translation>
    </message>
    <message>
        <source>No message is open</source>
        <translation>沒有開啟的訊息</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>已回覆：%1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>回撥</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>導航前往</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
</context>
<context>
    <name>MessagesScreen</name>
    <message>
        <source>Messages</source>
        <translation>訊息</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>沒有訊息</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>簡訊、未接來電和車輛通知會顯示在這裡。</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Messages</source>
        <translation>訊息</translation>
    </message>
</context>
</TS>
