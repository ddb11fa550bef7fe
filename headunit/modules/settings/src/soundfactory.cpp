// SPDX-License-Identifier: MIT
#include "soundfactory.h"

#include <HmiCore/TargetState>
#include <HmiStateMachine/HmiLayeredState>

using HmiStateMachine::HmiState;

SoundFactory::SoundFactory(QObject* parent)
    : HmiSubmoduleFactory(parent)
{
}

QString SoundFactory::submoduleName() const
{
    return QStringLiteral("Sound");
}

QString SoundFactory::viewDescriptorFile() const
{
    return QStringLiteral(":/settings/soundviews.json");
}

void SoundFactory::create(const HmiCore::TargetState& target)
{
    target.state->setInitialState(new HmiState(target.viewName + QStringLiteral(".Main"), target.state));
}
