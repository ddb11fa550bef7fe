<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG">
<context>
    <name>AppsScreen</name>
    <message>
        <source>Apps</source>
        <translation>التطبيقات</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Apps</source>
        <translation>التطبيقات</translation>
    </message>
</context>
<context>
    <name>PhonePanel</name>
    <message>
        <source>No phone is projected</source>
        <translation>لا يُعرض أي هاتف</translation>
    </message>
    <message>
        <source>Your phone</source>
        <translation>هاتفك</translation>
    </message>
    <message>
        <source>On the cable</source>
        <translation>عبر الكابل</translation>
    </message>
    <message>
        <source>Without cable</source>
        <translation>لاسلكيًا</translation>
    </message>
    <message>
        <source>Connect the phone by its cable, or switch on its wireless projection near the car.</source>
        <translation>وصّل الهاتف بالكابل، أو شغّل العرض اللاسلكي فيه داخل السيارة.</translation>
    </message>
    <message>
        <source>Projection is not offered in this market.</source>
        <translation>عرض الهاتف غير متاح في هذا السوق.</translation>
    </message>
    <message>
        <source>Unplug the cable to end it.</source>
        <translation>افصل الكابل للإنهاء.</translation>
    </message>
    <message>
        <source>End it on the phone.</source>
        <translation>أنهِ العرض من الهاتف.</translation>
    </message>
    <message>
        <source>Show its screen</source>
        <translation>عرض شاشته</translation>
    </message>
</context>
<context>
    <name>ProjectionOverride</name>
    <message>
        <source>Maps</source>
        <translation>خرائط</translation>
    </message>
</context>
</TS>
