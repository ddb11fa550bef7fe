// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

#include <vector>

namespace HmiVehicle {

struct Station
{
    const char* frequency;
    const char* name; ///< UTF-8, as the texts
    const char* text;
    int signal;       ///< per cent
    bool traffic;     ///< has traffic announcements
    int programs = 0; ///< digital programmes besides the analogue one
};

struct Band
{
    const char* source;
    const char* unit;
    double minimum; ///< both 0 for a band without frequencies
    double maximum;
    double step;
    int decimals;
    int mode; ///< number of the tuner's mode and audio source
    std::vector<Station> stations;
};

const Band& amBand();
const Band& fmBand();
const Band& xmBand();
const Band& dabBand();

} // namespace HmiVehicle
