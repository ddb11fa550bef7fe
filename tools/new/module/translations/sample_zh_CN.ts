<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>Modules</name>
    <message>
        <source>Sample</source>
        <translation>Sample</translation>
    </message>
</context>
<context>
    <name>SampleScreen</name>
    <message>
        <source>Sample</source>
        <translation>Sample</translation>
    </message>
    <message>
        <source>Counted: %1</source>
        <translation>已计数：%1</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>计数</translation>
    </message>
</context>
</TS>
