<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar">
<context>
    <name>AudioSources</name>
    <message>
        <source>Reading the disc…</source>
        <translation>جارٍ قراءة القرص…</translation>
    </message>
    <message>
        <source>No disc</source>
        <translation>لا يوجد قرص</translation>
    </message>
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
    <message numerus="yes">
        <source>%n track(s)</source>
        <translation>
            <numerusform>لا توجد مقاطع</numerusform>
            <numerusform>مقطع واحد</numerusform>
            <numerusform>مقطعان</numerusform>
            <numerusform>%n مقاطع</numerusform>
            <numerusform>%n مقطعًا</numerusform>
            <numerusform>%n مقطع</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AudioSourcesPopup</name>
    <message>
        <source>Sources</source>
        <translation>المصادر</translation>
    </message>
</context>
<context>
    <name>CallChip</name>
    <message>
        <source>Show the call</source>
        <translation>عرض المكالمة</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>جارٍ الاتصال…</translation>
    </message>
</context>
<context>
    <name>ConnectionTransient</name>
    <message>
        <source>Vehicle connected</source>
        <translation>السيارة متصلة</translation>
    </message>
    <message>
        <source>No connection to the vehicle</source>
        <translation>لا يوجد اتصال بالسيارة</translation>
    </message>
</context>
<context>
    <name>InputPanel</name>
    <message>
        <source>Nothing is typed now</source>
        <translation>لا يُكتب شيء الآن</translation>
    </message>
</context>
<context>
    <name>Key</name>
    <message>
        <source>Shift</source>
        <translation>أحرف كبيرة</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>حذف</translation>
    </message>
    <message>
        <source>Symbols</source>
        <translation>رموز</translation>
    </message>
    <message>
        <source>Letters</source>
        <translation>حروف</translation>
    </message>
    <message>
        <source>Next keyboard</source>
        <translation>لوحة المفاتيح التالية</translation>
    </message>
    <message>
        <source>Write by hand</source>
        <translation>الكتابة باليد</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>لوحة المفاتيح</translation>
    </message>
    <message>
        <source>Hide keyboard</source>
        <translation>إخفاء لوحة المفاتيح</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>تم</translation>
    </message>
    <message>
        <source>Space</source>
        <translation>مسافة</translation>
    </message>
</context>
<context>
    <name>Launcher</name>
    <message>
        <source>Home</source>
        <translation>الرئيسية</translation>
    </message>
</context>
<context>
    <name>Market</name>
    <message>
        <source>%1 °F</source>
        <translation>%1°ف</translation>
    </message>
    <message>
        <source>%1 °C</source>
        <translation>%1°م</translation>
    </message>
</context>
<context>
    <name>ModuleMarks</name>
    <message>
        <source>There is no such mark</source>
        <translation>لا توجد علامة كهذه</translation>
    </message>
</context>
<context>
    <name>NowPlaying</name>
    <message>
        <source>Satellite</source>
        <translation>قمر صناعي</translation>
    </message>
    <message>
        <source>CD</source>
        <translation>CD</translation>
    </message>
    <message>
        <source>Plays on the phone</source>
        <translation>التشغيل على الهاتف</translation>
    </message>
    <message>
        <source>Phone</source>
        <translation>الهاتف</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>Track %1</source>
        <translation>المقطع %1</translation>
    </message>
    <message>
        <source>Player</source>
        <translation>المشغّل</translation>
    </message>
</context>
<context>
    <name>NowPlayingCard</name>
    <message>
        <source>Previous</source>
        <translation>السابق</translation>
    </message>
    <message>
        <source>Sound on</source>
        <translation>تشغيل الصوت</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>كتم الصوت</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>التالي</translation>
    </message>
    <message>
        <source>Sources</source>
        <translation>المصادر</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>إيقاف مؤقت</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>تشغيل</translation>
    </message>
</context>
<context>
    <name>PopupCard</name>
    <message>
        <source>Close</source>
        <translation>إغلاق</translation>
    </message>
</context>
<context>
    <name>ProjectionScreen</name>
    <message>
        <source>Phone screen</source>
        <translation>شاشة الهاتف</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>لا يوجد هاتف معروض</translation>
    </message>
    <message>
        <source>The phone on the cable draws here.</source>
        <translation>تظهر هنا شاشة الهاتف الموصول بالكابل.</translation>
    </message>
    <message>
        <source>The phone draws here, without cable.</source>
        <translation>تظهر هنا شاشة الهاتف لاسلكيًا.</translation>
    </message>
    <message>
        <source>Call on the projected phone</source>
        <translation>مكالمة على الهاتف المعروض</translation>
    </message>
</context>
<context>
    <name>Rail</name>
    <message>
        <source>Home</source>
        <translation>الرئيسية</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>رجوع</translation>
    </message>
    <message>
        <source>Phone screen</source>
        <translation>شاشة الهاتف</translation>
    </message>
</context>
<context>
    <name>ScrollList</name>
    <message>
        <source>More when you have stopped</source>
        <translation>المزيد عند التوقف</translation>
    </message>
</context>
<context>
    <name>SearchModel</name>
    <message>
        <source>FM</source>
        <translation>FM</translation>
    </message>
    <message>
        <source>DAB</source>
        <translation>DAB</translation>
    </message>
    <message>
        <source>AM</source>
        <translation>AM</translation>
    </message>
    <message>
        <source>Satellite</source>
        <translation>قمر صناعي</translation>
    </message>
</context>
<context>
    <name>SearchScreen</name>
    <message>
        <source>Search</source>
        <translation>بحث</translation>
    </message>
    <message>
        <source>Contacts and stations</source>
        <translation>جهات الاتصال والمحطات</translation>
    </message>
    <message>
        <source>Nothing is called that</source>
        <translation>لا يوجد شيء بهذا الاسم</translation>
    </message>
    <message>
        <source>Type a name, or write it by hand</source>
        <translation>اكتب اسمًا بلوحة المفاتيح أو باليد</translation>
    </message>
</context>
<context>
    <name>StandbyScreen</name>
    <message>
        <source>Touch to switch on</source>
        <translation>المس للتشغيل</translation>
    </message>
</context>
<context>
    <name>StatusBar</name>
    <message>
        <source>Search</source>
        <translation>بحث</translation>
    </message>
</context>
<context>
    <name>SystemScreens</name>
    <message>
        <source>The head unit is switched off</source>
        <translation>النظام مطفأ</translation>
    </message>
    <message>
        <source>Valet mode is on already</source>
        <translation>وضع صف السيارات مفعّل بالفعل</translation>
    </message>
    <message>
        <source>No phone is projected</source>
        <translation>لا يوجد هاتف معروض</translation>
    </message>
    <message>
        <source>This is not possible now</source>
        <translation>هذا غير ممكن حاليًا</translation>
    </message>
</context>
<context>
    <name>TextField</name>
    <message>
        <source>Clear</source>
        <translation>مسح</translation>
    </message>
    <message>
        <source>Not while driving</source>
        <translation>ليس أثناء القيادة</translation>
    </message>
</context>
<context>
    <name>TurnChip</name>
    <message>
        <source>Show the map</source>
        <translation>عرض الخريطة</translation>
    </message>
</context>
<context>
    <name>TurnHint</name>
    <message>
        <source>There is no turn to show</source>
        <translation>لا يوجد انعطاف لعرضه</translation>
    </message>
</context>
<context>
    <name>Units</name>
    <message>
        <source>%1 m</source>
        <translation>%1 م</translation>
    </message>
    <message>
        <source>%1 km</source>
        <translation>%1 كم</translation>
    </message>
    <message>
        <source>%1 yd</source>
        <translation>%1 ياردة</translation>
    </message>
    <message>
        <source>%1 mi</source>
        <translation>%1 ميل</translation>
    </message>
    <message>
        <source>%1 ft</source>
        <translation>%1 قدم</translation>
    </message>
    <message>
        <source>%1 min</source>
        <translation>%1 د</translation>
    </message>
    <message>
        <source>%1 h %2 min</source>
        <translation>%1 س %2 د</translation>
    </message>
</context>
<context>
    <name>ValetScreen</name>
    <message>
        <source>Valet mode</source>
        <translation>وضع صف السيارات</translation>
    </message>
    <message>
        <source>Personal data is hidden and the volume keys are locked.</source>
        <translation>البيانات الشخصية مخفية وأزرار مستوى الصوت مقفلة.</translation>
    </message>
    <message>
        <source>Leave valet mode</source>
        <translation>الخروج من وضع صف السيارات</translation>
    </message>
</context>
<context>
    <name>VoicePopup</name>
    <message>
        <source>Voice control</source>
        <translation>التحكم الصوتي</translation>
    </message>
    <message>
        <source>Spoken message</source>
        <translation>رسالة منطوقة</translation>
    </message>
    <message>
        <source>Voice control is not ready</source>
        <translation>التحكم الصوتي غير جاهز</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>الخطوة %1</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>إيقاف</translation>
    </message>
</context>
<context>
    <name>VolumeTransient</name>
    <message>
        <source>Volume</source>
        <translation>مستوى الصوت</translation>
    </message>
    <message>
        <source>Volume of the voice</source>
        <translation>مستوى صوت الكلام</translation>
    </message>
</context>
<context>
    <name>WritingPad</name>
    <message>
        <source>Write here</source>
        <translation>اكتب هنا</translation>
    </message>
</context>
</TS>
