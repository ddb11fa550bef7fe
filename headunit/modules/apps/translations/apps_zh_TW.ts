<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
<context>
    <name>AppsScreen</name>
    <message>
        <source>Apps</source>
        <translation>應用程式</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Apps</source>
        <translation>應用程式</translation>
    </message>
</context>
<context>
    <name>PhonePanel</name>
    <message>
        <source>No phone is projected</source>
        <translation>沒有手機投影</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>您的手機</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>有線</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>無線</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>請用傳輸線連接手機，或在車內開啟手機的無線投影。</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>此市場不提供手機投影。</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>拔下傳輸線即可結束。</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>請在手機上結束。</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>顯示其畫面</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>地圖</translation>
    </message>
</context>
</TS>
