<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
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
        <translation>Counted: %1</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Count</translation>
    </message>
</context>
</TS>
