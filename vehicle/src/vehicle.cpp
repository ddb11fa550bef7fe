// SPDX-License-Identifier: MIT
#include "HmiVehicle/vehicle.h"

#include "calltable.h"
#include "cdmodel.h"
#include "globalmodel.h"
#include "mediamodel.h"
#include "phonemodel.h"
#include "projectionmodel.h"
#include "simplemodels.h"
#include "tunermodels.h"

#include <QJsonDocument>

#include <utility>
#include <vector>

namespace HmiVehicle {

namespace {
constexpr int longestText = 1024;
constexpr int speakingTime = 6000; ///< milliseconds
} // namespace

struct Vehicle::Models
{
    Models(const Options& options, const Observer& observer)
        : scheduler(options.frozen)
        , am(amBand(), scheduler)
        , fm(scheduler)
        , xm(scheduler)
        , dab(scheduler)
        , cd(scheduler)
        , media(scheduler)
        , phone(scheduler)
        , eaPhone(scheduler)
        , speech(scheduler, [this](const QString& text) { phone.call(text); })
        , projection(scheduler)
        , valet(scheduler)
        , diagnostics(scheduler)
        , developer(
              scheduler,
              [&observer](const QString& text) {
                  if (observer.decisionReported)
                      observer.decisionReported(text);
              },
              [&observer](int number) {
                  if (observer.fenceReached)
                      observer.fenceReached(number);
              })
        , keys(scheduler)
        , touch(scheduler)
        , global(
              scheduler, options.startTime,
              {{0, &am}, {1, &fm}, {2, &xm}, {3, &dab}, {4, &cd}, {16, &media}, {34, &projection}, {35, &projection}},
              phone, speech)
    {
    }

    Scheduler scheduler;
    TunerModel am;
    FmTunerModel fm;
    XmTunerModel xm;
    DabTunerModel dab;
    CdModel cd;
    MediaModel media;
    PhoneModel phone;
    EaPhoneModel eaPhone;
    SpeechModel speech;
    ProjectionModel projection;
    ValetModel valet;
    DiagnosticsModel diagnostics;
    DeveloperModel developer;
    KeyModel keys;
    TouchModel touch;
    GlobalModel global;
    const std::vector<Model*> all{&global,  &am,     &fm,         &xm,    &dab,         &cd,        &media, &phone,
                                  &eaPhone, &speech, &projection, &valet, &diagnostics, &developer, &keys,  &touch};
};

Vehicle::Vehicle(const Options& options, Output output)
    : m_models(std::make_unique<Models>(options, m_observer))
    , m_output(std::move(output))
    , m_keys(std::make_unique<KeyInput>(
          m_models->scheduler, [this](int key, int state) { keyEvent(key, state); },
          [this](int combination, int state) { keyComboEvent(combination, state); }))
{
    m_models->global.set("destinationCountry", options.destinationCountry);
    m_models->global.set("systemLanguage", options.systemLanguage);
    for (Model* const model : m_models->all)
        model->takeChanges(); // a peer learns the beginning from its snapshot
}

Vehicle::~Vehicle() = default;

void Vehicle::setObserver(Observer observer)
{
    m_observer = std::move(observer);
}

QByteArray Vehicle::snapshot() const
{
    QByteArray lines;
    for (const Model* const model : m_models->all)
        if (!model->state().isEmpty())
            lines += stateLine(model->source(), model->state());
    return lines + snapshotEndLine();
}

QString Vehicle::receive(Channel channel, const QByteArray& line)
{
    QJsonParseError error;
    const QJsonObject object = QJsonDocument::fromJson(line, &error).object();
    const QString source = object.value(QLatin1String("source")).toString();
    const QString call = object.value(QLatin1String("call")).toString();
    const QJsonValue arguments = object.value(QLatin1String("args"));
    if (error.error != QJsonParseError::NoError || object.size() != 3 || !arguments.isArray() || call.isEmpty())
        return QStringLiteral("not a call");
    const bool isTouch = source == QLatin1String("TouchInput");
    if (channel == Channel::Priority || isTouch != (channel == Channel::Touch))
        return QStringLiteral("%1 has no calls on %2").arg(source.left(64), channelName(channel));
    const QString problem = CallTable::instance().check(source, call, arguments.toArray());
    if (!problem.isEmpty())
        return QStringLiteral("%1.%2: %3").arg(source.left(64), call.left(64), problem);
    find(source)->call(call, arguments.toArray());
    sendChanges();
    return QString();
}

void Vehicle::advance(int milliseconds)
{
    m_models->scheduler.advance(milliseconds);
    sendChanges();
}

void Vehicle::after(int milliseconds, std::function<void()> action)
{
    m_models->scheduler.after(milliseconds, std::move(action));
}

void Vehicle::peerLost()
{
    m_models->global.releaseKeys();
    sendChanges();
}

void Vehicle::keyEvent(int keyId, int keyState)
{
    sendKey(QStringLiteral("keyEvent"), keyId, keyState, m_observer.keySent);
}

void Vehicle::keyComboEvent(int keyComboId, int keyState)
{
    sendKey(QStringLiteral("keyComboEvent"), keyComboId, keyState, m_observer.combinationSent);
}

void Vehicle::sendKey(const QString& event, int id, int state, const std::function<void(int, int)>& seen)
{
    m_output(Channel::Priority, eventLine(m_models->keys.source(), event, {id, state}));
    if (seen)
        seen(id, state);
}

void Vehicle::sendFence(Channel channel, int number)
{
    const Model& model = channel == Channel::Priority ? static_cast<const Model&>(m_models->keys) : m_models->developer;
    if (channel != Channel::Touch)
        m_output(channel, eventLine(model.source(), QStringLiteral("fence"), {number}));
}

void Vehicle::touchBehindHmi()
{
    m_output(Channel::Touch, eventLine(m_models->touch.source(), QStringLiteral("passThroughViewTouched"), {}));
}

void Vehicle::ring(const QString& number)
{
    m_models->phone.ring(number);
    sendChanges();
}

void Vehicle::startTrafficAnnouncement(const QString& text, const QString& band)
{
    TunerModel* tuner = &m_models->fm;
    if (band == QLatin1String("AM"))
        tuner = &m_models->am;
    else if (band == QLatin1String("DAB"))
        tuner = &m_models->dab;
    tuner->startAnnouncement(text.left(longestText));
    sendChanges();
}

void Vehicle::setMediaRemote(MediaRemote* remote)
{
    m_models->media.setRemote(remote);
    sendChanges();
}

void Vehicle::showMedia(const MediaShown& shown)
{
    m_models->media.show(shown);
    sendChanges();
}

void Vehicle::setPhoneRemote(PhoneRemote* remote)
{
    m_models->phone.setRemote(remote);
    sendChanges();
}

void Vehicle::showCall(const CallShown& shown)
{
    m_models->phone.show(shown);
    sendChanges();
}

void Vehicle::answerFarEnd()
{
    m_models->phone.answerFarEnd();
    sendChanges();
}

void Vehicle::hangUpFarEnd()
{
    m_models->phone.hangUp();
    sendChanges();
}

void Vehicle::setPhoneConnected(bool connected)
{
    m_models->phone.setConnected(connected);
    sendChanges();
}

void Vehicle::ringProjectedPhone()
{
    m_models->projection.ring();
    sendChanges();
}

void Vehicle::hear(const QString& text)
{
    m_models->speech.hear(text.left(longestText));
    sendChanges();
}

void Vehicle::speak(const QString& text)
{
    m_models->speech.speak(text.left(longestText), speakingTime);
    sendChanges();
}

void Vehicle::setDigitalReception(bool received)
{
    received ? m_models->fm.acquireDigital() : m_models->fm.loseDigital();
    sendChanges();
}

void Vehicle::ejectDisc()
{
    m_models->cd.eject();
    sendChanges();
}

void Vehicle::insertDisc()
{
    m_models->cd.insert();
    sendChanges();
}

void Vehicle::setProjectionMode(int mode)
{
    m_models->projection.setMode(mode);
    sendChanges();
}

bool Vehicle::setState(const QString& source, const QString& field, const QJsonValue& value)
{
    Model* const model = find(source);
    if (!model || !CallTable::instance().checkState(source, field, value).isEmpty())
        return false;
    const bool done = model->assign(field, value);
    sendChanges();
    return done;
}

QJsonObject Vehicle::state(const QString& source) const
{
    const Model* const model = find(source);
    return model ? model->state() : QJsonObject();
}

bool Vehicle::answers(const QString& source, const QString& call) const
{
    const Model* const model = find(source);
    return model && model->answers(call);
}

Model* Vehicle::find(const QString& source) const
{
    for (Model* const model : m_models->all)
        if (model->source() == source)
            return model;
    return nullptr;
}

/// A call is more important than the source, and so is another tuner's announcement.
void Vehicle::settle()
{
    const int source = m_models->global.value("mainAudioSource").toInt();
    const auto interrupts = [source](const TunerModel& tuner, int number) {
        return source != number && tuner.announces();
    };
    m_models->global.leaveWhatCannotPlay();
    m_models->global.setInterrupted(m_models->phone.busy() || interrupts(m_models->am, 0) || interrupts(m_models->fm, 1)
                                    || interrupts(m_models->dab, 3));
}

void Vehicle::sendChanges()
{
    settle();
    for (Model* const model : m_models->all) {
        const QJsonObject changes = model->takeChanges();
        if (changes.isEmpty())
            continue;
        m_output(Channel::Messages, stateLine(model->source(), changes));
        if (m_observer.stateChanged)
            m_observer.stateChanged(model->source(), changes);
    }
}

} // namespace HmiVehicle
