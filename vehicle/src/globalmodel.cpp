// SPDX-License-Identifier: MIT
#include "globalmodel.h"

#include "phonemodel.h"
#include "simplemodels.h"

#include <utility>

namespace HmiVehicle {

namespace {

constexpr int fmSource = 1;
constexpr int nextSource = 12;
constexpr int maximumVolume = 40;
constexpr int rampTime = 120; ///< milliseconds a step while the volume key is held
constexpr int languageCount = 20;

} // namespace

GlobalModel::GlobalModel(Scheduler& scheduler, QTime startTime, std::map<int, AudioModel*> players, PhoneModel& phone,
                         SpeechModel& speech)
    : Model("GlobalSource", scheduler)
    , m_players(std::move(players))
    , m_phone(phone)
    , m_speech(speech)
    , m_startTime(startTime)
{
    set("mainAudioSource", fmSource);
    set("destinationCountry", 2);
    set("systemLanguage", 0);
    QJsonArray languages;
    for (int id = 0; id < languageCount; ++id)
        languages.append(id);
    set("supportedLanguages", languages);
    set("volume", 12);
    set("muted", false);
    set("powerOn", true);
    set("nightMode", false);
    set("outsideTemperature", 18.5);
    set("vehicleSpeed", 0);
    showClock();
    scheduler.every(1000, [this] { showClock(); });
    addKeyAnswers();
    addSettingAnswers();
}

void GlobalModel::addKeyAnswers()
{
    struct StepKey
    {
        const char* call;
        void (AudioModel::*answer)(Step);
        Step step;
    };
    const StepKey stepKeys[] = {{"sendShortSeekDown", &AudioModel::seek, Step::Down},
                                {"sendShortSeekUp", &AudioModel::seek, Step::Up},
                                {"sendLongSeekDown", &AudioModel::startWinding, Step::Down},
                                {"sendLongSeekUp", &AudioModel::startWinding, Step::Up},
                                {"sendPressedTuneDownKey", &AudioModel::tuneStep, Step::Down},
                                {"sendPressedTuneUpKey", &AudioModel::tuneStep, Step::Up},
                                {"sendLongPressedTuneDownKey", &AudioModel::startWinding, Step::Down},
                                {"sendLongPressedTuneUpKey", &AudioModel::startWinding, Step::Up}};
    for (const StepKey& key : stepKeys)
        on(key.call, [this, key] { (player()->*key.answer)(key.step); });
    for (const char* const call : {"sendLongReleasedSeekDown", "sendLongReleasedSeekUp", "sendLongReleasedTuneDownKey",
                                   "sendLongReleasedTuneUpKey"})
        on(call, [this] { player()->stopWinding(); });
    on("sendShortPresetKey",
       [this](const QJsonArray& arguments) { player()->recallPresetKey(arguments.at(0).toInt()); });
    on("sendLongPresetKey", [this](const QJsonArray& arguments) { player()->storePresetKey(arguments.at(0).toInt()); });
    on("sendShortReleasedVolumeUpKey", [this] { changeVolume(1); });
    on("sendShortReleasedVolumeDownKey", [this] { changeVolume(-1); });
    on("sendLongPressedVolumeUpKey", [this] { startRamp(1); });
    on("sendLongPressedVolumeDownKey", [this] { startRamp(-1); });
    on("sendLongReleasedVolumeUpKey", [this] { stopRamp(); });
    on("sendLongReleasedVolumeDownKey", [this] { stopRamp(); });
    on("sendShortReleasedMuteKey", [this] { set("muted", !value("muted").toBool()); });
    on("sendPowerOnOffKeyPressed", [this] { set("powerOn", !value("powerOn").toBool()); });
    on("sendShortEndKey", [this] { m_phone.hangUp(); });
    on("sendPressedVoicePTTKey", [this] { m_speech.pushToTalk(); });
    on("sendLongPressedVoicePTTKey", [this] { m_speech.pushToTalk(); });
    for (const char* const call : {"systemVolumeSync", "requestBeepSound", "captureSystemLogs"})
        on(call, [] {}); // heard or kept outside of what the HMI sees; the volume is always in step
}

void GlobalModel::addSettingAnswers()
{
    on("setAudioSource",
       [this](const QJsonArray& arguments) { setAudioSource(arguments.at(0).toInt(), arguments.at(1).toInt()); });
    on("setVolume",
       [this](const QJsonArray& arguments) { changeVolume(arguments.at(0).toInt() - value("volume").toInt()); });
    on("setMuted", [this](const QJsonArray& arguments) { set("muted", arguments.at(0).toBool()); });
    on("setSystemLanguage", [this](const QJsonArray& arguments) {
        if (value("supportedLanguages").toArray().contains(arguments.at(0)))
            set("systemLanguage", arguments.at(0));
    });
}

AudioModel* GlobalModel::player() const
{
    return m_players.at(value("mainAudioSource").toInt());
}

/// A source that cannot play, such as a CD player without a disc, is not selected.
void GlobalModel::setAudioSource(int wanted, int instance)
{
    const int source = wanted == nextSource ? sourceAfter(value("mainAudioSource").toInt()) : wanted;
    const auto next = m_players.find(source);
    if (next == m_players.end() || !next->second->canPlay())
        return;
    if (next->second != player()) {
        player()->stopWinding();
        player()->deactivate();
    }
    set("mainAudioSource", source);
    next->second->activate(instance);
}

int GlobalModel::sourceAfter(int source) const
{
    auto next = m_players.find(source);
    do {
        if (++next == m_players.end())
            next = m_players.begin();
    } while (!next->second->canPlay());
    return next->first;
}

void GlobalModel::changeVolume(int by)
{
    set("volume", qBound(0, value("volume").toInt() + by, maximumVolume));
    set("muted", false);
}

void GlobalModel::startRamp(int by)
{
    stopRamp();
    m_ramp = scheduler().every(rampTime, [this, by] { changeVolume(by); });
}

void GlobalModel::stopRamp()
{
    scheduler().cancel(&m_ramp);
}

void GlobalModel::releaseKeys()
{
    stopRamp();
    player()->stopWinding();
}

void GlobalModel::showClock()
{
    set("clockText",
        m_startTime.addMSecs(int(scheduler().now() % (24 * 3600 * 1000))).toString(QStringLiteral("HH:mm")));
}

} // namespace HmiVehicle
