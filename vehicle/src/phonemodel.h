// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/remotes.h"
#include "model.h"

namespace HmiVehicle {

/// A connected phone with invented contacts; its calls are invented, or those of a real phone. One call at a time.
class PhoneModel : public Model
{
public:
    explicit PhoneModel(Scheduler& scheduler);

    /// A call rings; it stops by itself. Nothing happens while there is a call already.
    void ring(const QString& number);
    void hangUp();
    /// The other end answers the call that is being set up.
    void answerFarEnd();
    /// Calls a number of the phone book by its name, or the number itself.
    void call(const QString& nameOrNumber);
    /// Its voice dialling listens for a while. False without a phone.
    bool startVoiceService();
    /// A phone is there, or none.
    void setConnected(bool connected);
    bool assign(const QString& field, const QJsonValue& value) override;
    bool busy() const;

    /// Null for invented calls.
    void setRemote(PhoneRemote* remote);
    void show(const CallShown& shown);

private:
    void accept();
    void reject();
    void dial(const QString& number);
    void connectCall();
    void endCall();
    void showOtherEnd(const QString& number);

    void listen(const char* flag, int* timer, bool active);

    PhoneRemote* m_remote = nullptr;
    int m_assistant = 0;
    int m_voiceService = 0;
    int m_task = 0; ///< the call's next step: unanswered, answered or one second more
};

} // namespace HmiVehicle
