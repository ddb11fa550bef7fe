<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar">
<context>
    <name>AnnouncementPopup</name>
    <message>
        <source>Traffic announcement</source>
        <translation>إعلان مروري</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
</context>
<context>
    <name>AutoStoreBar</name>
    <message>
        <source>Storing the strongest stations…</source>
        <translation>جارٍ حفظ أقوى المحطات…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Radio</source>
        <translation>الراديو</translation>
    </message>
</context>
<context>
    <name>PresetBar</name>
    <message>
        <source>Bank %1</source>
        <translation>المجموعة %1</translation>
    </message>
    <message>
        <source>Bank</source>
        <translation>مجموعة</translation>
    </message>
</context>
<context>
    <name>PresetTile</name>
    <message>
        <source>Preset %1</source>
        <translation>المحطة المحفوظة %1</translation>
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
        <translation>قمر صناعي</translation>
    </message>
    <message>
        <source>There is no such source</source>
        <translation>هذا المصدر غير موجود</translation>
    </message>
    <message>
        <source>This source cannot play now</source>
        <translation>هذا المصدر غير متاح الآن</translation>
    </message>
    <message>
        <source>Nothing plays</source>
        <translation>لا يوجد تشغيل حاليًا</translation>
    </message>
    <message>
        <source>There is no announcement</source>
        <translation>لا يوجد إعلان حاليًا</translation>
    </message>
</context>
<context>
    <name>RadioScreen</name>
    <message>
        <source>Radio</source>
        <translation>الراديو</translation>
    </message>
    <message>
        <source>Sound</source>
        <translation>الصوت</translation>
    </message>
    <message>
        <source>Stations</source>
        <translation>المحطات</translation>
    </message>
    <message>
        <source>Seek down</source>
        <translation>البحث للأسفل</translation>
    </message>
    <message>
        <source>Seek up</source>
        <translation>البحث للأعلى</translation>
    </message>
    <message>
        <source>Traffic announcements</source>
        <translation>الإعلانات المرورية</translation>
    </message>
    <message>
        <source>Store the strongest stations</source>
        <translation>حفظ أقوى المحطات</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>المصادر</translation>
    </message>
</context>
<context>
    <name>SatelliteDisplay</name>
    <message>
        <source>Searching…</source>
        <translation>جارٍ البحث…</translation>
    </message>
    <message>
        <source>Replay</source>
        <translation>إعادة</translation>
    </message>
    <message>
        <source>Live</source>
        <translation>مباشر</translation>
    </message>
    <message>
        <source>Previous title</source>
        <translation>المقطع السابق</translation>
    </message>
    <message>
        <source>Replay the previous title</source>
        <translation>إعادة المقطع السابق</translation>
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
        <source>Next title</source>
        <translation>المقطع التالي</translation>
    </message>
    <message>
        <source>Place in what can be replayed</source>
        <translation>الموضع في التسجيل</translation>
    </message>
</context>
<context>
    <name>StationDisplay</name>
    <message>
        <source>Searching for traffic announcements…</source>
        <translation>جارٍ البحث عن إعلانات مرورية…</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>جارٍ البحث…</translation>
    </message>
    <message>
        <source>HD lost</source>
        <translation>لا إشارة HD</translation>
    </message>
    <message>
        <source>HD</source>
        <translation>HD</translation>
    </message>
    <message>
        <source>Stereo</source>
        <translation>ستيريو</translation>
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
        <translation>المحطات</translation>
    </message>
    <message>
        <source>No stations can be received</source>
        <translation>لا يمكن استقبال أي محطة</translation>
    </message>
</context>
</TS>
