// SPDX-License-Identifier: MIT
#pragma once

#include "model.h"

namespace HmiVehicle {

class SpeechModel : public Model
{
public:
    /// Does what was understood in the end.
    using Understood = std::function<void(const QString& text)>;

    SpeechModel(Scheduler& scheduler, Understood understood);

    /// The push-to-talk key: starts a session, or goes on to its next step.
    void pushToTalk();
    /// Somebody says something: the session goes on to its next step, or ends. Nothing happens without one.
    void hear(const QString& text);
    void speak(const QString& text, int milliseconds);
    /// A voice session runs or a text is spoken.
    bool isHeard() const;

    bool assign(const QString& field, const QJsonValue& value) override;

private:
    void showStep(int step);
    void endSession();

    const Understood m_understood;
    QString m_heard;

    int m_session = 0;
    int m_speaking = 0;
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

/// What developers of the HMI are told.
class DeveloperModel : public Model
{
public:
    DeveloperModel(Scheduler& scheduler, std::function<void(const QString& text)> decision,
                   std::function<void(int number)> fence);
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
