<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG">
<context>
    <name>AirKeys</name>
    <message>
        <source>Windscreen</source>
        <translation>الزجاج الأمامي</translation>
    </message>
    <message>
        <source>Face</source>
        <translation>الوجه</translation>
    </message>
    <message>
        <source>Feet</source>
        <translation>القدمان</translation>
    </message>
</context>
<context>
    <name>Climate</name>
    <message>
        <source>This temperature cannot be set</source>
        <translation>لا يمكن ضبط هذه الدرجة</translation>
    </message>
</context>
<context>
    <name>ClimateNotice</name>
    <message>
        <source>Climate</source>
        <translation>المكيّف</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>درجة الحرارة</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>تدفئة المقعد</translation>
    </message>
    <message>
        <source>Fan</source>
        <translation>المروحة</translation>
    </message>
    <message>
        <source>Air direction</source>
        <translation>اتجاه الهواء</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>تلقائي</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>التبريد</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>تدوير الهواء</translation>
    </message>
    <message>
        <source>Windscreen</source>
        <translation>الزجاج الأمامي</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>الزجاج الخلفي</translation>
    </message>
    <message>
        <source>Both sides alike</source>
        <translation>توحيد الجانبين</translation>
    </message>
    <message>
        <source>On</source>
        <translation>تشغيل</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>إيقاف</translation>
    </message>
</context>
<context>
    <name>ClimateScreen</name>
    <message>
        <source>Climate</source>
        <translation>المكيّف</translation>
    </message>
    <message>
        <source>Driver</source>
        <translation>السائق</translation>
    </message>
    <message>
        <source>Passenger</source>
        <translation>الراكب</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>إيقاف</translation>
    </message>
    <message>
        <source>Defrosting</source>
        <translation>إزالة الضباب</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>تلقائي</translation>
    </message>
    <message>
        <source>By hand</source>
        <translation>يدوي</translation>
    </message>
    <message>
        <source>On</source>
        <translation>تشغيل</translation>
    </message>
    <message>
        <source>Cooling</source>
        <translation>التبريد</translation>
    </message>
    <message>
        <source>Recirculation</source>
        <translation>تدوير الهواء</translation>
    </message>
    <message>
        <source>Defrost</source>
        <translation>إزالة الضباب</translation>
    </message>
    <message>
        <source>Rear window</source>
        <translation>الزجاج الخلفي</translation>
    </message>
    <message>
        <source>Both sides</source>
        <translation>الجانبان</translation>
    </message>
</context>
<context>
    <name>ClimateZone</name>
    <message>
        <source>Warmer</source>
        <translation>أدفأ</translation>
    </message>
    <message>
        <source>Cooler</source>
        <translation>أبرد</translation>
    </message>
    <message>
        <source>Seat heating</source>
        <translation>تدفئة المقعد</translation>
    </message>
</context>
<context>
    <name>FanControl</name>
    <message>
        <source>Less air</source>
        <translation>هواء أقل</translation>
    </message>
    <message>
        <source>More air</source>
        <translation>هواء أكثر</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Climate</source>
        <translation>المكيّف</translation>
    </message>
</context>
</TS>
