<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>AppsScreen</name>
    <message>
        <source>Apps</source>
        <translation>应用</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Apps</source>
        <translation>应用</translation>
    </message>
</context>
<context>
    <name>PhonePanel</name>
    <message>
        <source>No phone is projected</source>
        <translation>没有手机投屏</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>您的手机</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>有线</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>无线</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>请用数据线连接手机，或在车内开启手机的无线投屏。</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>本市场不提供手机投屏。</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>拔下数据线即可结束。</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>请在手机上结束。</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>显示其屏幕</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>地图</translation>
    </message>
</context>
</TS>
