// SPDX-License-Identifier: MIT
#include "audiomodel.h"

namespace HmiVehicle {

// Most sources have no use for some of the keys.

void AudioModel::activate(int) {}
void AudioModel::deactivate() {}
void AudioModel::interrupt() {}
void AudioModel::goOn() {}
void AudioModel::seek(Step) {}
void AudioModel::startWinding(Step) {}
void AudioModel::stopWinding() {}
void AudioModel::tuneStep(Step) {}
void AudioModel::recallPresetKey(int) {}
void AudioModel::storePresetKey(int) {}

} // namespace HmiVehicle
