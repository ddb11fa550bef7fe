// SPDX-License-Identifier: MIT
#pragma once

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
        bool frozen = false; ///< time stands still: answers come at once, nothing goes on by itself
    };

    /// Receives every line that leaves, with its end.
    using Output = std::function<void(Channel channel, const QByteArray& line)>;

    Vehicle(const Options& options, Output output);
    ~Vehicle();
    Vehicle(const Vehicle&) = delete;
    Vehicle& operator=(const Vehicle&) = delete;

    /// \brief The lines that tell a new peer everything, with the snapshot's end.
    QByteArray snapshot() const;

    /// \brief Takes one line of a peer, without its end. Empty, or why it is refused; then nothing happened.
    QString receive(Channel channel, const QByteArray& line);

    /// \brief Lets time pass.
    void advance(int milliseconds);

    /// \brief No HMI is there any more: what it held down is released.
    void peerLost();

    /// \name What happens in the vehicle by itself
    /// @{
    /// \brief A hard key or key combination changes its state; numbers as on the wire.
    void keyEvent(int keyId, int keyState);
    void keyComboEvent(int keyComboId, int keyState);
    void touchBehindHmi();
    void ring(const QString& number);
    void startTrafficAnnouncement(const QString& text);
    void ejectDisc();
    void insertDisc();
    void setProjectionMode(int mode);
    /// \brief Sets a field of a source as a switch of a control panel does. False for one that the vehicle does not have.
    bool setState(const QString& source, const QString& field, const QJsonValue& value);
    /// @}

    /// \brief The state of a source; empty for an unknown one.
    QJsonObject state(const QString& source) const;
    /// \brief Whether the vehicle does something on a call of the table, be it nothing on purpose.
    bool answers(const QString& source, const QString& call) const;

private:
    struct Models;

    Model* find(const QString& source) const;
    void sendChanges();

    std::unique_ptr<Models> m_models;
    Output m_output;
};

} // namespace HmiVehicle
