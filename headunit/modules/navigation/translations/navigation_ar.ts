<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG">
<context>
    <name>DestinationsScreen</name>
    <message>
        <source>Destinations</source>
        <translation>الوجهات</translation>
    </message>
</context>
<context>
    <name>GuidancePanel</name>
    <message>
        <source>Arrival %1</source>
        <translation>الوصول %1</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>إيقاف مؤقت</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>عرض توضيحي</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>المسار</translation>
    </message>
    <message>
        <source>End</source>
        <translation>إنهاء</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>الانطلاق</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>السير إلى الأمام</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>الانحراف إلى اليسار</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>الانحراف إلى اليمين</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>الانعطاف إلى اليسار</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>الانعطاف إلى اليمين</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>الانعطاف الحاد إلى اليسار</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>الانعطاف الحاد إلى اليمين</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>الدوران إلى الخلف</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>تم الوصول</translation>
    </message>
</context>
<context>
    <name>MapScreen</name>
    <message>
        <source>Navigation</source>
        <translation>الملاحة</translation>
    </message>
    <message>
        <source>Back to the vehicle</source>
        <translation>الرجوع إلى السيارة</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>تكبير</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>تصغير</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Navigation</source>
        <translation>الملاحة</translation>
    </message>
</context>
<context>
    <name>NavigationSettings</name>
    <message>
        <source>Navigation</source>
        <translation>الملاحة</translation>
    </message>
</context>
<context>
    <name>NavigationSettingsScreen</name>
    <message>
        <source>Navigation settings</source>
        <translation>إعدادات الملاحة</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>تجنب الطرق السريعة</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>عرض الانعطافات في الشاشات الأخرى</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>هذا المكان غير موجود على الخريطة</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>لا توجد وجهة</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>كل الأماكن</translation>
    </message>
    <message>
        <source>Work</source>
        <translation>العمل</translation>
    </message>
    <message>
        <source>Fuel</source>
        <translation>الوقود</translation>
    </message>
    <message>
        <source>Charging</source>
        <translation>الشحن</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>مواقف</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>المطاعم</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>المعالم</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>الصحة</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>القطار والعبّارة</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>المنزل</translation>
    </message>
</context>
<context>
    <name>RouteScreen</name>
    <message>
        <source>Route</source>
        <translation>المسار</translation>
    </message>
    <message>
        <source>No destination</source>
        <translation>لا توجد وجهة</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>إلى أين؟</translation>
    </message>
</context>
</TS>
