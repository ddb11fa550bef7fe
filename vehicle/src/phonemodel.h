// SPDX-License-Identifier: MIT
#pragma once

#include "model.h"

namespace HmiVehicle {

/// A connected phone with invented contacts. One call at a time.
class PhoneModel : public Model
{
public:
    explicit PhoneModel(Scheduler& scheduler);

    /// A call rings; it stops by itself. Nothing happens while there is a call already.
    void ring(const QString& number);
    void hangUp();
    bool busy() const;

private:
    void dial(const QString& number);
    void connectCall();
    void endCall();
    void showOtherEnd(const QString& number);

    int m_task = 0; ///< the call's next step: unanswered, answered or one second more
};

} // namespace HmiVehicle
