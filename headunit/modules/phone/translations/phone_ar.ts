<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar">
<context>
    <name>AssistantHintPopup</name>
    <message>
        <source>The assistant is switched off</source>
        <translation>المساعد غير مفعّل</translation>
    </message>
    <message>
        <source>Switch it on in the settings of %1, then hold the voice key again.</source>
        <translation>فعّله من إعدادات %1، ثم اضغط مطوّلًا على زر الصوت مرة أخرى.</translation>
    </message>
    <message>
        <source>Switch it on in the settings of the phone, then hold the voice key again.</source>
        <translation>فعّله من إعدادات الهاتف، ثم اضغط مطوّلًا على زر الصوت مرة أخرى.</translation>
    </message>
</context>
<context>
    <name>AssistantPopup</name>
    <message>
        <source>The phone&apos;s assistant is listening</source>
        <translation>مساعد الهاتف يستمع</translation>
    </message>
    <message>
        <source>The phone&apos;s voice dialling is listening</source>
        <translation>الاتصال الصوتي في الهاتف يستمع</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>إيقاف</translation>
    </message>
</context>
<context>
    <name>CallScreen</name>
    <message>
        <source>Call</source>
        <translation>مكالمة</translation>
    </message>
    <message>
        <source>No call</source>
        <translation>لا توجد مكالمة</translation>
    </message>
    <message>
        <source>Dialling…</source>
        <translation>جارٍ الاتصال…</translation>
    </message>
    <message>
        <source>Back to the car</source>
        <translation>عبر السيارة</translation>
    </message>
    <message>
        <source>On the phone</source>
        <translation>عبر الهاتف</translation>
    </message>
    <message>
        <source>End call</source>
        <translation>إنهاء المكالمة</translation>
    </message>
    <message>
        <source>Heard on the phone, not in the car</source>
        <translation>الصوت من الهاتف، وليس من السيارة</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>متصل مجهول</translation>
    </message>
</context>
<context>
    <name>ContactsScreen</name>
    <message>
        <source>Phone</source>
        <translation>الهاتف</translation>
    </message>
    <message>
        <source>No phone connected</source>
        <translation>لا يوجد هاتف متصل</translation>
    </message>
    <message>
        <source>Battery %1 %</source>
        <translation>البطارية %1%</translation>
    </message>
    <message>
        <source>Keypad</source>
        <translation>لوحة الأرقام</translation>
    </message>
    <message>
        <source>No contacts</source>
        <translation>لا توجد جهات اتصال</translation>
    </message>
</context>
<context>
    <name>EmergencyNote</name>
    <message>
        <source>An emergency call is running. The phone cannot be used.</source>
        <translation>مكالمة طوارئ جارية. لا يمكن استخدام الهاتف.</translation>
    </message>
</context>
<context>
    <name>IncomingCallPopup</name>
    <message>
        <source>Incoming call</source>
        <translation>مكالمة واردة</translation>
    </message>
    <message>
        <source>Unknown caller</source>
        <translation>متصل مجهول</translation>
    </message>
    <message>
        <source>Accept</source>
        <translation>قبول</translation>
    </message>
    <message>
        <source>Reject</source>
        <translation>رفض</translation>
    </message>
</context>
<context>
    <name>KeypadScreen</name>
    <message>
        <source>Keypad</source>
        <translation>لوحة الأرقام</translation>
    </message>
    <message>
        <source>Enter a number</source>
        <translation>أدخل رقمًا</translation>
    </message>
    <message>
        <source>Call</source>
        <translation>اتصال</translation>
    </message>
    <message>
        <source>Delete the last digit</source>
        <translation>حذف الرقم الأخير</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Phone</source>
        <translation>الهاتف</translation>
    </message>
</context>
<context>
    <name>PhoneController</name>
    <message>
        <source>An emergency call is running</source>
        <translation>مكالمة طوارئ جارية</translation>
    </message>
    <message>
        <source>No phone is connected</source>
        <translation>لا يوجد هاتف متصل</translation>
    </message>
    <message>
        <source>A call is running</source>
        <translation>هناك مكالمة جارية</translation>
    </message>
    <message>
        <source>This is no telephone number</source>
        <translation>هذا ليس رقم هاتف</translation>
    </message>
    <message>
        <source>The assistant is switched on</source>
        <translation>المساعد مفعّل</translation>
    </message>
</context>
<context>
    <name>PhoneSettings</name>
    <message>
        <source>Phone</source>
        <translation>الهاتف</translation>
    </message>
</context>
<context>
    <name>PhoneSettingsScreen</name>
    <message>
        <source>Phone settings</source>
        <translation>إعدادات الهاتف</translation>
    </message>
    <message>
        <source>Connected phone</source>
        <translation>الهاتف المتصل</translation>
    </message>
    <message>
        <source>None</source>
        <translation>لا يوجد</translation>
    </message>
    <message>
        <source>Contacts</source>
        <translation>جهات الاتصال</translation>
    </message>
    <message>
        <source>Calls on the phone&apos;s own loudspeaker</source>
        <translation>المكالمات عبر مكبر صوت الهاتف</translation>
    </message>
</context>
</TS>
