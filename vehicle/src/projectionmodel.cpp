// SPDX-License-Identifier: MIT
#include "projectionmodel.h"

#include <iterator>
#include <utility>

namespace HmiVehicle {

namespace {

constexpr int wiredSource = 34;
constexpr int wirelessSource = 35;

struct Title
{
    const char* artist;
    const char* title;
};

// All of it is invented.
const Title titles[] = {{"Mira Vale", "Second Sun"},
                        {"Kite Engine", "Night Drive"},
                        {"Colline", "Marée haute"},
                        {"The Dusty Maps", "Two-Lane Summer"},
                        {"Anna Lindner", "Fünf Minuten noch"}};
constexpr int titleCount = int(std::size(titles));

} // namespace

ProjectionModel::ProjectionModel(Scheduler& scheduler)
    : AudioModel("ProjectionSource", scheduler)
{
    setMode(None);
    on("projectionButtonPress", [this] { m_isHeld = false; });
    on("projectionButtonRelease", [this](const QJsonArray& arguments) { released(arguments.at(0).toInt()); });
    on("projectionButtonLongPress", [this](const QJsonArray& arguments) { m_isHeld = arguments.at(1).toBool(); });
}

void ProjectionModel::setMode(int mode)
{
    set("projectionMode", mode);
    set("projectedDeviceName", mode ? QStringLiteral("Dana's phone") : QString());
    if (mode)
        return;
    setPlaying(false);
    set("dioCallStatus", NoCall);
    set("projectedTitle", QString());
    set("projectedArtist", QString());
}

bool ProjectionModel::canPlay(int source) const
{
    const int mode = value("projectionMode").toInt();
    return mode != None && source == (mode == Wireless ? wirelessSource : wiredSource);
}

void ProjectionModel::activate(int)
{
    showTitle(m_title);
    setPlaying(true);
}

void ProjectionModel::deactivate()
{
    setPlaying(false);
}

void ProjectionModel::interrupt()
{
    m_interrupted = value("projectedPlaying").toBool();
    if (m_interrupted)
        setPlaying(false);
}

void ProjectionModel::goOn()
{
    if (std::exchange(m_interrupted, false) && value("projectionMode").toInt() != None)
        setPlaying(true);
}

bool ProjectionModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field != QLatin1String("projectionMode"))
        return AudioModel::assign(field, wanted);
    setMode(wanted.toInt());
    return true;
}

void ProjectionModel::ring()
{
    if (value("projectionMode").toInt() != None && value("dioCallStatus").toInt() == NoCall)
        set("dioCallStatus", Ringing);
}

void ProjectionModel::released(int keyId)
{
    struct Key
    {
        int id;
        void (ProjectionModel::*act)();
    };
    const Key keys[] = {
        {6, &ProjectionModel::previous},  {88, &ProjectionModel::previous}, {77, &ProjectionModel::previous},
        {90, &ProjectionModel::previous}, {7, &ProjectionModel::next},      {89, &ProjectionModel::next},
        {78, &ProjectionModel::next},     {91, &ProjectionModel::next},     {83, &ProjectionModel::playPause},
        {12, &ProjectionModel::takeCall}, {49, &ProjectionModel::takeCall}, {79, &ProjectionModel::takeCall},
        {50, &ProjectionModel::endCall},  {80, &ProjectionModel::endCall}};
    if (std::exchange(m_isHeld, false))
        return;
    for (const Key& key : keys)
        if (key.id == keyId)
            (this->*key.act)();
}

void ProjectionModel::next()
{
    showTitle(m_title + 1);
}

void ProjectionModel::previous()
{
    showTitle(m_title - 1);
}

void ProjectionModel::playPause()
{
    setPlaying(!value("projectedPlaying").toBool());
}

void ProjectionModel::takeCall()
{
    if (value("dioCallStatus").toInt() == Ringing)
        set("dioCallStatus", Talking);
}

void ProjectionModel::endCall()
{
    set("dioCallStatus", NoCall);
}

void ProjectionModel::setPlaying(bool playing)
{
    set("projectedPlaying", playing);
}

void ProjectionModel::showTitle(int index)
{
    m_title = (index + titleCount) % titleCount;
    set("projectedTitle", QString::fromUtf8(titles[m_title].title));
    set("projectedArtist", QString::fromUtf8(titles[m_title].artist));
}

} // namespace HmiVehicle
