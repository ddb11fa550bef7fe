<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>DiscScreen</name>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>正在读取光盘…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>无光盘</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>曲目 %1</translation>
    </message>
</context>
<context>
    <name>LibraryScreen</name>
    <message>
        <source>Library</source>
        <translation>媒体库</translation>
    </message>
    <message>
        <source>Titles</source>
        <translation>歌曲</translation>
    </message>
    <message>
        <source>Artists</source>
        <translation>艺人</translation>
    </message>
    <message>
        <source>Albums</source>
        <translation>专辑</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>没有音乐</translation>
    </message>
</context>
<context>
    <name>MediaController</name>
    <message>
        <source>Player</source>
        <translation>播放器</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>手机</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>曲目 %1</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>正在手机上播放</translation>
    </message>
    <message>
        <source>Track %1 of %2</source>
        <translation>第 %1 首，共 %2 首</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>正在读取光盘…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>无光盘</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>没有手机正在投屏</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>没有音乐</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>当前没有播放内容</translation>
    </message>
    <message>
        <source>No player is heard</source>
        <translation>没有正在使用的媒体音源</translation>
    </message>
    <message>
        <source>There is nothing to resume</source>
        <translation>没有可继续播放的内容</translation>
    </message>
</context>
<context>
    <name>MediaScreen</name>
    <message>
        <source>Media</source>
        <translation>媒体</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>曲目</translation>
    </message>
    <message>
        <source>Library</source>
        <translation>媒体库</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>音源</translation>
    </message>
    <message>
        <source>Insert a disc to play it.</source>
        <translation>请插入光盘进行播放。</translation>
    </message>
    <message>
        <source>Position in the track</source>
        <translation>播放位置</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Media</source>
        <translation>媒体</translation>
    </message>
</context>
<context>
    <name>TransportKeys</name>
    <message>
        <source>Previous</source>
        <translation>上一首</translation>
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
        <source>Next</source>
        <translation>下一首</translation>
    </message>
</context>
</TS>
