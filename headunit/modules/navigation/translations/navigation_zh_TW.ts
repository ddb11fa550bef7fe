<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
<context>
    <name>DestinationsScreen</name>
    <message>
        <source>Destinations</source>
        <translation>目的地</translation>
    </message>
</context>
<context>
    <name>GuidancePanel</name>
    <message>
        <source>Arrival %1</source>
        <translation>%1 抵達</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>暫停</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>示範</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>路線</translation>
    </message>
    <message>
        <source>End</source>
        <translation>結束</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>出發</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>直行</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>靠左行駛</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>靠右行駛</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>左轉</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>右轉</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>向左急轉</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>向右急轉</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>迴轉</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>抵達目的地</translation>
    </message>
</context>
<context>
    <name>MapScreen</name>
    <message>
        <source>Navigation</source>
        <translation>導航</translation>
    </message>
    <message>
        <source>Back to the vehicle</source>
        <translation>回到車輛</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>放大</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>縮小</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Navigation</source>
        <translation>導航</translation>
    </message>
</context>
<context>
    <name>NavigationSettings</name>
    <message>
        <source>Navigation</source>
        <translation>導航</translation>
    </message>
</context>
<context>
    <name>NavigationSettingsScreen</name>
    <message>
        <source>Navigation settings</source>
        <translation>導航設定</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>避開高速公路</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>在其他畫面顯示轉彎提示</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>地圖上沒有這個地點</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>沒有目的地</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>全部地點</translation>
    </message>
    <message>
        <source>Work</source>
        <translation>公司</translation>
    </message>
    <message>
        <source>Fuel</source>
        <translation>加油站</translation>
    </message>
    <message>
        <source>Charging</source>
        <translation>充電站</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>停車場</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>餐飲</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>景點</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>醫療</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>火車與渡輪</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>住家</translation>
    </message>
</context>
<context>
    <name>RouteScreen</name>
    <message>
        <source>Route</source>
        <translation>路線</translation>
    </message>
    <message>
        <source>No destination</source>
        <translation>沒有目的地</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>去哪裡？</translation>
    </message>
</context>
</TS>
