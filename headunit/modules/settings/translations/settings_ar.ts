<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar">
<context>
    <name>AboutScreen</name>
    <message>
        <source>About</source>
        <translation>حول النظام</translation>
    </message>
    <message>
        <source>Head unit</source>
        <translation>نظام المعلومات والترفيه</translation>
    </message>
    <message>
        <source>Qt</source>
        <translation>Qt</translation>
    </message>
    <message>
        <source>Modules</source>
        <translation>الوحدات</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>السيارة</translation>
    </message>
    <message>
        <source>Connected</source>
        <translation>متصلة</translation>
    </message>
    <message>
        <source>Not connected</source>
        <translation>غير متصلة</translation>
    </message>
</context>
<context>
    <name>DisplayScreen</name>
    <message>
        <source>Display</source>
        <translation>الشاشة</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>تلقائي</translation>
    </message>
    <message>
        <source>As the light outside asks for</source>
        <translation>حسب الإضاءة الخارجية</translation>
    </message>
    <message>
        <source>Day</source>
        <translation>نهاري</translation>
    </message>
    <message>
        <source>Always bright</source>
        <translation>فاتح دائمًا</translation>
    </message>
    <message>
        <source>Night</source>
        <translation>ليلي</translation>
    </message>
    <message>
        <source>Always dark</source>
        <translation>داكن دائمًا</translation>
    </message>
</context>
<context>
    <name>LanguageScreen</name>
    <message>
        <source>Language</source>
        <translation>اللغة</translation>
    </message>
    <message>
        <source>The language of the vehicle is not offered here. This one is used instead.</source>
        <translation>لغة السيارة غير متاحة هنا. تُستخدم هذه اللغة بدلًا منها.</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Settings</source>
        <translation>الإعدادات</translation>
    </message>
</context>
<context>
    <name>SettingsModule</name>
    <message>
        <source>Display</source>
        <translation>الشاشة</translation>
    </message>
    <message>
        <source>About</source>
        <translation>حول النظام</translation>
    </message>
    <message>
        <source>Sound</source>
        <translation>الصوت</translation>
    </message>
    <message>
        <source>Darken the display</source>
        <translation>إطفاء الشاشة</translation>
    </message>
    <message>
        <source>Valet mode</source>
        <translation>وضع صف السيارات</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>اللغة</translation>
    </message>
</context>
<context>
    <name>SettingsScreen</name>
    <message>
        <source>Settings</source>
        <translation>الإعدادات</translation>
    </message>
</context>
<context>
    <name>SoundScreen</name>
    <message>
        <source>Sound</source>
        <translation>الصوت</translation>
    </message>
    <message>
        <source>Volume</source>
        <translation>مستوى الصوت</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>كتم الصوت</translation>
    </message>
</context>
</TS>
