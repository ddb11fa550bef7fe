// SPDX-License-Identifier: MIT
#include "HmiVehicle/vehicle.h"

#include "calltable.h"
#include "cdmodel.h"
#include "globalmodel.h"
#include "mediamodel.h"
#include "phonemodel.h"
#include "simplemodels.h"
#include "tunermodels.h"

#include <QJsonDocument>

#include <utility>
#include <vector>

namespace HmiVehicle {

struct Vehicle::Models
{
    explicit Models(const Options& options)
        : scheduler(options.frozen)
        , am(amBand(), scheduler)
        , fm(scheduler)
        , xm(scheduler)
        , dab(scheduler)
        , cd(scheduler)
        , media(scheduler)
        , phone(scheduler)
        , eaPhone(scheduler)
        , speech(scheduler)
        , projection(scheduler)
        , valet(scheduler)
        , diagnostics(scheduler)
        , keys(scheduler)
        , touch(scheduler)
        , global(scheduler, options.startTime, {{0, &am}, {1, &fm}, {2, &xm}, {3, &dab}, {4, &cd}, {16, &media}}, phone,
                 speech)
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
    KeyModel keys;
    TouchModel touch;
    GlobalModel global;
    const std::vector<Model*> all{&global,  &am,     &fm,         &xm,    &dab,         &cd,   &media, &phone,
                                  &eaPhone, &speech, &projection, &valet, &diagnostics, &keys, &touch};
};

Vehicle::Vehicle(const Options& options, Output output)
    : m_models(std::make_unique<Models>(options))
    , m_output(std::move(output))
{
    for (Model* const model : m_models->all)
        model->takeChanges(); // a peer learns the beginning from its snapshot
}

Vehicle::~Vehicle() = default;

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

void Vehicle::peerLost()
{
    m_models->global.releaseKeys();
    sendChanges();
}

void Vehicle::keyEvent(int keyId, int keyState)
{
    m_output(Channel::Priority, eventLine(m_models->keys.source(), QStringLiteral("keyEvent"), {keyId, keyState}));
}

void Vehicle::keyComboEvent(int keyComboId, int keyState)
{
    m_output(Channel::Priority,
             eventLine(m_models->keys.source(), QStringLiteral("keyComboEvent"), {keyComboId, keyState}));
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

void Vehicle::startTrafficAnnouncement(const QString& text)
{
    m_models->fm.startAnnouncement(text);
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
    if (!model || !model->state().contains(field))
        return false;
    model->set(field.toLatin1().constData(), value);
    sendChanges();
    return true;
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

void Vehicle::sendChanges()
{
    for (Model* const model : m_models->all) {
        const QJsonObject changes = model->takeChanges();
        if (!changes.isEmpty())
            m_output(Channel::Messages, stateLine(model->source(), changes));
    }
}

} // namespace HmiVehicle
