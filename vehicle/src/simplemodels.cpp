// SPDX-License-Identifier: MIT
#include "simplemodels.h"

#include <iterator>
#include <utility>

namespace HmiVehicle {

namespace {
constexpr int listeningTime = 8000;
constexpr int notReadyPromptTime = 3000;
constexpr int spokenTime = 6000;
const char* const prompts[] = {"Please say a command", "Which name or number?", "Call %1? Say yes or no"};
constexpr int stepCount = int(std::size(prompts));
constexpr int maximumDecision = 4096; ///< UTF-16 units
} // namespace

SpeechModel::SpeechModel(Scheduler& scheduler, Understood understood)
    : Model("SpeechSource", scheduler)
    , m_understood(std::move(understood))
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
    showStep(value("sessionState").toInt() + 1);
}

void SpeechModel::showStep(int step)
{
    if (step > stepCount)
        return endSession();
    scheduler().cancel(&m_session);
    scheduler().cancel(&m_speaking);
    set("ttsSessionActive", false);
    set("sessionState", step);
    set("promptText", QString::fromUtf8(prompts[step - 1]).replace(QLatin1String("%1"), m_heard));
    m_session = scheduler().every(listeningTime, [this] { endSession(); });
}

void SpeechModel::hear(const QString& text)
{
    const int step = value("sessionState").toInt();
    if (step == 0)
        return;
    if (step < stepCount) {
        m_heard = text;
        return showStep(step + 1);
    }
    const QString wanted = m_heard;
    endSession();
    if (text.compare(QLatin1String("yes"), Qt::CaseInsensitive) == 0)
        m_understood(wanted);
}

bool SpeechModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field == QLatin1String("sessionState")) {
        const int step = wanted.toInt();
        if (step < 0)
            return false;
        if (step > 0 && step <= stepCount)
            showStep(step);
        else
            endSession();
        set("sessionState", step); // a step that this vehicle does not know is the HMI's to bear
    } else if (field == QLatin1String("ttsSessionActive")) {
        speak(wanted.toBool() ? QStringLiteral("The tyre pressure is low") : QString(), spokenTime);
    } else {
        return Model::assign(field, wanted);
    }
    return true;
}

void SpeechModel::endSession()
{
    scheduler().cancel(&m_session);
    m_heard.clear();
    set("sessionState", 0);
    set("promptText", QString());
}

void SpeechModel::speak(const QString& text, int milliseconds)
{
    scheduler().cancel(&m_speaking);
    set("ttsSessionActive", !text.isEmpty());
    if (value("sessionState").toInt() == 0)
        set("promptText", text);
    if (!text.isEmpty())
        m_speaking = scheduler().every(milliseconds, [this] { speak(QString(), 0); });
}

bool SpeechModel::isHeard() const
{
    return value("sessionState").toInt() || value("ttsSessionActive").toBool();
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

DeveloperModel::DeveloperModel(Scheduler& scheduler, std::function<void(const QString&)> decision,
                               std::function<void(int)> fence)
    : Model("DeveloperSource", scheduler)
{
    set("decisionsWanted", false);
    on("reportDecision", [decision = std::move(decision)](const QJsonArray& arguments) {
        decision(arguments.at(0).toString().left(maximumDecision));
    });
    on("fenceReached", [fence = std::move(fence)](const QJsonArray& arguments) { fence(arguments.at(0).toInt()); });
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
