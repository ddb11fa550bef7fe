<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar">
<context>
    <name>DiscScreen</name>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>جارٍ قراءة القرص…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>لا يوجد قرص</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>المقطع %1</translation>
    </message>
</context>
<context>
    <name>LibraryScreen</name>
    <message>
        <source>Library</source>
        <translation>المكتبة</translation>
    </message>
    <message>
        <source>Titles</source>
        <translation>المقاطع</translation>
    </message>
    <message>
        <source>Artists</source>
        <translation>الفنانون</translation>
    </message>
    <message>
        <source>Albums</source>
        <translation>الألبومات</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>لا توجد موسيقى</translation>
    </message>
</context>
<context>
    <name>MediaController</name>
    <message>
        <source>Player</source>
        <translation>المشغّل</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>الهاتف</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>المقطع %1</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>التشغيل على الهاتف</translation>
    </message>
    <message>
        <source>Track %1 of %2</source>
        <translation>المقطع %1 من %2</translation>
    </message>
    <message>
        <source>Reading the disc…</source>
        <translation>جارٍ قراءة القرص…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>لا يوجد قرص</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>لا يوجد هاتف معروض</translation>
    </message>
    <message>
        <source>No music</source>
        <translation>لا توجد موسيقى</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>لا يوجد تشغيل حاليًا</translation>
    </message>
    <message>
        <source>No player is heard</source>
        <translation>لا يوجد مصدر وسائط نشط</translation>
    </message>
    <message>
        <source>There is nothing to resume</source>
        <translation>لا يوجد ما يمكن استئنافه</translation>
    </message>
</context>
<context>
    <name>MediaScreen</name>
    <message>
        <source>Media</source>
        <translation>الوسائط</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>المقاطع</translation>
    </message>
    <message>
        <source>Library</source>
        <translation>المكتبة</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>المصادر</translation>
    </message>
    <message>
        <source>Insert a disc to play it.</source>
        <translation>أدخل قرصًا لتشغيله.</translation>
    </message>
    <message>
        <source>Position in the track</source>
        <translation>الموضع في المقطع</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Media</source>
        <translation>الوسائط</translation>
    </message>
</context>
<context>
    <name>TransportKeys</name>
    <message>
        <source>Previous</source>
        <translation>المقطع السابق</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>إيقاف مؤقت</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>تشغيل</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>المقطع التالي</translation>
    </message>
</context>
</TS>
