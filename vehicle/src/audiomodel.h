// SPDX-License-Identifier: MIT
#pragma once

#include "model.h"

namespace HmiVehicle {

enum class Step { Down = -1, Up = 1 };

/// A source of sound: what the keys that the HMI passes on do while it plays.
class AudioModel : public Model
{
public:
    virtual bool canPlay(int) const { return true; } ///< as the source of that number
    virtual void activate(int instance);             ///< it becomes the main source; \a instance -1 for the last one
    virtual void deactivate();
    virtual void interrupt(); ///< something more important is heard for a while
    virtual void goOn();      ///< after that
    virtual void seek(Step step);
    virtual void startWinding(Step step); ///< the seek key is held
    virtual void stopWinding();
    virtual void tuneStep(Step step);
    virtual void recallPresetKey(int preset); ///< 1 to 6
    virtual void storePresetKey(int preset);

protected:
    using Model::Model;
};

} // namespace HmiVehicle
