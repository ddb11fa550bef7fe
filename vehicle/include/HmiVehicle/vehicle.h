// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/keyinput.h"
#include "HmiVehicle/remotes.h"
#include "HmiVehicle/wire.h"

#include <QByteArray>
#include <QJsonObject>
#include <QString>
#include <QTime>

#include <functional>
#include <memory>

namespace HmiVehicle {

class Model;

/// \brief A simulated vehicle: the state of all sources and their answers to the HMI's calls. One thread.
///
/// It has no sockets and no clock: lines go in and out through functions, and time passes when advance() says so. The same
/// calls at the same times give the same lines.
class Vehicle
{
public:
    struct Options
    {
        QTime startTime{10, 42};
        double speed = 1; ///< how fast a service lets time pass; 0 for by advance() only
        int destinationCountry = 2;
        int systemLanguage = 0; ///< number of the protocol
        bool frozen = false;    ///< time stands still: answers come at once, nothing goes on by itself
    };

    /// Receives every line that leaves, with its end.
    using Output = std::function<void(Channel channel, const QByteArray& line)>;

    /// Who looks on; any may be empty. Called in the vehicle's thread, after the lines left.
    struct Observer
    {
        std::function<void(const QString& source, const QJsonObject& changes)> stateChanged;
        std::function<void(int key, int state)> keySent;
        std::function<void(int combination, int state)> combinationSent;
        std::function<void(const QString& text)> decisionReported;
        std::function<void(int number)> fenceReached;
    };

    Vehicle(const Options& options, Output output);
    ~Vehicle();
    Vehicle(const Vehicle&) = delete;
    Vehicle& operator=(const Vehicle&) = delete;

    /// \brief Who looks on from now on.
    void setObserver(Observer observer);

    /// \brief The hard keys as fingers find them, with the timing of long presses.
    KeyInput& keys() { return *m_keys; }

    /// \brief The lines that tell a new peer everything, with the snapshot's end.
    QByteArray snapshot() const;

    /// \brief Takes one line of a peer, without its end. Empty, or why it is refused; then nothing happened.
    QString receive(Channel channel, const QByteArray& line);

    /// \brief Lets time pass.
    void advance(int milliseconds);

    /// \brief Calls \a action once, \a milliseconds of the vehicle's time from now, also when it is frozen.
    void after(int milliseconds, std::function<void()> action);

    /// \brief No HMI is there any more: what it held down is released.
    void peerLost();

    /// \name Real devices instead of the vehicle's own
    /// @{
    /// \brief A player does what the media source is asked for, until it is replaced or null is given; not owned.
    void setMediaRemote(MediaRemote* remote);
    /// \brief What that player plays; ignored without one. Texts are bounded here.
    void showMedia(const MediaShown& shown);
    /// \brief The same for a phone. A call that goes on ends when it is changed.
    void setPhoneRemote(PhoneRemote* remote);
    void showCall(const CallShown& shown);
    /// @}

    /// \name What happens in the vehicle by itself
    /// @{
    /// \brief A hard key or key combination changes its state; numbers as on the wire, whatever keys() knows.
    void keyEvent(int keyId, int keyState);
    void keyComboEvent(int keyComboId, int keyState);
    void touchBehindHmi();
    /// \brief Asks the HMIs to answer when they have handled all lines on \a channel (not Touch) before this one.
    void sendFence(Channel channel, int number);
    void ring(const QString& number);
    /// \brief On "AM", "FM" or "DAB". Nothing happens while that tuner's announcements are switched off.
    void startTrafficAnnouncement(const QString& text, const QString& band = QStringLiteral("FM"));
    /// \brief The other end of the phone picks up the call that is set up, or ends the one that there is.
    void answerFarEnd();
    void hangUpFarEnd();
    /// \brief A phone is connected, or the connected one is gone.
    void setPhoneConnected(bool connected);
    /// \brief The projected phone rings.
    void ringProjectedPhone();
    /// \brief Somebody speaks to the voice session.
    void hear(const QString& text);
    /// \brief A text is spoken.
    void speak(const QString& text);
    /// \brief The digital signal of the FM station fades, or comes back.
    void setDigitalReception(bool received);
    void ejectDisc();
    void insertDisc();
    void setProjectionMode(int mode);
    /// \brief Sets a field of a source as a switch of a control panel does. False, and nothing happens, for one that the
    /// vehicle does not have, and for a value that the protocol does not allow.
    bool setState(const QString& source, const QString& field, const QJsonValue& value);
    /// @}

    /// \brief The state of a source; empty for an unknown one.
    QJsonObject state(const QString& source) const;
    /// \brief Whether the vehicle does something on a call of the table, be it nothing on purpose.
    bool answers(const QString& source, const QString& call) const;

private:
    struct Models;

    Model* find(const QString& source) const;
    void settle();
    void sendChanges();
    void sendKey(const QString& event, int id, int state, const std::function<void(int, int)>& seen);

    std::unique_ptr<Models> m_models;
    Output m_output;
    Observer m_observer;
    std::unique_ptr<KeyInput> m_keys;
};

} // namespace HmiVehicle
