<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>AnnouncementPopup</name>
    <message>
        <source>Traffic announcement</source>
        <translation>路况播报</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>AutoStoreBar</name>
    <message>
        <source>Storing the strongest stations…</source>
        <translation>正在存储信号最强的电台…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Radio</source>
        <translation>收音机</translation>
    </message>
</context>
<context>
    <name>PresetBar</name>
    <message>
        <source>Bank %1</source>
        <translation>第 %1 组</translation>
    </message>
    <message>
        <source>Bank</source>
        <translation>组</translation>
    </message>
</context>
<context>
    <name>PresetTile</name>
    <message>
        <source>Preset %1</source>
        <translation>预存电台 %1</translation>
    </message>
</context>
<context>
    <name>RadioController</name>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>Satellite</source>
        <translation>卫星</translation>
    </message>
    <message>
        <source>There is no such source</source>
        <translation>没有此音源</translation>
    </message>
    <message>
        <source>This source cannot play now</source>
        <translation>此音源当前不可用</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>当前没有播放内容</translation>
    </message>
    <message>
        <source>There is no announcement</source>
        <translation>当前没有播报</translation>
    </message>
</context>
<context>
    <name>RadioScreen</name>
    <message>
        <source>Radio</source>
        <translation>收音机</translation>
    </message>
    <message>
        <source>Sound</source>
        <translation>声音</translation>
    </message>
    <message>
        <source>Stations</source>
        <translation>电台</translation>
    </message>
    <message>
        <source>Seek down</source>
        <translation>向下搜台</translation>
    </message>
    <message>
        <source>Seek up</source>
        <translation>向上搜台</translation>
    </message>
    <message>
        <source>Traffic announcements</source>
        <translation>路况播报</translation>
    </message>
    <message>
        <source>Store the strongest stations</source>
        <translation>存储信号最强的电台</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>音源</translation>
    </message>
</context>
<context>
    <name>SatelliteDisplay</name>
    <message>
        <source>Searching…</source>
        <translation>正在搜索…</translation>
    </message>
    <message>
        <source>Replay</source>
        <translation>回放</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>直播</translation>
    </message>
    <message>
        <source>Previous title</source>
        <translation>上一首</translation>
    </message>
    <message>
        <source>Replay the previous title</source>
        <translation>重听上一首</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>暂停</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>播放</translation>
    </message>
    <message>
        <source>Next title</source>
        <translation>下一首</translation>
    </message>
    <message>
        <source>Place in what can be replayed</source>
        <translation>回放位置</translation>
    </message>
</context>
<context>
    <name>StationDisplay</name>
    <message>
        <source>Searching for traffic announcements…</source>
        <translation>正在搜索路况播报…</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>正在搜索…</translation>
    </message>
    <message>
        <source>HD lost</source>
        <translation>HD 中断</translation>
    </message>
    <message>
        <source>HD</source>
        <translation>HD</translation>
    </message>
    <message>
        <source>Stereo</source>
        <translation>立体声</translation>
    </message>
    <message>
        <source>TA</source>
        <translation>TA</translation>
    </message>
</context>
<context>
    <name>StationsScreen</name>
    <message>
        <source>Stations</source>
        <translation>电台</translation>
    </message>
    <message>
        <source>No stations can be received</source>
        <translation>接收不到电台</translation>
    </message>
</context>
</TS>
