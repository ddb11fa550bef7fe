<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>未接来电</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>车辆</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>路面可能结冰，请小心驾驶。</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>手机电量即将耗尽。</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>未知发件人</translation>
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
        <translation>这条消息是空的</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>我在开车，稍后回电。</translation>
    </message>
</context>
<context>
    <name>MessageScreen</name>
    <message>
        <source>Message</source>
        <translation>消息</translation>
    </message>
    <message>
        <source>No message is open</source>
        <translation>没有打开的消息</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>已回复：%1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>回拨</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>导航前往</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
</context>
<context>
    <name>MessagesScreen</name>
    <message>
        <source>Messages</source>
        <translation>消息</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>没有消息</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>短信、未接来电和车辆通知会显示在这里。</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Messages</source>
        <translation>消息</translation>
    </message>
</context>
</TS>
