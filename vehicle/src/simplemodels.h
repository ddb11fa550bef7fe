// SPDX-License-Identifier: MIT
#pragma once

#include "model.h"

namespace HmiVehicle {

class SpeechModel : public Model
{
public:
    explicit SpeechModel(Scheduler& scheduler);

    /// The push-to-talk key: starts a session, or goes on to its next step.
    void pushToTalk();
    void speak(const QString& text, int milliseconds);

private:
    void endSession();

    int m_session = 0;
    int m_speaking = 0;
};

class ProjectionModel : public Model
{
public:
    explicit ProjectionModel(Scheduler& scheduler);

    /// \a mode 0 ends the session.
    void setMode(int mode);
};

class EaPhoneModel : public Model
{
public:
    explicit EaPhoneModel(Scheduler& scheduler);
};

class ValetModel : public Model
{
public:
    explicit ValetModel(Scheduler& scheduler);
};

class DiagnosticsModel : public Model
{
public:
    explicit DiagnosticsModel(Scheduler& scheduler);
};

/// Hard keys have no state; their events are sent by the vehicle itself.
class KeyModel : public Model
{
public:
    explicit KeyModel(Scheduler& scheduler);
};

/// The layer behind the HMI; it only remembers what it was told.
class TouchModel : public Model
{
public:
    explicit TouchModel(Scheduler& scheduler);

    bool viewVisible() const { return m_visible; }

private:
    bool m_visible = false;
};

} // namespace HmiVehicle
