// SPDX-License-Identifier: MIT
#pragma once

#include "tunermodel.h"

namespace HmiVehicle {

class FmTunerModel : public TunerModel
{
public:
    explicit FmTunerModel(Scheduler& scheduler);

protected:
    void tuned(const Station* station) override;
};

class DabTunerModel : public TunerModel
{
public:
    explicit DabTunerModel(Scheduler& scheduler);

protected:
    void tuned(const Station* station) override;
};

/// The satellite tuner: what it played can be replayed.
class XmTunerModel : public TunerModel
{
public:
    explicit XmTunerModel(Scheduler& scheduler);

protected:
    void tuned(const Station* station) override;

private:
    void showTitle(int titlesBack);
    void wind(int direction, bool start);

    int m_titlesBack = 0;
    int m_wind = 0;
};

} // namespace HmiVehicle
