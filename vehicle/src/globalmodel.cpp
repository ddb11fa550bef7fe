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

/// What plays when the source has no model.
class Silence : public AudioModel
{
public:
    Silence()
        : AudioModel("", idle())
    {
    }

private:
    static Scheduler& idle()
    {
        static Scheduler scheduler(true);
        return scheduler;
    }
};

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
    set("voiceVolume", 16);
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
        on(key.call, [this, key] {
            const bool isTuneKnob = QLatin1String(key.call).contains(QLatin1String("Tune"));
            if (!isTuneKnob || !m_tuneKnobReserved)
                (player()->*key.answer)(key.step);
        });
    for (const char* const call : {"sendLongReleasedSeekDown", "sendLongReleasedSeekUp", "sendLongReleasedTuneDownKey",
                                   "sendLongReleasedTuneUpKey"})
        on(call, [this] { player()->stopWinding(); });
    on("sendShortPresetKey",
       [this](const QJsonArray& arguments) { player()->recallPresetKey(arguments.at(0).toInt()); });
    on("sendLongPresetKey", [this](const QJsonArray& arguments) { player()->storePresetKey(arguments.at(0).toInt()); });
    on("sendShortReleasedVolumeUpKey", [this] { pressVolume(1); });
    on("sendShortReleasedVolumeDownKey", [this] { pressVolume(-1); });
    on("sendLongPressedVolumeUpKey", [this] { startRamp(1); });
    on("sendLongPressedVolumeDownKey", [this] { startRamp(-1); });
    on("sendLongReleasedVolumeUpKey", [this] { stopRamp(); });
    on("sendLongReleasedVolumeDownKey", [this] { stopRamp(); });
    on("sendShortReleasedMuteKey", [this] { set("muted", !value("muted").toBool()); });
    on("sendPowerOnOffKeyPressed", [this] { setPower(!value("powerOn").toBool()); });
    on("sendShortEndKey", [this] { m_phone.hangUp(); });
    on("sendPressedVoicePTTKey", [this] { m_speech.pushToTalk(); });
    on("sendLongPressedVoicePTTKey", [this] {
        if (!m_phone.startVoiceService())
            m_speech.pushToTalk();
    });
    for (const char* const call : {"systemVolumeSync", "requestBeepSound", "captureSystemLogs"})
        on(call, [] {}); // heard or kept outside of what the HMI sees; the volume is always in step
}

void GlobalModel::addSettingAnswers()
{
    on("setAudioSource",
       [this](const QJsonArray& arguments) { setAudioSource(arguments.at(0).toInt(), arguments.at(1).toInt()); });
    on("setVolume", [this](const QJsonArray& arguments) {
        changeVolume(qBound(0, arguments.at(0).toInt(), maximumVolume) - value("volume").toInt());
    });
    on("setMuted", [this](const QJsonArray& arguments) { set("muted", arguments.at(0).toBool()); });
    on("reserveTuneKnob", [this](const QJsonArray& arguments) { m_tuneKnobReserved = arguments.at(0).toBool(); });
    on("setSystemLanguage", [this](const QJsonArray& arguments) {
        if (value("supportedLanguages").toArray().contains(arguments.at(0)))
            set("systemLanguage", arguments.at(0));
    });
}

AudioModel* GlobalModel::player() const
{
    static Silence silence;
    const auto found = m_players.find(value("mainAudioSource").toInt());
    return found == m_players.end() ? &silence : found->second;
}

/// A source that cannot play, such as a CD player without a disc, is not selected.
bool GlobalModel::setAudioSource(int wanted, int instance)
{
    const int source = wanted == nextSource ? sourceAfter(value("mainAudioSource").toInt()) : wanted;
    const auto next = m_players.find(source);
    if (next == m_players.end() || !next->second->canPlay(source))
        return false;
    if (next->second != player()) {
        player()->stopWinding();
        player()->deactivate();
    }
    if (source != value("mainAudioSource").toInt())
        m_previousSource = value("mainAudioSource").toInt();
    set("mainAudioSource", source);
    next->second->activate(instance);
    if (m_interrupted)
        next->second->interrupt();
    return true;
}

void GlobalModel::leaveWhatCannotPlay()
{
    const int source = value("mainAudioSource").toInt();
    const auto present = m_players.find(source);
    if (present != m_players.end() && !present->second->canPlay(source) && !setAudioSource(m_previousSource, -1))
        setAudioSource(fmSource, -1);
}

void GlobalModel::setInterrupted(bool interrupted)
{
    if (std::exchange(m_interrupted, interrupted) == interrupted)
        return;
    if (interrupted)
        player()->interrupt();
    else
        player()->goOn();
}

void GlobalModel::setPower(bool on)
{
    if (on == value("powerOn").toBool())
        return;
    set("powerOn", on);
    stopRamp();
    player()->stopWinding();
    if (on)
        player()->activate(-1);
    else
        player()->deactivate();
}

bool GlobalModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field == QLatin1String("mainAudioSource") && m_players.count(wanted.toInt()))
        return setAudioSource(wanted.toInt(), -1);
    if (field == QLatin1String("powerOn"))
        setPower(wanted.toBool());
    else
        return Model::assign(field, wanted);
    return true;
}

int GlobalModel::sourceAfter(int source) const
{
    auto next = m_players.upper_bound(source);
    for (size_t i = 0; i <= m_players.size(); ++i, ++next) {
        if (next == m_players.end())
            next = m_players.begin();
        if (next->second->canPlay(next->first))
            return next->first;
    }
    return source;
}

void GlobalModel::changeVolume(int by)
{
    set("volume", qBound(0, value("volume").toInt() + by, maximumVolume));
    set("muted", false);
}

void GlobalModel::pressVolume(int by)
{
    if (m_speech.isHeard())
        set("voiceVolume", qBound(0, value("voiceVolume").toInt() + by, maximumVolume));
    else
        changeVolume(by);
}

void GlobalModel::startRamp(int by)
{
    stopRamp();
    m_ramp = scheduler().every(rampTime, [this, by] { pressVolume(by); });
}

void GlobalModel::stopRamp()
{
    scheduler().cancel(&m_ramp);
}

void GlobalModel::releaseKeys()
{
    stopRamp();
    player()->stopWinding();
    m_tuneKnobReserved = false;
}

void GlobalModel::showClock()
{
    set("clockText",
        m_startTime.addMSecs(int(scheduler().now() % (24 * 3600 * 1000))).toString(QStringLiteral("HH:mm")));
}

} // namespace HmiVehicle
