// SPDX-License-Identifier: MIT
#include "vehiclefixture.h"

/// Calls, projected phones and voice sessions.
class PhonesTest : public VehicleFixture
{
    Q_OBJECT

private Q_SLOTS:
    void projectedPhoneUnderstandsKeys()
    {
        const auto press = [this](int key) {
            call("ProjectionSource", "projectionButtonPress", {key});
            call("ProjectionSource", "projectionButtonRelease", {key});
            call("ProjectionSource", "projectionButtonLongPress", {key, false});
        };
        m_vehicle->setProjectionMode(1);
        call("GlobalSource", "setAudioSource", {34, -1});
        const QString first = textOf("ProjectionSource", "projectedTitle");
        press(89);
        const QString second = textOf("ProjectionSource", "projectedTitle");
        QVERIFY(first != second);
        press(88);
        QCOMPARE(textOf("ProjectionSource", "projectedTitle"), first);
        press(83);
        QCOMPARE(value("ProjectionSource", "projectedPlaying"), QJsonValue(false));
        call("ProjectionSource", "projectionButtonPress", {89});
        call("ProjectionSource", "projectionButtonLongPress", {89, true});
        call("ProjectionSource", "projectionButtonRelease", {89});
        QCOMPARE(textOf("ProjectionSource", "projectedTitle"), first); // held: something else
        m_vehicle->ringProjectedPhone();
        QCOMPARE(number("ProjectionSource", "dioCallStatus"), 1);
        press(79);
        QCOMPARE(number("ProjectionSource", "dioCallStatus"), 2);
        press(80);
        QCOMPARE(number("ProjectionSource", "dioCallStatus"), 0);
        press(2000000000);
    }

    void voiceSessionGoesOnToACall()
    {
        call("GlobalSource", "sendPressedVoicePTTKey");
        m_vehicle->hear(QStringLiteral("call"));
        QCOMPARE(number("SpeechSource", "sessionState"), 2);
        m_vehicle->hear(QStringLiteral("dana whitfield"));
        QCOMPARE(number("SpeechSource", "sessionState"), 3);
        QVERIFY(textOf("SpeechSource", "promptText").contains(QStringLiteral("dana whitfield")));
        m_vehicle->hear(QStringLiteral("yes"));
        QCOMPARE(number("SpeechSource", "sessionState"), 0);
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(true));
        QCOMPARE(textOf("PhoneSource", "callerNumber"), QStringLiteral("+1 555 0100"));
        m_vehicle->answerFarEnd();
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(true));
        m_vehicle->hangUpFarEnd();
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(false));
    }

    void heldPushToTalkReachesThePhonesVoiceService()
    {
        call("GlobalSource", "sendLongPressedVoicePTTKey");
        QCOMPARE(value("PhoneSource", "phoneVoiceServiceActive"), QJsonValue(true));
        m_vehicle->advance(8000);
        QCOMPARE(value("PhoneSource", "phoneVoiceServiceActive"), QJsonValue(false));
        m_vehicle->setPhoneConnected(false);
        call("GlobalSource", "sendLongPressedVoicePTTKey");
        QCOMPARE(number("SpeechSource", "sessionState"), 1);
    }

    void phonesAssistantListensForAWhile()
    {
        call("PhoneSource", "toggleSiriActivation", {true});
        QCOMPARE(value("PhoneSource", "siriActive"), QJsonValue(true));
        m_vehicle->advance(8000);
        QCOMPARE(value("PhoneSource", "siriActive"), QJsonValue(false));
        m_vehicle->setState(QStringLiteral("PhoneSource"), QStringLiteral("siriEnabled"), false);
        call("PhoneSource", "toggleSiriActivation", {true});
        QCOMPARE(value("PhoneSource", "siriActive"), QJsonValue(false));
    }

    void withoutAPhoneNothingRings()
    {
        m_vehicle->setPhoneConnected(false);
        m_vehicle->ring(QStringLiteral("+1 555 0100"));
        call("PhoneSource", "dial", {QStringLiteral("+1 555 0100")});
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(false));
    }

    void callIsTakenAndEnded()
    {
        m_vehicle->ring(QStringLiteral("+1 555 0100"));
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(true));
        QCOMPARE(textOf("PhoneSource", "callerName"), QStringLiteral("Dana Whitfield"));
        call("PhoneSource", "acceptCall");
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(true));
        m_vehicle->advance(3000);
        QCOMPARE(number("PhoneSource", "callDuration"), 3);
        call("GlobalSource", "sendShortEndKey");
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(false));
        QCOMPARE(textOf("PhoneSource", "callerNumber"), QString());
    }

    void callRingsInVain()
    {
        m_vehicle->ring(QStringLiteral("+1 555 9999"));
        QCOMPARE(textOf("PhoneSource", "callerName"), QString());
        m_vehicle->advance(30000);
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
    }

    void diallingTakesAMoment()
    {
        call("PhoneSource", "dial", {QStringLiteral("  ")});
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(false));
        call("PhoneSource", "dial", {QStringLiteral("+1 555 0101")});
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(true));
        m_vehicle->ring(QStringLiteral("+1 555 0100")); // busy
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
        m_vehicle->advance(4000);
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(true));
        call("PhoneSource", "hangUp");
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(false));
    }

    void pushToTalkStartsASessionThatEnds()
    {
        call("GlobalSource", "sendPressedVoicePTTKey");
        QCOMPARE(number("SpeechSource", "sessionState"), 1);
        call("SpeechSource", "cancelVRSession");
        QCOMPARE(number("SpeechSource", "sessionState"), 0);
        call("GlobalSource", "sendPressedVoicePTTKey");
        m_vehicle->advance(8000);
        QCOMPARE(number("SpeechSource", "sessionState"), 0);
    }
};

QTEST_GUILESS_MAIN(PhonesTest)
#include "tst_phones.moc"
