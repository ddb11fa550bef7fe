<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG">
<context>
    <name>Message</name>
    <message>
        <source>Missed call</source>
        <translation>مكالمة فائتة</translation>
    </message>
    <message>
        <source>Vehicle</source>
        <translation>السيارة</translation>
    </message>
    <message>
        <source>The road may be icy. Drive with care.</source>
        <translation>قد يكون الطريق متجمدًا. قُد بحذر.</translation>
    </message>
    <message>
        <source>The battery of the phone is nearly empty.</source>
        <translation>بطارية الهاتف على وشك النفاد.</translation>
    </message>
    <message>
        <source>Unknown sender</source>
        <translation>مرسل غير معروف</translation>
    </message>
</context>
<context>
    <name>MessageCenter</name>
    <message>
        <source>I am on my way.</source>
        <translation>أنا في الطريق.</translation>
    </message>
    <message>
        <source>All right.</source>
        <translation>حسنًا.</translation>
    </message>
    <message>
        <source>No, sorry.</source>
        <translation>لا، عذرًا.</translation>
    </message>
    <message>
        <source>There is nothing in this message</source>
        <translation>هذه الرسالة فارغة</translation>
    </message>
    <message>
        <source>I am driving, call you later.</source>
        <translation>أنا أقود، سأتصل لاحقًا.</translation>
    </message>
</context>
<context>
    <name>MessageScreen</name>
    <message>
        <source>Message</source>
        <translation>رسالة</translation>
    </message>
    <message>
        <source>No message is open</source>
        <translation>لا توجد رسالة مفتوحة</translation>
    </message>
    <message>
        <source>Answered: %1</source>
        <translation>الرد: %1</translation>
    </message>
    <message>
        <source>Call back</source>
        <translation>معاودة الاتصال</translation>
    </message>
    <message>
        <source>Drive there</source>
        <translation>القيادة إلى هناك</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>حذف</translation>
    </message>
</context>
<context>
    <name>MessagesScreen</name>
    <message>
        <source>Messages</source>
        <translation>الرسائل</translation>
    </message>
    <message>
        <source>No messages</source>
        <translation>لا توجد رسائل</translation>
    </message>
    <message>
        <source>Texts, missed calls and notices of the vehicle come here.</source>
        <translation>تصل إلى هنا الرسائل والمكالمات الفائتة وتنبيهات السيارة.</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Messages</source>
        <translation>الرسائل</translation>
    </message>
</context>
</TS>
