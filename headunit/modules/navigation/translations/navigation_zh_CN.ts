<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
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
        <translation>%1 到达</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>暂停</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>演示</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>路线</translation>
    </message>
    <message>
        <source>End</source>
        <translation>结束</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>出发</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>直行</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>靠左行驶</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>靠右行驶</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>左转</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>右转</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>向左急转</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>向右急转</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>掉头</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>到达目的地</translation>
    </message>
</context>
<context>
    <name>MapScreen</name>
    <message>
        <source>Navigation</source>
        <translation>导航</translation>
    </message>
    <message>
        <source>Back to the vehicle</source>
        <translation>回到车辆</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>放大</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>缩小</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Navigation</source>
        <translation>导航</translation>
    </message>
</context>
<context>
    <name>NavigationSettings</name>
    <message>
        <source>Navigation</source>
        <translation>导航</translation>
    </message>
</context>
<context>
    <name>NavigationSettingsScreen</name>
    <message>
        <source>Navigation settings</source>
        <translation>导航设置</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>避开高速公路</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>在其他界面显示转弯提示</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>地图上没有这个地点</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>没有目的地</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>全部地点</translation>
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
        <translation>充电站</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>停车场</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>餐饮</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>景点</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>医疗</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>火车与渡轮</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>家</translation>
    </message>
</context>
<context>
    <name>RouteScreen</name>
    <message>
        <source>Route</source>
        <translation>路线</translation>
    </message>
    <message>
        <source>No destination</source>
        <translation>没有目的地</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>去哪里？</translation>
    </message>
</context>
</TS>
