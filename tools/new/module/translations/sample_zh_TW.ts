<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
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
        <translation>已計數：%1</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>計數</translation>
    </message>
</context>
</TS>
