// SPDX-License-Identifier: MIT
#include "simplemodels.h"

namespace HmiVehicle {

namespace {
constexpr int listeningTime = 8000;
constexpr int notReadyPromptTime = 3000;
} // namespace

SpeechModel::SpeechModel(Scheduler& scheduler)
    : Model("SpeechSource", scheduler)
{
    set("ttsSessionActive", false);
    set("voiceRecognitionEngineReady", true);
    endSession();
    on("cancelVRSession", [this] { endSession(); });
    on("cancelTTSSession", [this] { speak(QString(), 0); });
    on("voiceRecognitionNotReadyError",
       [this] { speak(QStringLiteral("Voice recognition is not ready yet"), notReadyPromptTime); });
}

void SpeechModel::pushToTalk()
{
    if (!value("voiceRecognitionEngineReady").toBool())
        return;
    scheduler().cancel(&m_session);
    set("sessionState", value("sessionState").toInt() + 1);
    set("promptText", QStringLiteral("Please say a command"));
    m_session = scheduler().every(listeningTime, [this] { endSession(); });
}

void SpeechModel::endSession()
{
    scheduler().cancel(&m_session);
    set("sessionState", 0);
    set("promptText", QString());
}

void SpeechModel::speak(const QString& text, int milliseconds)
{
    scheduler().cancel(&m_speaking);
    set("ttsSessionActive", !text.isEmpty());
    set("promptText", text);
    if (!text.isEmpty())
        m_speaking = scheduler().every(milliseconds, [this] { speak(QString(), 0); });
}

ProjectionModel::ProjectionModel(Scheduler& scheduler)
    : Model("ProjectionSource", scheduler)
{
    set("dioCallStatus", 0);
    setMode(0);
    for (const char* const call : {"projectionButtonPress", "projectionButtonRelease", "projectionButtonLongPress"})
        on(call, [] {}); // the projected phone's own business
}

void ProjectionModel::setMode(int mode)
{
    set("projectionMode", mode);
    set("projectedDeviceName", mode ? QStringLiteral("Dana's phone") : QString());
}

EaPhoneModel::EaPhoneModel(Scheduler& scheduler)
    : Model("EAPhoneSource", scheduler)
{
    set("eventsBlocked", false);
}

ValetModel::ValetModel(Scheduler& scheduler)
    : Model("ValetModeSource", scheduler)
{
    set("valetModeEnabled", false);
    on("setValetMode", [this](const QJsonArray& arguments) { set("valetModeEnabled", arguments.at(0).toBool()); });
}

DiagnosticsModel::DiagnosticsModel(Scheduler& scheduler)
    : Model("BezelDiagnosticsSource", scheduler)
{
    set("bezelDiagnosticsActive", false);
}

KeyModel::KeyModel(Scheduler& scheduler)
    : Model("KeySource", scheduler)
{
}

TouchModel::TouchModel(Scheduler& scheduler)
    : Model("TouchInput", scheduler)
{
    on("setPassThroughViewVisible", [this](const QJsonArray& arguments) { m_visible = arguments.at(0).toBool(); });
    on("setMobileNavTouchParamsOffset", [] {}); // there is no picture to move
}

} // namespace HmiVehicle
